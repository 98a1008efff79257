#include "tools/NumberReader.h"

#include <fcntl.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <cstdint>
#include <cstring>

#include "tools/CommandLine.h"
#include "tovrin/foundation/TOVRINConvert.h"
#include "tovrin/foundation/TOVRINErrors.h"

namespace tovrin::cli {
namespace {

bool IsDigit(char c) { return c >= '0' && c <= '9'; }
bool IsSeparator(char c) {
  return c == ' ' || c == '\t' || c == '\r' || c == ',' || c == '\v' || c == '\f';
}

// 10^k for k = 0..27, each exact in Extended (5^27 < 2^64).
constexpr int kExactPowers = 27;
const std::array<Extended, kExactPowers + 1>& PowersOfTen() {
  static const std::array<Extended, kExactPowers + 1> powers = [] {
    std::array<Extended, kExactPowers + 1> p{};
    p[0] = 1;
    for (int k = 1; k <= kExactPowers; ++k) p[k] = p[k - 1] * 10;
    return p;
  }();
  return powers;
}

}  // namespace

std::optional<Extended> ParseNumber(std::string_view Token) {
  const char* p = Token.data();
  const char* const end = p + Token.size();
  bool negative = false;
  if (p != end && (*p == '+' || *p == '-')) negative = *p++ == '-';
  // Significant digits go into a 64-bit integer while they fit exactly (19 digits); the
  // decimal exponent counts the digits after the point.
  std::uint64_t mantissa = 0;
  int significant = 0;
  std::int64_t exponent = 0;
  std::size_t digits = 0;
  for (; p != end && IsDigit(*p); ++p, ++digits) {
    if (mantissa != 0 || *p != '0') {
      if (significant < 19)
        mantissa = mantissa * 10 + static_cast<unsigned>(*p - '0');
      else
        ++exponent;
      ++significant;
    }
  }
  if (p != end && *p == '.') {
    for (++p; p != end && IsDigit(*p); ++p, ++digits) {
      if (mantissa != 0 || *p != '0') {
        if (significant < 19) {
          mantissa = mantissa * 10 + static_cast<unsigned>(*p - '0');
          --exponent;
        }
        ++significant;
      } else {
        --exponent;
      }
    }
  }
  if (digits == 0) return std::nullopt;
  if (p != end && (*p == 'e' || *p == 'E')) {
    ++p;
    bool exponent_negative = false;
    if (p != end && (*p == '+' || *p == '-')) exponent_negative = *p++ == '-';
    if (p == end) return std::nullopt;
    std::int64_t written = 0;
    for (; p != end && IsDigit(*p); ++p) {
      if (written < 100000000) written = written * 10 + (*p - '0');
    }
    exponent += exponent_negative ? -written : written;
  }
  if (p != end) return std::nullopt;
  if (mantissa == 0) return negative ? -0.0L : 0.0L;
  if (significant <= 19 && exponent >= -kExactPowers && exponent <= kExactPowers) {
    // Both operands are exact, so one multiplication or division rounds correctly.
    const Extended m = static_cast<Extended>(mantissa);
    const Extended value = exponent >= 0 ? m * PowersOfTen()[static_cast<std::size_t>(exponent)]
                                         : m / PowersOfTen()[static_cast<std::size_t>(-exponent)];
    return negative ? -value : value;
  }
  try {
    return Str2Float(std::string(Token));
  } catch (const EConvertError&) {
    return std::nullopt;
  }
}

std::string SourceName(const std::string& Source) { return Source == "-" ? "<stdin>" : Source; }

std::string QuotedToken(std::string_view Token) {
  constexpr std::size_t kShown = 60;
  std::string text = "'";
  text.append(Token.substr(0, kShown));
  if (Token.size() > kShown) text += "...";
  return text + "'";
}

void ScanTokens(const std::string& Source,
                const std::function<void(std::string_view, std::size_t)>& OnToken,
                const std::function<void(std::size_t)>& OnLineEnd) {
  const bool from_stdin = Source == "-";
  const int fd = from_stdin ? STDIN_FILENO : ::open(Source.c_str(), O_RDONLY | O_CLOEXEC);
  if (fd < 0) {
    throw InputError(SourceName(Source) + ": cannot open: " + std::strerror(errno));
  }
  struct Closer {
    int fd;
    bool close_it;
    ~Closer() {
      if (close_it) ::close(fd);
    }
  } closer{fd, !from_stdin};

  constexpr std::size_t kBlock = 1 << 20;
  std::unique_ptr<char[]> buffer(new char[kBlock]);
  std::string carry;  // a token cut by the end of a block
  bool in_token = false, in_comment = false, line_has_token = false;
  std::size_t line = 1;
  for (;;) {
    const ssize_t got = ::read(fd, buffer.get(), kBlock);
    if (got < 0) {
      if (errno == EINTR) continue;
      throw InputError(SourceName(Source) + ": cannot read: " + std::strerror(errno));
    }
    const char* p = buffer.get();
    const char* const end = p + got;
    if (got == 0) break;
    while (p != end) {
      if (in_comment) {
        const void* newline = std::memchr(p, '\n', static_cast<std::size_t>(end - p));
        if (newline == nullptr) {
          p = end;
          break;
        }
        p = static_cast<const char*>(newline);
        in_comment = false;
      }
      if (in_token) {
        const char* start = p;
        while (p != end && !IsSeparator(*p) && *p != '\n' && *p != '#') ++p;
        carry.append(start, p);
        if (p == end) break;
        in_token = false;
        OnToken(carry, line);
        carry.clear();
        line_has_token = true;
        continue;
      }
      const char c = *p;
      if (c == '\n') {
        if (line_has_token) OnLineEnd(line);
        line_has_token = false;
        ++line;
        ++p;
      } else if (IsSeparator(c)) {
        ++p;
      } else if (c == '#') {
        in_comment = true;
        ++p;
      } else {
        const char* start = p;
        while (p != end && !IsSeparator(*p) && *p != '\n' && *p != '#') ++p;
        if (p == end) {
          carry.assign(start, p);
          in_token = true;
          break;
        }
        OnToken(std::string_view(start, static_cast<std::size_t>(p - start)), line);
        line_has_token = true;
      }
    }
  }
  if (in_token) {
    OnToken(carry, line);
    line_has_token = true;
  }
  if (line_has_token) OnLineEnd(line);
}

namespace {

[[noreturn]] void NotANumber(const std::string& Source, std::size_t Line, std::string_view Token) {
  throw InputError(SourceName(Source) + ":" + std::to_string(Line) +
                   ": not a number: " + QuotedToken(Token));
}

// Values gathered in fixed blocks, so that collecting n values never holds more than n plus
// one block, and the final vector is allocated once at its exact length.
class BlockList {
 public:
  void Add(Extended X) {
    if (used_ == kBlockValues || blocks_.empty()) {
      blocks_.emplace_back(new PackedExtended[kBlockValues]);
      used_ = 0;
    }
    blocks_.back()[used_++] = X;
  }
  std::size_t Size() const {
    return blocks_.empty() ? 0 : (blocks_.size() - 1) * kBlockValues + used_;
  }
  TQENFloatVector Release() {
    TQENFloatVector result(Size());
    std::size_t at = 0;
    for (std::size_t b = 0; b < blocks_.size(); ++b) {
      const std::size_t count = b + 1 == blocks_.size() ? used_ : kBlockValues;
      std::memcpy(static_cast<void*>(result.data() + at), blocks_[b].get(),
                  count * sizeof(PackedExtended));
      at += count;
      blocks_[b].reset();
    }
    blocks_.clear();
    used_ = 0;
    return result;
  }

