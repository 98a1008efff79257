#include "tools/CommandLine.h"

#include <algorithm>
#include <charconv>
#include <cmath>

#include "tools/NumberReader.h"

namespace tovrin::cli {

bool IsNegativeNumber(std::string_view Word) {
  return Word.size() >= 2 && Word[0] == '-' &&
         ((Word[1] >= '0' && Word[1] <= '9') || Word[1] == '.');
}

Arguments::Arguments(std::span<const std::string> Words,
                     std::span<const std::string_view> FlagOptions,
                     std::span<const std::string_view> ValueOptions) {
  for (std::size_t i = 0; i < Words.size(); ++i) {
    const std::string& word = Words[i];
    if (word.size() < 2 || word[0] != '-' || IsNegativeNumber(word)) {
      operands_.push_back(word);
      continue;
    }
    if (word == "--help" || word == "-h") {
      help_ = true;
      continue;
    }
    std::string name = word;
    std::optional<std::string> inline_value;
    if (const auto eq = word.find('='); eq != std::string::npos && word.starts_with("--")) {
      name = word.substr(0, eq);
      inline_value = word.substr(eq + 1);
    } else if (word[1] != '-' && word.size() > 2 &&
               std::find(ValueOptions.begin(), ValueOptions.end(), word.substr(0, 2)) !=
                   ValueOptions.end()) {
      name = word.substr(0, 2);  // "-t," is "-t ,"
      inline_value = word.substr(2);
    }
    if (std::find(FlagOptions.begin(), FlagOptions.end(), name) != FlagOptions.end()) {
      if (inline_value) throw UsageError("option " + name + " takes no value");
      options_.emplace_back(name, "");
    } else if (std::find(ValueOptions.begin(), ValueOptions.end(), name) != ValueOptions.end()) {
      if (inline_value) {
        options_.emplace_back(name, *inline_value);
      } else {
        if (i + 1 == Words.size()) throw UsageError("option " + name + " needs a value");
        options_.emplace_back(name, Words[++i]);
      }
    } else {
      throw UsageError("unknown option " + word);
    }
  }
}

bool Arguments::Has(std::string_view Option) const {
  return std::any_of(options_.begin(), options_.end(),
                     [&](const auto& o) { return o.first == Option; });
}

std::optional<std::string> Arguments::Value(std::string_view Option) const {
  std::optional<std::string> value;
  for (const auto& [name, text] : options_) {
    if (name == Option) value = text;
  }
  return value;
}

Extended ParseRealArgument(std::string_view Text, std::string_view What) {
  const std::optional<Extended> value = ParseNumber(Text);
  if (!value) {
    throw UsageError(std::string(What) + " must be a number, not '" + std::string(Text) + "'");
  }
  return *value;
}

std::uint64_t ParseUnsignedArgument(std::string_view Text, std::string_view What,
                                    std::uint64_t Max) {
  std::uint64_t value = 0;
  const char* first = Text.data();
  const char* last = first + Text.size();
  if (first != last && *first == '+') ++first;
  const auto [end, ec] = std::from_chars(first, last, value);
  if (first == last || ec != std::errc() || end != last || value > Max) {
    throw UsageError(std::string(What) + " must be a whole number from 0 to " +
                     std::to_string(Max) + ", not '" + std::string(Text) + "'");
  }
  return value;
}

std::int64_t ParseSignedArgument(std::string_view Text, std::string_view What, std::int64_t Min,
                                 std::int64_t Max) {
  std::int64_t value = 0;
  const char* first = Text.data();
  const char* last = first + Text.size();
  if (first != last && *first == '+') ++first;
  const auto [end, ec] = std::from_chars(first, last, value);
  if (first == last || ec != std::errc() || end != last || value < Min || value > Max) {
    throw UsageError(std::string(What) + " must be a whole number from " + std::to_string(Min) +
                     " to " + std::to_string(Max) + ", not '" + std::string(Text) + "'");
  }
  return value;
}

Byte ParseDecimals(const Arguments& Args) {
  const std::optional<std::string> text = Args.Value("--decimals");
  if (!text) return 4;
  return static_cast<Byte>(ParseUnsignedArgument(*text, "--decimals", 20));
}

std::string FormatSignificant(Extended X, int Digits) {
  if (std::isnan(X)) return "NAN";
  if (std::isinf(X)) return X > 0 ? "INF" : "-INF";
  char buffer[64];
  const auto [end, ec] =
      std::to_chars(buffer, buffer + sizeof buffer, X, std::chars_format::general, Digits);
  return std::string(buffer, ec == std::errc() ? end : buffer);
}

std::string FormatShortest(Extended X) {
  char buffer[64];
  const auto [end, ec] = std::to_chars(buffer, buffer + sizeof buffer, X);
  return std::string(buffer, ec == std::errc() ? end : buffer);
}

}  // namespace tovrin::cli
