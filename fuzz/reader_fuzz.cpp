// The number and table readers of the tovrin program (the tovrin_cli_input library).
// ParseNumber either gives a finite value or nothing, and agrees with Str2Float on every token
// both accept (both round correctly); the scanner hands over tokens without separators, and
// ReadNumbers and ReadPairs return or raise InputError only. The record reader, over the same
// input as a CSV and as blank-separated fields, gives records on increasing lines, raises
// InputError only (a quote left open), and without quotes gives back each line's text.
#include <sys/mman.h>
#include <unistd.h>

#include <algorithm>
#include <cmath>
#include <cstdint>
#include <cstdlib>
#include <string>
#include <string_view>
#include <vector>

#include "tools/CommandLine.h"
#include "tools/NumberReader.h"
#include "tools/Table.h"
#include "tools/TableReader.h"
#include "tovrin/foundation/TOVRINConvert.h"
#include "tovrin/foundation/TOVRINErrors.h"

namespace {

using namespace tovrin;

[[noreturn]] void Fail() { std::abort(); }
void Expect(bool ok) {
  if (!ok) Fail();
}

bool HasBlank(std::string_view s) {
  for (const char c : s) {
    if (c == ' ' || c == '\t' || c == '\0') return true;
  }
  return false;
}

void CheckToken(std::string_view token) {
  const std::optional<Extended> parsed = cli::ParseNumber(token);
  if (parsed) Expect(std::isfinite(*parsed));
  if (HasBlank(token)) return;
  bool converted = false;
  Extended value = 0;
  try {
    value = Str2Float(std::string(token));
    converted = true;
  } catch (const EConvertError&) {
  }
  if (parsed && converted) Expect(*parsed == value);
}

// The input as a file: an anonymous in-memory one, named through /proc.
class MemoryFile {
 public:
  MemoryFile(const std::uint8_t* data, std::size_t size) {
    fd_ = static_cast<int>(::memfd_create("reader_fuzz", MFD_CLOEXEC));
    if (fd_ < 0) Fail();
    std::size_t done = 0;
    while (done < size) {
      const ssize_t n = ::write(fd_, data + done, size - done);
      if (n <= 0) Fail();
      done += static_cast<std::size_t>(n);
    }
    path_ = "/proc/self/fd/" + std::to_string(fd_);
  }
  ~MemoryFile() { ::close(fd_); }
  const std::string& Path() const { return path_; }

 private:
  int fd_ = -1;
  std::string path_;
};

// The non-blank lines of Text without a final '\r' (the records of a table without quotes).
std::vector<std::string_view> TableLines(std::string_view Text, bool Whitespace) {
  std::vector<std::string_view> lines;
  while (!Text.empty()) {
    const std::size_t end = std::min(Text.find('\n'), Text.size());
    std::string_view line = Text.substr(0, end);
    if (!line.empty() && line.back() == '\r') line.remove_suffix(1);
    const bool blank =
        Whitespace ? line.find_first_not_of(" \t") == std::string_view::npos : line.empty();
    if (!blank) lines.push_back(line);
    Text.remove_prefix(std::min(end + 1, Text.size()));
  }
  return lines;
}

void CheckTable(std::string_view Text, const std::string& Path, cli::TableFormat Format) {
  const bool quotes = !Format.whitespace && Text.find('"') != std::string_view::npos;
  const std::vector<std::string_view> lines = TableLines(Text, Format.whitespace);
  const cli::MissingTexts missing("NA,NaN,");
  std::size_t records = 0, last_line = 0;
  try {
    cli::RecordReader reader(Path, Format);
    while (reader.Next()) {
      Expect(reader.Line() > last_line && !reader.Fields().empty());
      last_line = reader.Line();
      std::string joined;
      for (std::size_t f = 0; f < reader.Fields().size(); ++f) {
        const std::string_view field = reader.Fields()[f];
        if (Format.whitespace) {
          Expect(!field.empty() && field.find_first_of(" \t\n") == std::string_view::npos);
        }
        if (f != 0) joined += Format.whitespace ? ' ' : Format.delimiter;
        joined.append(field);
        try {
          const cli::TableField where{0, "x", true};
          if (const auto value = cli::FieldValue(reader, where, field, missing)) {
            Expect(std::isfinite(*value));
          }
        } catch (const cli::InputError&) {
        }
      }
      if (!quotes) {
        Expect(records < lines.size());
        std::string expected(lines[records]);
        if (Format.whitespace) {
          // Runs of blanks become one space; blanks at the ends go.
          std::string squeezed;
          for (std::size_t i = 0; i < expected.size(); ++i) {
            const bool blank = expected[i] == ' ' || expected[i] == '\t';
            if (!blank) {
              if (!squeezed.empty() && (expected[i - 1] == ' ' || expected[i - 1] == '\t')) {
                squeezed += ' ';
              }
              squeezed += expected[i];
            }
          }
          expected = squeezed;
        }
        Expect(joined == expected);
      }
      ++records;
    }
    if (!quotes) Expect(records == lines.size());
  } catch (const cli::InputError&) {
    Expect(quotes);
  }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  const std::string_view text(reinterpret_cast<const char*>(data), size);
  CheckToken(text);

  const MemoryFile file(data, size);
  std::size_t tokens = 0, numbers = 0, last_line = 0;
  cli::ScanTokens(
      file.Path(),
      [&](std::string_view token, std::size_t line) {
        Expect(!token.empty() && line >= last_line);
        for (const char c : token) {
          Expect(c != ' ' && c != '\t' && c != '\r' && c != ',' && c != '\n' && c != '#');
        }
        last_line = line;
        ++tokens;
        CheckToken(token);
        if (cli::ParseNumber(token)) ++numbers;
      },
      [&](std::size_t line) { Expect(line == last_line); });

  try {
    const TQENFloatVector v = cli::ReadNumbers({file.Path()});
    Expect(v.size() == tokens && numbers == tokens);
  } catch (const cli::InputError&) {
    Expect(numbers < tokens);
  }
  try {
    TQENFloatVector x, y;
    cli::ReadPairs({file.Path()}, x, y);
    Expect(x.size() == y.size() && 2 * x.size() == tokens);
  } catch (const cli::InputError&) {
  }
  CheckTable(text, file.Path(), cli::TableFormat{false, ','});
  CheckTable(text, file.Path(), cli::TableFormat{true, ','});
  return 0;
}
