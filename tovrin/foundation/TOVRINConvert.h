// Number-to-text and text-to-number conversions.
#pragma once

#include <string>

#include "tovrin/foundation/TOVRINGlobals.h"

namespace tovrin {

// Fixed notation with exactly Decimals digits after a '.', no '.' when Decimals is 0, a
// leading '-' for negatives and no thousands separators. Correctly rounded from the exact
// binary value, ties to even; never "-0" (a negative value that rounds to zero prints as
// zero). Infinities print as "INF" and "-INF", a NaN as "NAN".
std::string Float2EStr(Extended X, Byte Decimals);
// Plain decimal.
std::string Int2EStr(LongInt X);
std::string Int2EStr(Int64 X);
// Accepts optional surrounding blanks (spaces, tabs), an optional sign, digits with an
// optional '.' and an optional exponent: "1", "-2.5", ".5", "3.", "1e-3". The result is
// correctly rounded to Extended; a value too small for Extended becomes a subnormal or zero.
// Anything else, and a value too large for Extended, raises EConvertError naming the text.
Extended Str2Float(const std::string& S);
// S without its trailing run of Ch.
std::string StripTChStr(const std::string& S, char Ch);

}  // namespace tovrin
