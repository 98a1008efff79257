// The number reader of the tovrin program (the tovrin_cli_input library). ParseNumber either gives
// a finite value or nothing, and agrees with Str2Float on every token both accept (both round
// correctly); the scanner hands over tokens without separators, and ReadNumbers and ReadPairs
// return or raise InputError only.
#include <sys/mman.h>
#include <unistd.h>

#include <cmath>
#include <cstdint>
#include <cstdlib>
#include <string>
#include <string_view>
#include <vector>

#include "tools/CommandLine.h"
#include "tools/NumberReader.h"
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
  return 0;
}
