// Tests of the 80-bit kernels Exp80, Ln80 and Pow80: a table of values computed with mpmath
// (TOVRINElementary_reference.py: random arguments over the whole range, the ends, x near 1,
// exact powers, e^(hi + lo) of a split -z^2/2), each result within one unit in the last place
// and nearly all correctly rounded, and the special values of the C library's expl, logl, powl.
#include <gtest/gtest.h>

#include <cmath>
#include <cstdio>
#include <iterator>
#include <limits>

#include "tovrin/foundation/detail/Elementary.h"

namespace tovrin::detail {
namespace {

constexpr Extended Inf = std::numeric_limits<Extended>::infinity();
constexpr Extended NaN = std::numeric_limits<Extended>::quiet_NaN();

enum class Fn { Exp, ExpSplit, Ln, Pow };
struct ElementaryCase {
  Fn fn;
  Extended x, y, expected;
};
#include "tovrin/foundation/TOVRINElementary_reference.inc"

Extended Evaluate(const ElementaryCase& c) {
  switch (c.fn) {
    case Fn::Exp:
      return Exp80(c.x);
    case Fn::ExpSplit:
      return Exp80(c.x, c.y);
    case Fn::Ln:
      return Ln80(c.x);
    case Fn::Pow:
      break;
  }
  return Pow80(c.x, c.y);
}

TEST(Elementary, WithinOneUlpOfMpmathAndAlmostAlwaysCorrectlyRounded) {
  int exact = 0;
  for (const ElementaryCase& c : kElementaryCases) {
    const Extended got = Evaluate(c);
    if (got == c.expected) {
      ++exact;
      continue;
    }
    // The neighbours of the correctly rounded value are the only others within one ulp.
    const bool neighbour =
        got == std::nextafter(c.expected, Inf) || got == std::nextafter(c.expected, -Inf);
    EXPECT_TRUE(neighbour) << "function " << static_cast<int>(c.fn) << " x = " << c.x
                           << " y = " << c.y << ": " << got << ", expected " << c.expected;
  }
  const auto n = static_cast<int>(std::size(kElementaryCases));
  std::printf("[ info     ] %d of %d correctly rounded\n", exact, n);
  EXPECT_GE(exact, n - n / 100);
}

TEST(Elementary, SpecialValuesAreThoseOfTheCLibrary) {
  const Extended denormMin = std::numeric_limits<Extended>::denorm_min();
  struct Case {
    Extended got, expected;
  };
  const Case cases[] = {
      {Exp80(0), 1},
      {Exp80(-0.0L), 1},
      {Exp80(Inf), Inf},
      {Exp80(-Inf), 0},
      {Exp80(12000), Inf},
      {Exp80(-12000), 0},
      {Exp80(1e-30L, 0), 1},
      {Ln80(1), 0},
      {Ln80(0), -Inf},
      {Ln80(-0.0L), -Inf},
      {Ln80(Inf), Inf},
      {Pow80(NaN, 0), 1},
      {Pow80(1, NaN), 1},
      {Pow80(-1, Inf), 1},
      {Pow80(-1, -Inf), 1},
      {Pow80(0.5L, Inf), 0},
      {Pow80(0.5L, -Inf), Inf},
      {Pow80(2, Inf), Inf},
      {Pow80(2, -Inf), 0},
      {Pow80(0, -3), Inf},
      {Pow80(-0.0L, -3), -Inf},
      {Pow80(-0.0L, -2), Inf},
      {Pow80(-0.0L, 3), -0.0L},
      {Pow80(-0.0L, 0.5L), 0},
      {Pow80(0, 2), 0},
      {Pow80(-Inf, 3), -Inf},
      {Pow80(-Inf, 2), Inf},
      {Pow80(-Inf, -3), -0.0L},
      {Pow80(-Inf, 0.5L), Inf},
      {Pow80(Inf, -1), 0},
      {Pow80(-2, 3), -8},
      {Pow80(-2, -0x1p70L), 0},
      {Pow80(-2, 0x1p63L + 1), -Inf},
      {Pow80(2, -16446), 0},
      {Pow80(1 - 0x1p-64L, 0x1p90L), 0},
      {Pow80(denormMin, 1), denormMin},
  };
  for (std::size_t i = 0; i < std::size(cases); ++i) {
    EXPECT_EQ(cases[i].got, cases[i].expected) << "case " << i;
    EXPECT_EQ(std::signbit(cases[i].got), std::signbit(cases[i].expected)) << "case " << i;
  }
  for (const Extended v : {Exp80(NaN), Ln80(NaN), Ln80(-1), Ln80(-Inf), Pow80(NaN, 1),
                           Pow80(2, NaN), Pow80(-2, 0.5L), Pow80(-Inf * 0, 2)})
    EXPECT_TRUE(std::isnan(v));
}

}  // namespace
}  // namespace tovrin::detail