 private:
  static constexpr std::size_t kBlockValues = 1 << 16;
  std::vector<std::unique_ptr<PackedExtended[]>> blocks_;
  std::size_t used_ = 0;
};

std::vector<std::string> SourcesOrStdin(const std::vector<std::string>& Sources) {
  return Sources.empty() ? std::vector<std::string>{"-"} : Sources;
}

}  // namespace

TQENFloatVector ReadNumbers(const std::vector<std::string>& Sources,
                            const std::function<bool(std::string_view)>& IsMissing,
                            std::size_t* Missing) {
  BlockList values;
  for (const std::string& source : SourcesOrStdin(Sources)) {
    ScanTokens(
        source,
        [&](std::string_view token, std::size_t line) {
          if (IsMissing && IsMissing(token)) {
            ++*Missing;
            return;
          }
          const std::optional<Extended> value = ParseNumber(token);
          if (!value) NotANumber(source, line, token);
          values.Add(*value);
        },
        [](std::size_t) {});
  }
  return values.Release();
}

void ReadPairs(const std::vector<std::string>& Sources, TQENFloatVector& X, TQENFloatVector& Y) {
  TQENFloatVector xs, ys;
  for (const std::string& source : SourcesOrStdin(Sources)) {
    int on_line = 0;
    ScanTokens(
        source,
        [&](std::string_view token, std::size_t line) {
          const std::optional<Extended> value = ParseNumber(token);
          if (!value) NotANumber(source, line, token);
          if (on_line == 2) {
            throw InputError(SourceName(source) + ":" + std::to_string(line) +
                             ": more than two numbers on a line: " + QuotedToken(token));
          }
          (on_line++ == 0 ? xs : ys).push_back(*value);
        },
        [&](std::size_t line) {
          if (on_line != 2) {
            throw InputError(SourceName(source) + ":" + std::to_string(line) +
                             ": a pair needs two numbers, x and y");
          }
          on_line = 0;
        });
  }
  X = std::move(xs);
  Y = std::move(ys);
}

}  // namespace tovrin::cli
