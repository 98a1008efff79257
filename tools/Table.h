// The table options shared by describe and regress: how fields are separated, the header
// line, the chosen fields, the texts of missing values, and the scan that puts them together.
#pragma once

#include <cstddef>
#include <functional>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "tools/CommandLine.h"
#include "tools/TableReader.h"
#include "tovrin/foundation/TOVRINGlobals.h"

namespace tovrin::cli {

// The options of the table mode, in the order their help shows them.
inline constexpr std::string_view kTableFlags[] = {"-W", "--whitespace", "-H", "--header"};
inline constexpr std::string_view kTableValues[] = {"-t", "--delimiter", "-f",  "--field",
                                                    "-g", "--group",     "--na"};

// Field texts that mean a missing value (--na LIST, default "NA,NaN,": the last one empty).
class MissingTexts {
 public:
  explicit MissingTexts(std::string_view List);
  bool Contains(std::string_view Text) const {
    for (const std::string& t : texts_) {
      if (t.size() == Text.size() && Text == t) return true;
    }
    return false;
  }

 private:
  std::vector<std::string> texts_;
};

// A field of the table: its position in a record (0-based) and its name in reports and
// messages (the header's name, or the 1-based number without a header).
struct TableField {
  std::size_t index = 0;
  std::string name;
  bool named = false;  // by the header
};

struct TableOptions {
  TableFormat format;
  bool header = false;
  std::string fields;                // the -f LIST as given, or the default
  bool fields_given = false;         // -f was given
  std::optional<std::string> group;  // the -g FIELD
};

// The table options of Args, or nothing when none is given (the plain stream of numbers).
// DefaultFields is the -f LIST when -f is absent. Raises UsageError naming the option.
std::optional<TableOptions> ReadTableOptions(const Arguments& Args, std::string_view DefaultFields);

// The text of a value field without the blanks around it.
std::string_view TrimBlanks(std::string_view Text);

// Reads a table. The first record of the first source (the header line with Options.header,
// otherwise the first data line) fixes the fields: Resolve(names, count) is called once with
// the header's names (empty without a header) and the number of fields, before any data
// record; it is called with no names and count 0 when the sources hold no record at all.
// Then OnRecord(reader) for every data record; with a header, the first line of every
// source is skipped.
void ScanTable(const std::vector<std::string>& Sources, const TableOptions& Options,
               const std::function<void(const std::vector<std::string>&, std::size_t)>& Resolve,
               const std::function<void(const RecordReader&)>& OnRecord);

// The fields named by LIST: 1-based numbers, ranges "a-b" and header names, separated by
// commas. Raises UsageError naming a field that does not exist (Count 0: any number exists).
// Header tells whether names were asked for (an empty input has none).
std::vector<TableField> ResolveFields(std::string_view List, std::string_view Option,
                                      const std::vector<std::string>& Names, std::size_t Count,
                                      bool Header);

// The field of a record, or InputError naming the file, the line and the field when the
// record is too short.
std::string_view FieldOf(const RecordReader& Reader, const TableField& Field);

// The value of a field's text, nothing for a missing value, or InputError naming the file,
// the line, the field and the text.
std::optional<Extended> FieldValue(const RecordReader& Reader, const TableField& Field,
                                   std::string_view Text, const MissingTexts& Missing);

}  // namespace tovrin::cli
