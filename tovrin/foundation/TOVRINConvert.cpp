#include "tovrin/foundation/TOVRINConvert.h"

#include <locale.h>  // newlocale, strtold_l
#include <charconv>
#include <clocale>
#include <cmath>
#include <cstdlib>
#include <vector>

#include "tovrin/foundation/TOVRINErrors.h"

namespace tovrin {
namespace {

bool IsBlank(char c) { return c == ' ' || c == '\t'; }
bool IsDigit(char c) { return c >= '0' && c <= '9'; }

// Whether [first, last) is: sign? (digits ('.' digits*)? | '.' digits) (exponent)?
bool IsDecimalNumber(const char* first, const char* last) {
  const char* p = first;
  if (p != last && (*p == '+' || *p == '-')) ++p;
  std::size_t digits = 0;
  while (p != last && IsDigit(*p)) ++p, ++digits;
  if (p != last && *p == '.') {
    ++p;
    while (p != last && IsDigit(*p)) ++p, ++digits;
  }
  if (digits == 0) return false;
  if (p != last && (*p == 'e' || *p == 'E')) {
    ++p;
    if (p != last && (*p == '+' || *p == '-')) ++p;
    std::size_t exponent_digits = 0;
    while (p != last && IsDigit(*p)) ++p, ++exponent_digits;
    if (exponent_digits == 0) return false;
  }
  return p == last;
}

locale_t CLocale() {
  static const locale_t c_locale = newlocale(LC_ALL_MASK, "C", static_cast<locale_t>(nullptr));
  return c_locale;
}

}  // namespace

std::string Float2EStr(Extended X, Byte Decimals) {
  if (std::isnan(X)) return "NAN";
  if (std::isinf(X)) return X > 0 ? "INF" : "-INF";
  // The largest Extended has 4933 integral digits.
  std::vector<char> buffer(4940 + Decimals);
  auto [end, ec] = std::to_chars(buffer.data(), buffer.data() + buffer.size(), X,
                                 std::chars_format::fixed, static_cast<int>(Decimals));
  std::string text(buffer.data(), end);
  if (!text.empty() && text[0] == '-' && text.find_first_not_of("0.", 1) == std::string::npos) {
    text.erase(0, 1);
  }
  return text;
}

std::string Int2EStr(LongInt X) { return std::to_string(X); }
std::string Int2EStr(Int64 X) { return std::to_string(X); }

Extended Str2Float(const std::string& S) {
  const char* first = S.data();
  const char* last = S.data() + S.size();
  while (first != last && IsBlank(*first)) ++first;
  while (last != first && IsBlank(last[-1])) --last;
  if (!IsDecimalNumber(first, last)) {
    throw EConvertError("'" + S + "' is not a valid floating point value");
  }
  const std::string number(first, last);
  char* parse_end = nullptr;
  const Extended value = strtold_l(number.c_str(), &parse_end, CLocale());
  if (std::isinf(value)) {
    throw EConvertError("'" + S + "' is out of the range of a floating point value");
  }
  return value;
}

std::string StripTChStr(const std::string& S, char Ch) {
  const auto keep = S.find_last_not_of(Ch);
  return keep == std::string::npos ? std::string() : S.substr(0, keep + 1);
}

}  // namespace tovrin
