#include "tools/Table.h"

#include <charconv>

#include "tools/NumberReader.h"

namespace tovrin::cli {
namespace {

// A 1-based field number, or 0 when Text is not one.
std::size_t FieldNumber(std::string_view Text) {
  std::size_t n = 0;
  const auto [end, ec] = std::from_chars(Text.data(), Text.data() + Text.size(), n);
  if (Text.empty() || ec != std::errc() || end != Text.data() + Text.size()) return 0;
  return n;
}

std::string FieldTitle(const TableField& Field) {
  return Field.named ? "field '" + Field.name + "'" : "field " + Field.name;
}

}  // namespace

MissingTexts::MissingTexts(std::string_view List) {
  for (;;) {
    const std::size_t comma = List.find(',');
    texts_.emplace_back(List.substr(0, comma));
    if (comma == std::string_view::npos) break;
    List.remove_prefix(comma + 1);
  }
}

std::optional<TableOptions> ReadTableOptions(const Arguments& Args,
                                             std::string_view DefaultFields) {
  const bool whitespace = Args.Has("-W") || Args.Has("--whitespace");
  std::optional<std::string> delimiter = Args.Value("-t");
  if (const auto long_form = Args.Value("--delimiter")) delimiter = long_form;
  std::optional<std::string> fields = Args.Value("-f");
  if (const auto long_form = Args.Value("--field")) fields = long_form;
  std::optional<std::string> group = Args.Value("-g");
  if (const auto long_form = Args.Value("--group")) group = long_form;
  const bool header = Args.Has("-H") || Args.Has("--header");
  if (!whitespace && !delimiter && !fields && !group && !header) return std::nullopt;

  if (whitespace && delimiter)
    throw UsageError("-W/--whitespace and -t/--delimiter exclude each other");
  TableOptions options;
  options.format.whitespace = !delimiter;
  if (delimiter) options.format.delimiter = ParseDelimiter(*delimiter);
  options.header = header;
  options.fields = fields ? *fields : std::string(DefaultFields);
  options.fields_given = fields.has_value();
  if (options.fields.empty()) throw UsageError("-f/--field needs at least one field");
  options.group = group;
  if (group && group->empty()) throw UsageError("-g/--group needs a field");
  return options;
}

std::string_view TrimBlanks(std::string_view Text) {
  while (!Text.empty() && (Text.front() == ' ' || Text.front() == '\t')) Text.remove_prefix(1);
  while (!Text.empty() && (Text.back() == ' ' || Text.back() == '\t')) Text.remove_suffix(1);
  return Text;
}

void ScanTable(const std::vector<std::string>& Sources, const TableOptions& Options,
               const std::function<void(const std::vector<std::string>&, std::size_t)>& Resolve,
               const std::function<void(const RecordReader&)>& OnRecord) {
  const std::vector<std::string> sources =
      Sources.empty() ? std::vector<std::string>{"-"} : Sources;
  bool resolved = false;
  for (const std::string& source : sources) {
    RecordReader reader(source, Options.format);
    bool first_of_source = true;
    while (reader.Next()) {
      const bool is_header = Options.header && first_of_source;
      first_of_source = false;
      if (!resolved) {
        resolved = true;
        std::vector<std::string> names;
        if (is_header) names.assign(reader.Fields().begin(), reader.Fields().end());
        Resolve(names, reader.Fields().size());
      }
      if (!is_header) OnRecord(reader);
    }
  }
  if (!resolved) Resolve({}, 0);
}

std::vector<TableField> ResolveFields(std::string_view List, std::string_view Option,
                                      const std::vector<std::string>& Names, std::size_t Count,
                                      bool Header) {
  std::vector<TableField> fields;
  const auto add = [&](std::size_t Number, std::string_view Item) {
    if (Count != 0 && Number > Count) {
      throw UsageError(std::string(Option) + ": field " + std::string(Item) +
                       " does not exist (the table has " + std::to_string(Count) + " field" +
                       (Count == 1 ? "" : "s") + ")");
    }
    fields.push_back(
        {Number - 1, Names.empty() ? std::to_string(Number) : Names[Number - 1], !Names.empty()});
  };
  for (;;) {
    const std::size_t comma = List.find(',');
    const std::string_view item = List.substr(0, comma);
    bool found = false;
    for (std::size_t i = 0; i < Names.size() && !found; ++i) {
      if (Names[i] == item) {
        fields.push_back({i, Names[i], true});
        found = true;
      }
    }
    if (!found) {
      const std::size_t dash = item.find('-');
      const std::size_t first = FieldNumber(item.substr(0, dash));
      const std::size_t last =
          dash == std::string_view::npos ? first : FieldNumber(item.substr(dash + 1));
      if (first == 0 || last < first) {
        if (Names.empty() && FieldNumber(item) == 0 && dash == std::string_view::npos &&
            !item.empty()) {
          throw UsageError(std::string(Option) + ": no field named '" + std::string(item) +
                           (Header ? "' (the input has no header line)"
                                   : "' (fields are named by the header line, with -H/--header)"));
        }
        throw UsageError(std::string(Option) + ": no field '" + std::string(item) +
                         "' (give numbers from 1, ranges such as 2-4, or names of the header)");
      }
      for (std::size_t n = first; n <= last; ++n) {
        add(n, dash == std::string_view::npos ? item : std::string_view(std::to_string(n)));
      }
    }
    if (comma == std::string_view::npos) break;
    List.remove_prefix(comma + 1);
  }
  return fields;
}

std::string_view FieldOf(const RecordReader& Reader, const TableField& Field) {
  const std::vector<std::string_view>& fields = Reader.Fields();
  if (Field.index >= fields.size()) {
    throw InputError(Reader.Name() + ":" + std::to_string(Reader.Line()) + ": no field " +
                     std::to_string(Field.index + 1) +
                     (Field.named ? " ('" + Field.name + "')" : "") + ": the line has " +
                     std::to_string(fields.size()) + " field" + (fields.size() == 1 ? "" : "s"));
  }
  return fields[Field.index];
}

std::optional<Extended> FieldValue(const RecordReader& Reader, const TableField& Field,
                                   std::string_view Text, const MissingTexts& Missing) {
  const std::string_view value = TrimBlanks(Text);
  if (Missing.Contains(value)) return std::nullopt;
  if (const std::optional<Extended> number = ParseNumber(value)) return number;
  throw InputError(Reader.Name() + ":" + std::to_string(Reader.Line()) + ": " + FieldTitle(Field) +
                   ": not a number: " + QuotedToken(Text));
}

}  // namespace tovrin::cli
