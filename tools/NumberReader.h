// Reading numbers from files and standard input.
//
// Numbers are separated by white space, commas or line ends; everything from '#' to the end
// of a line is ignored. A number is an optional sign, digits with an optional '.', and an
// optional exponent ("1", "-2.5", ".5", "3.", "1e-3"), correctly rounded to Extended without
// any locale. Anything else raises InputError naming the file, the line and the token.
#pragma once

#include <cstddef>
#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "tovrin/foundation/TOVRINGlobals.h"

namespace tovrin::cli {

// The value of a token, or nothing when the token is not a number (or lies beyond the range
// of Extended).
std::optional<Extended> ParseNumber(std::string_view Token);

// Calls OnToken(token, line) for every token of the named source ("-" is standard input) in
// order, and OnLineEnd(line) at the end of every line that held at least one token. Raises
// InputError when the file cannot be read.
void ScanTokens(const std::string& Source,
                const std::function<void(std::string_view, std::size_t)>& OnToken,
                const std::function<void(std::size_t)>& OnLineEnd);

// The name of a source in messages: "<stdin>" for "-".
std::string SourceName(const std::string& Source);

// A token in messages: in single quotes, cut after 60 characters.
std::string QuotedToken(std::string_view Token);

// Every number of the sources, in order (standard input when Sources is empty), into one
// vector of exactly the right length. The numbers are gathered in blocks first, so the
// vector never grows by copying. When IsMissing is given, the tokens it accepts are skipped
// and counted in Missing.
TQENFloatVector ReadNumbers(const std::vector<std::string>& Sources,
                            const std::function<bool(std::string_view)>& IsMissing = nullptr,
                            std::size_t* Missing = nullptr);

// Pairs "x y", two numbers per line, from the sources (standard input when none).
void ReadPairs(const std::vector<std::string>& Sources, TQENFloatVector& X, TQENFloatVector& Y);

}  // namespace tovrin::cli
