// tovrin describe: the descriptive-statistics report of a column of numbers, of several
// columns of a table, or of a column per group of rows.
#include <array>
#include <functional>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

#include "tools/CommandLine.h"
#include "tools/NumberReader.h"
#include "tools/Subcommands.h"
#include "tools/Table.h"
#include "tovrin/statistics/TOVRINDescStats.h"

namespace tovrin::cli {
namespace {

constexpr std::string_view kHelp =
    "Usage: tovrin describe [OPTION...] [FILE...]\n"
    "\n"
    "Prints descriptive statistics of numbers: count, maximum, minimum, range, sum, sum of\n"
    "squares, mean, mode, median, variance, standard deviation, kurtosis, skew, quartiles,\n"
    "inter-quartile range and the fences for outliers, one line each (label, TAB, value).\n"
    "A statistic that cannot be computed (the mode when no value repeats most often, the\n"
    "variance of one value, ...) gets a line saying so. The FILEs are read in order, standard\n"
    "input when none is named or for '-'.\n"
    "\n"
    "Without table options, every number of the input is one sample: numbers are separated by\n"
    "white space, commas or line ends, and '#' starts a comment. With no numbers at all the\n"
    "report is the single line 'Vector is empty'.\n"
    "\n"
    "Tables (one record per line, several fields):\n"
    "  -t C, --delimiter C   fields are separated by the character C ('-t ,' for CSV, '-t tab'\n"
    "                        for TSV); a field may be quoted with \" and then hold C, line\n"
    "                        ends and doubled quotes\n"
    "  -W, --whitespace      fields are separated by runs of blanks (the default with -f)\n"
    "  -H, --header          the first line names the fields\n"
    "  -f LIST, --field LIST the fields to describe: numbers from 1, ranges and header names,\n"
    "                        separated by commas ('-f 2', '-f 2-4', '-f temp,rain'); default 1\n"
    "  -g F, --group F       one report per distinct value of field F, in order of appearance\n"
    "  --na LIST             field texts that mean a missing value, separated by commas\n"
    "                        (default 'NA,NaN,', the last one the empty field); they are\n"
    "                        skipped and counted in a 'Missing Values:' line\n"
    "Several fields or groups give one column each: the first line is 'Statistic' and their\n"
    "names (group:field for several fields by group), each following line a label and the\n"
    "values, NA where a statistic cannot be computed.\n"
    "\n"
    "Output:\n"
    "  --population   treat the numbers as a whole population (divisor n, not n - 1)\n"
    "  --decimals N   decimal places, 0 to 20 (default 4)\n"
    "  --json         JSON instead: an object of the statistics at full precision, null for\n"
    "                 those that cannot be computed; with -f or -g, an object of such objects\n"
    "                 by field name (or number) or by group (and then by field, for several)\n"
    "  --stats LIST   only the statistics named (NoOfValues, Missing, Maximum, Minimum, Range,\n"
    "                 Sum, SumSq, Mean, Mode, Median, Variance, StdDev, Kurtosis, Skew,\n"
    "                 Quartile1st, Quartile3rd, IQR, FenceLower, FenceUpper), as a table with\n"
    "                 a TAB between columns: a header line, then one line per field or group;\n"
    "                 full precision unless --decimals is given, NA where undefined\n"
    "  --help         show this help\n"
    "\n"
    "A field text that is neither a number nor a missing value stops the program with the\n"
    "file, line, field and text (exit status 1); a field that does not exist is a usage error\n"
    "(exit status 2).\n"
    "\n"
    "Examples:\n"
    "  tovrin describe data/michelson1879.txt\n"
    "  tovrin describe -t , -H -f temperature cities.csv\n"
    "  tovrin describe -t , -H -g city -f 2-3 --stats Mean,Median,StdDev cities.csv\n";

// The statistics after the count, in report order, with their JSON names.
struct Statistic {
  std::string_view name;
  TDescStatsStringId label;
  Extended (TQENDescStats::*get)() const;
};
constexpr std::array<Statistic, 17> kStatistics{{
    {"Maximum", rsDSMaximum, &TQENDescStats::Maximum},
    {"Minimum", rsDSMinimum, &TQENDescStats::Minimum},
    {"Range", rsDSRange, &TQENDescStats::Range},
    {"Sum", rsDSSum, &TQENDescStats::Sum},
    {"SumSq", rsDSSumSQ, &TQENDescStats::SumSq},
    {"Mean", rsDSMean, &TQENDescStats::Mean},
    {"Mode", rsDSMode, &TQENDescStats::Mode},
    {"Median", rsDSMedian, &TQENDescStats::Median},
    {"Variance", rsDSVariance, &TQENDescStats::Variance},
    {"StdDev", rsDSStdDev, &TQENDescStats::StdDev},
    {"Kurtosis", rsDSKurtosis, &TQENDescStats::Kurtosis},
    {"Skew", rsDSSkew, &TQENDescStats::Skew},
    {"Quartile1st", rsDSQtr1, &TQENDescStats::Quartile1st},
    {"Quartile3rd", rsDSQtr3, &TQENDescStats::Quartile3rd},
    {"IQR", rsDSIQR, &TQENDescStats::IQR},
    {"FenceLower", rsDSLowerFence, &TQENDescStats::FenceLower},
    {"FenceUpper", rsDSUpperFence, &TQENDescStats::FenceUpper},
}};
constexpr std::size_t kCount = kStatistics.size();        // pseudo-index of NoOfValues
constexpr std::size_t kMissing = kStatistics.size() + 1;  // pseudo-index of Missing
constexpr std::string_view kMissingLabel = "Missing Values:";

// One described column: its statistics as the component computed them.
struct Summary {
  std::string group;  // empty without -g
  std::string field;  // empty in the plain stream
  std::size_t count = 0;
  std::size_t missing = 0;
  std::array<Extended, kStatistics.size()> value{};
  std::array<bool, kStatistics.size()> defined{};
  std::vector<std::string> lines;  // the component's report, when it is printed as it stands
};

Summary Summarize(TQENFloatVector&& Values, bool Population, Byte Decimals, bool WantLines) {
  TQENDescStats stats;
  stats.BeginUpdate();
  stats.SetPopulation(Population);
  stats.SetDecimalPlaces(Decimals);
  stats.SetValues(std::move(Values));
  stats.EndUpdate();
  Summary summary;
  const std::size_t n = static_cast<std::size_t>(stats.NoOfValues());
  summary.count = n;
  // Undefined exactly where the report prints a sentence instead of a value.
  const bool spread = !FloatIsZero(stats.StdDev());
  for (std::size_t i = 0; i < kStatistics.size(); ++i) {
    const std::string_view name = kStatistics[i].name;
    bool defined = n > 0;
    if (name == "Mode") defined = defined && stats.ModeExists();
    if (name == "Variance" || name == "StdDev") defined = defined && (Population || n > 1);
    if (name == "Kurtosis") defined = n > 3 && spread;
    if (name == "Skew") defined = n > 2 && spread;
    summary.defined[i] = defined;
    summary.value[i] = (stats.*kStatistics[i].get)();
  }
  if (WantLines) summary.lines = stats.DescStats();
  return summary;
}

// The --stats LIST as pseudo-indices into kStatistics (kCount, kMissing for the counts).
std::vector<std::size_t> ParseStatsList(std::string_view List) {
  std::vector<std::size_t> chosen;
  for (;;) {
    const std::size_t comma = List.find(',');
    const std::string_view item = List.substr(0, comma);
    std::size_t index = kStatistics.size() + 2;
    if (item == "NoOfValues") index = kCount;
    if (item == "Missing") index = kMissing;
    for (std::size_t i = 0; i < kStatistics.size(); ++i) {
      if (kStatistics[i].name == item) index = i;
    }
    if (index == kStatistics.size() + 2) {
      std::string names = "NoOfValues, Missing";
      for (const Statistic& s : kStatistics) names += ", " + std::string(s.name);
      throw UsageError("--stats: unknown statistic '" + std::string(item) + "' (the names are " +
                       names + ")");
    }
    chosen.push_back(index);
    if (comma == std::string_view::npos) break;
    List.remove_prefix(comma + 1);
  }
  return chosen;
}

std::string JsonString(std::string_view Text) {
  std::string out = "\"";
  for (const char c : Text) {
    if (c == '"' || c == '\\') {
      out += '\\';
      out += c;
    } else if (static_cast<unsigned char>(c) < 0x20) {
      static constexpr char kHex[] = "0123456789abcdef";
      out += "\\u00";
      out += kHex[(c >> 4) & 0xf];
      out += kHex[c & 0xf];
    } else {
      out += c;
    }
  }
  return out + "\"";
}

struct OutputOptions {
  bool json = false;
  bool with_missing = false;  // the Missing count is part of the output
  std::optional<std::vector<std::size_t>> stats;
  std::optional<Byte> stats_decimals;  // --decimals given with --stats
  Byte decimals = 4;
};

// The value of one statistic as text: a count, or a number in JSON form (null when undefined)
// or as the --stats table writes it (NA when undefined).
std::string StatisticText(const Summary& S, std::size_t Index, const OutputOptions& Options) {
  if (Index == kCount) return std::to_string(S.count);
  if (Index == kMissing) return std::to_string(S.missing);
  const Extended x = S.value[Index];
  const bool finite = x == x && x - x == 0;
  if (!S.defined[Index] || !finite) return Options.json ? "null" : "NA";
  if (!Options.json && Options.stats_decimals) return Float2EStr(x, *Options.stats_decimals);
  return FormatShortest(x);
}

std::string_view StatisticName(std::size_t Index) {
  return Index == kCount ? "NoOfValues" : Index == kMissing ? "Missing" : kStatistics[Index].name;
}

std::vector<std::size_t> ChosenStatistics(const OutputOptions& Options) {
  if (Options.stats) return *Options.stats;
  std::vector<std::size_t> all{kCount};
  if (Options.with_missing) all.push_back(kMissing);
  for (std::size_t i = 0; i < kStatistics.size(); ++i) all.push_back(i);
  return all;
}

std::string JsonObject(const Summary& S, const OutputOptions& Options) {
  std::string text = "{";
  for (const std::size_t index : ChosenStatistics(Options)) {
    if (text.size() > 1) text += ", ";
    text += '"';
    text += StatisticName(index);
    text += "\": ";
    text += StatisticText(S, index, Options);
  }
  return text + "}";
}

// JSON of several summaries: by field, by group, or by group and then field.
std::string JsonReport(const std::vector<Summary>& All, bool Grouped, bool ByField,
                       const OutputOptions& Options) {
  if (!Grouped && !ByField) return JsonObject(All.front(), Options) + "\n";
  std::string text = "{";
  for (std::size_t i = 0; i < All.size(); ++i) {
    const Summary& s = All[i];
    const bool new_group = Grouped && (i == 0 || All[i - 1].group != s.group);
    if (Grouped && ByField) {
      if (new_group) {
        if (i != 0) text += "}, ";
        text += JsonString(s.group) + ": {";
      } else {
        text += ", ";
      }
      text += JsonString(s.field) + ": " + JsonObject(s, Options);
    } else {
      if (i != 0) text += ", ";
      text += JsonString(Grouped ? s.group : s.field) + ": " + JsonObject(s, Options);
    }
  }
  if (Grouped && ByField && !All.empty()) text += "}";
  return text + "}\n";
}

// The --stats table: the names of the group and of the field (none for the plain stream),
// then the chosen statistics.
std::string StatsTable(const std::vector<Summary>& All, bool Grouped, bool ByField,
                       const OutputOptions& Options) {
  const bool plain = All.size() == 1 && All.front().field.empty();
  const auto line = [&](std::string_view Group, std::string_view Field,
                        const std::function<std::string(std::size_t)>& Cell) {
    std::vector<std::string> cells;
    if (!plain && Grouped) cells.emplace_back(Group);
    if (!plain && (ByField || !Grouped)) cells.emplace_back(Field);
    for (const std::size_t index : *Options.stats) cells.push_back(Cell(index));
    std::string text;
    for (const std::string& cell : cells) text += (text.empty() ? "" : "\t") + cell;
    return text + "\n";
  };
  std::string text =
      line("group", "field", [](std::size_t index) { return std::string(StatisticName(index)); });
  for (const Summary& s : All) {
    text +=
        line(s.group, s.field, [&](std::size_t index) { return StatisticText(s, index, Options); });
  }
  return text;
}

// The component's own report, with the count of missing values after its first line.
std::string SingleReport(const Summary& S, const OutputOptions& Options) {
  std::string text;
  for (std::size_t i = 0; i < S.lines.size(); ++i) {
    text += S.lines[i];
    text += '\n';
    if (i == 0 && Options.with_missing && S.missing > 0) {
      text += std::string(kMissingLabel) + "\t" + std::to_string(S.missing) + "\n";
    }
  }
  return text;
}

// Several reports side by side: a column each, a line per statistic.
std::string SideBySide(const std::vector<Summary>& All, bool Grouped, bool ByField,
                       const OutputOptions& Options) {
  std::string text = "Statistic";
  for (const Summary& s : All) {
    text += '\t';
    text += Grouped && ByField ? s.group + ":" + s.field : Grouped ? s.group : s.field;
  }
  text += '\n';
  text += LoadResString(rsDSNoOfValues);
  for (const Summary& s : All) {
    text += '\t';
    text += Int2EStr(static_cast<Int64>(s.count));
  }
  text += '\n';
  bool any_missing = false;
  for (const Summary& s : All) any_missing = any_missing || s.missing > 0;
  if (Options.with_missing && any_missing) {
    text += kMissingLabel;
    for (const Summary& s : All) {
      text += '\t';
      text += std::to_string(s.missing);
    }
    text += '\n';
  }
  for (std::size_t i = 0; i < kStatistics.size(); ++i) {
    text += LoadResString(kStatistics[i].label);
    for (const Summary& s : All) {
      text += '\t';
      text += s.defined[i] ? Float2EStr(s.value[i], Options.decimals) : "NA";
    }
    text += '\n';
  }
  return text;
}

struct StringHash {
  using is_transparent = void;
  std::size_t operator()(std::string_view Text) const {
    return std::hash<std::string_view>{}(Text);
  }
};

// A column of values being gathered.
struct Column {
  TQENFloatVector values;
  std::size_t missing = 0;
};

// The summaries of a table's chosen fields: one per field, or one per group and field with
// the groups in order of first appearance. The table is read once; each column's values go to
// the component and are freed before the next column's are summarised.
struct TableSummaries {
  std::vector<Summary> summaries;
  bool grouped = false;
  bool by_field = false;       // several fields
  bool json_by_field = false;  // JSON names the fields: several, or chosen with -f
};

TableSummaries SummarizeTable(const Arguments& Args, const TableOptions& Table, bool Population,
                              Byte Decimals, bool WantLines) {
  const MissingTexts missing_texts(Args.Value("--na").value_or("NA,NaN,"));
  std::vector<TableField> fields;
  std::optional<TableField> group_field;
  std::vector<std::string> groups;
  std::unordered_map<std::string, std::size_t, StringHash, std::equal_to<>> group_index;
  std::vector<Column> columns;
  std::string_view last_key;
  std::size_t last_group = 0;
  bool have_last = false;
  ScanTable(
      Args.Operands(), Table,
      [&](const std::vector<std::string>& names, std::size_t count) {
        fields = ResolveFields(Table.fields, "-f/--field", names, count, Table.header);
        if (Table.group) {
          const std::vector<TableField> g =
              ResolveFields(*Table.group, "-g/--group", names, count, Table.header);
          if (g.size() != 1)
            throw UsageError("-g/--group takes one field, not '" + *Table.group + "'");
          group_field = g.front();
        } else {
          columns.resize(fields.size());
        }
      },
      [&](const RecordReader& reader) {
        std::size_t base = 0;
        if (group_field) {
          const std::string_view key = FieldOf(reader, *group_field);
          if (!have_last || key != last_key) {
            auto found = group_index.find(key);
            if (found == group_index.end()) {
              found = group_index.emplace(std::string(key), groups.size()).first;
              groups.emplace_back(key);
              columns.resize(columns.size() + fields.size());
            }
            last_key = found->first;
            last_group = found->second;
            have_last = true;
          }
          base = last_group * fields.size();
        }
        for (std::size_t f = 0; f < fields.size(); ++f) {
          const std::optional<Extended> value =
              FieldValue(reader, fields[f], FieldOf(reader, fields[f]), missing_texts);
          Column& column = columns[base + f];
          if (value) {
            column.values.push_back(*value);
          } else {
            ++column.missing;
          }
        }
      });
  TableSummaries result;
  result.grouped = group_field.has_value();
  result.by_field = fields.size() > 1;
  result.json_by_field = result.by_field || (!result.grouped && Table.fields_given);
  for (std::size_t c = 0; c < columns.size(); ++c) {
    Summary s = Summarize(std::move(columns[c].values), Population, Decimals,
                          WantLines && !result.grouped && fields.size() == 1);
    TQENFloatVector().swap(columns[c].values);
    s.missing = columns[c].missing;
    s.field = fields[c % fields.size()].name;
    if (result.grouped) s.group = groups[c / fields.size()];
    result.summaries.push_back(std::move(s));
  }
  return result;
}

}  // namespace

int RunDescribe(std::span<const std::string> Words) {
  std::vector<std::string_view> flags{"--population", "--json"};
  std::vector<std::string_view> values{"--decimals", "--stats"};
  flags.insert(flags.end(), std::begin(kTableFlags), std::end(kTableFlags));
  values.insert(values.end(), std::begin(kTableValues), std::end(kTableValues));
  const Arguments args(Words, flags, values);
  if (args.Help()) {
    WriteOut(std::string(kHelp));
    return kExitOk;
  }
  OutputOptions output;
  output.decimals = ParseDecimals(args);
  output.json = args.Has("--json");
  if (const auto list = args.Value("--stats")) {
    output.stats = ParseStatsList(*list);
    if (args.Value("--decimals")) output.stats_decimals = output.decimals;
  }
  const bool population = args.Has("--population");
  const std::optional<TableOptions> table = ReadTableOptions(args, "1");
  const bool want_lines = !output.json && !output.stats;

  std::vector<Summary> summaries;
  // JSON maps names to objects whenever fields are chosen (even one), text only for several.
  bool grouped = false, by_field = false, json_by_field = false;
  if (!table) {
    // The plain stream of numbers: one sample.
    const std::optional<std::string> na_list = args.Value("--na");
    const MissingTexts missing_texts(na_list.value_or(""));
    std::size_t missing = 0;
    TQENFloatVector numbers =
        na_list
            ? ReadNumbers(
                  args.Operands(),
                  [&](std::string_view token) { return missing_texts.Contains(token); }, &missing)
            : ReadNumbers(args.Operands());
    output.with_missing = na_list.has_value();
    summaries.push_back(Summarize(std::move(numbers), population, output.decimals, want_lines));
    summaries.back().missing = missing;
  } else {
    output.with_missing = true;
    TableSummaries result = SummarizeTable(args, *table, population, output.decimals, want_lines);
    summaries = std::move(result.summaries);
    grouped = result.grouped;
    by_field = result.by_field;
    json_by_field = result.json_by_field;
  }

  std::string text;
  if (output.json) {
    text = JsonReport(summaries, grouped, json_by_field, output);
  } else if (output.stats) {
    text = StatsTable(summaries, grouped, by_field, output);
  } else if (!grouped && summaries.size() == 1) {
    text = SingleReport(summaries.front(), output);
  } else {
    text = SideBySide(summaries, grouped, by_field, output);
  }
  WriteOut(text);
  return kExitOk;
}

}  // namespace tovrin::cli
