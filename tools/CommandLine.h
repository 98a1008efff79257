// Shared pieces of the tovrin program: its failures, option parsing and number output.
#pragma once

#include <cstdint>
#include <optional>
#include <span>
#include <stdexcept>
#include <string>
#include <string_view>
#include <vector>

#include "tovrin/foundation/TOVRINGlobals.h"

namespace tovrin::cli {

// Exit statuses.
inline constexpr int kExitOk = 0;
inline constexpr int kExitFailure = 1;  // bad input data, or an error raised by the library
inline constexpr int kExitUsage = 2;    // unknown option, missing or malformed argument

// A command line that the program cannot act on (exit status 2).
class UsageError : public std::runtime_error {
 public:
  using std::runtime_error::runtime_error;
};

// Input that is not what the subcommand reads (exit status 1). The message names the file,
// the line and the token.
class InputError : public std::runtime_error {
 public:
  using std::runtime_error::runtime_error;
};

// The arguments of one subcommand, split into options and operands. Every word that starts
// with '-' and is not a number (and not "-" alone, which names standard input) is an option.
// Options that take a value take the next word, whatever it is, or the text after '=' of a
// long option ("--decimals=2") or after the letter of a short one ("-t,").
class Arguments {
 public:
  // ValueOptions are the options that take a value, FlagOptions those that do not. "--help"
  // is always known. Raises UsageError for any other option or a missing value.
  Arguments(std::span<const std::string> Words, std::span<const std::string_view> FlagOptions,
            std::span<const std::string_view> ValueOptions);

  bool Help() const { return help_; }
  bool Has(std::string_view Option) const;
  // The value of the last occurrence of Option.
  std::optional<std::string> Value(std::string_view Option) const;
  const std::vector<std::string>& Operands() const { return operands_; }

 private:
  bool help_ = false;
  std::vector<std::pair<std::string, std::string>> options_;
  std::vector<std::string> operands_;
};

// Whether Word looks like a number rather than an option ("-1.5", "-.5").
bool IsNegativeNumber(std::string_view Word);

// Parsers for command-line values; each raises UsageError naming What and the text.
Extended ParseRealArgument(std::string_view Text, std::string_view What);
std::uint64_t ParseUnsignedArgument(std::string_view Text, std::string_view What,
                                    std::uint64_t Max);
std::int64_t ParseSignedArgument(std::string_view Text, std::string_view What, std::int64_t Min,
                                 std::int64_t Max);
// The --decimals option: 0 to 20, 4 when absent.
Byte ParseDecimals(const Arguments& Args);

// Output of real results: 21 significant digits, or Digits (general notation, trailing zeros
// dropped), and the shortest text that reads back to the same Extended (for JSON).
std::string FormatSignificant(Extended X, int Digits = 21);
std::string FormatShortest(Extended X);

}  // namespace tovrin::cli
