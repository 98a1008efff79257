// Driver of tovrin/foundation/TOVRINElementary_accuracy.py: reads lines "f s e [s e]" (f one of
// e, l, p; each argument s 2^e with an integer s of at most 64 bits) and prints, for each, the
// result of the library's kernel and of the C library's expl, logl or powl, each as "s e",
// "inf", "-inf" or "nan".
#include <cmath>
#include <cstdint>
#include <cstdio>
#include <iostream>
#include <string>

#include "tovrin/foundation/detail/Elementary.h"

namespace {

using tovrin::Extended;

Extended ReadValue(std::istream& in) {
  std::string s;
  long e = 0;
  in >> s >> e;
  const bool negative = !s.empty() && s[0] == '-';
  const std::uint64_t magnitude = std::stoull(negative ? s.substr(1) : s);
  const Extended v = std::ldexp(static_cast<Extended>(magnitude), static_cast<int>(e));
  return negative ? -v : v;
}

void Print(Extended v) {
  if (std::isnan(v)) {
    std::fputs(" nan", stdout);
  } else if (std::isinf(v)) {
    std::fputs(v > 0 ? " inf" : " -inf", stdout);
  } else if (v == 0) {
    std::fputs(std::signbit(v) ? " -0 0" : " 0 0", stdout);
  } else {
    int e = 0;
    const Extended m = std::frexp(std::fabs(v), &e);
    const auto s = static_cast<unsigned long long>(std::ldexp(m, 64));
    std::printf(" %s%llu %d", v < 0 ? "-" : "", s, e - 64);
  }
}

}  // namespace

int main() {
  std::ios::sync_with_stdio(false);
  char f = 0;
  while (std::cin >> f) {
    const Extended x = ReadValue(std::cin);
    Extended ours = 0, theirs = 0;
    if (f == 'e') {
      ours = tovrin::detail::Exp80(x);
      theirs = std::exp(x);
    } else if (f == 'l') {
      ours = tovrin::detail::Ln80(x);
      theirs = std::log(x);
    } else {
      const Extended y = ReadValue(std::cin);
      ours = tovrin::detail::Pow80(x, y);
      theirs = std::pow(x, y);
    }
    Print(ours);
    Print(theirs);
    std::fputc('\n', stdout);
  }
  return 0;
}
