// The continuous and discrete distributions, the combinatorics and the special functions on
// arbitrary arguments, NaN and infinities included. Every call either returns or raises
// EMathError, and never hangs (the fuzzer times a case out after a second). The tables give
// the documented number of points, and stay empty after a failed call.
#include <cmath>
#include <cstdint>
#include <cstdlib>
#include <limits>

#include "fuzz/FuzzInput.h"
#include "tovrin/foundation/TOVRINErrors.h"
#include "tovrin/foundation/TOVRINMath.h"
#include "tovrin/statistics/TOVRINStatistics_Continuous.h"
#include "tovrin/statistics/TOVRINStatistics_Discrete.h"

namespace {

using namespace tovrin;
using fuzzing::Expect;
using fuzzing::Fail;
using fuzzing::Input;
using fuzzing::MayRaise;
using fuzzing::NoRaise;

// An argument: special values, probabilities, moderate values, and any 80-bit encoding.
Extended Arg(Input& in) {
  using L = std::numeric_limits<Extended>;
  const std::uint8_t sel = in.Next();
  const Extended sign = (sel & 0x80) ? -1 : 1;
  switch (sel % 20) {
    case 0:
      return sign * 0.0L;
    case 1:
      return sign;
    case 2:
      return L::quiet_NaN();
    case 3:
      return sign * L::infinity();
    case 4:
      return sign * L::denorm_min();
    case 5:
      return sign * L::max();
    case 6:
      return sign * L::min();
    case 7:
      return sign * 5e-12L;
    case 8:
      return sign * L::epsilon();
    case 9:
    case 10:
      return in.Raw<std::uint16_t>() / 65535.0L;  // a probability
    case 11:
      return 1 - in.Raw<std::uint16_t>() * 1e-19L;  // close below 1
    case 12:
      return in.Raw<std::uint16_t>() * 1e-19L;  // close above 0
    case 13:
    case 14:
      return sign * (in.Raw<std::uint16_t>() / 256.0L);  // moderate
    case 15:
      return sign * static_cast<Extended>(in.Next());  // whole
    case 16:
      return sign * (in.Next() + 0.5L);  // half-whole
    case 17:
      return sign * std::ldexp(1.0L, static_cast<std::int16_t>(in.Raw<std::uint16_t>()) % 16400);
    default: {
      Extended v = 0;
      in.Bytes(&v, 10);
      return v;
    }
  }
}

// A count: mostly small, now and then anything.
LongWord Count(Input& in) {
  const std::uint8_t sel = in.Next();
  switch (sel % 8) {
    case 0:
      return 0;
    case 1:
    case 2:
    case 3:
      return in.Next();
    case 4:
      return in.Raw<std::uint16_t>();
    case 5:
      return std::numeric_limits<LongWord>::max() - in.Next();
    case 6:
      return 1700 + in.Next() % 100;
    default:
      return in.Raw<LongWord>();
  }
}

// Table sizes stay small enough to be built quickly.
LongWord TableSize(Input& in) { return in.Raw<std::uint16_t>() % 257; }

// A table call: outputs start non-empty, are empty after a failure and hold N + 1 points
// after a success.
template <class F>
void Table(LongWord n, F&& f) {
  TQENFloatVector x(3, 1.0L), y(5, 2.0L);
  if (MayRaise([&] { f(x, y); })) {
    Expect(x.size() == std::size_t{n} + 1 && y.size() == x.size());
  } else {
    Expect(x.empty() && y.empty());
  }
}

void Continuous(Input& in, int op) {
  switch (op) {
    case 0: {
      const Extended z = Arg(in);
      NoRaise([&] {
        (void)NormalZ(z);
        (void)NormalLess(z);
        (void)NormalGreater(z);
      });
      MayRaise([&] { (void)InvNormalLess(z); });
      MayRaise([&] { (void)InvNormalGreater(z); });
      MayRaise([&] { (void)ZAlpha(z); });
      break;
    }
    case 1: {
      const Extended m = Arg(in), s = Arg(in), x = Arg(in), x2 = Arg(in);
      MayRaise([&] { (void)NormalPDF(m, s, x); });
      MayRaise([&] { (void)NormalDistLess(m, s, x); });
      MayRaise([&] { (void)NormalDistGreater(m, s, x); });
      MayRaise([&] { (void)NormalDistBetween(m, s, x, x2); });
      MayRaise([&] { (void)InvNormalDistLess(m, s, x); });
      MayRaise([&] { (void)InvNormalDistGreater(m, s, x); });
      break;
    }
    case 2: {
      const Extended m = Arg(in), s = Arg(in), x = Arg(in), x2 = Arg(in);
      MayRaise([&] { (void)LogNormalPDF(m, s, x); });
      MayRaise([&] { (void)LogNormalLess(m, s, x); });
      MayRaise([&] { (void)LogNormalGreater(m, s, x); });
      MayRaise([&] { (void)LogNormalBetween(m, s, x, x2); });
      MayRaise([&] { (void)InvLogNormalLess(m, s, x); });
      MayRaise([&] { (void)InvLogNormalGreater(m, s, x); });
      break;
    }
    case 3: {
      const Extended m = Arg(in), s = Arg(in), lo = Arg(in), hi = Arg(in);
      const LongWord n = TableSize(in);
      if (in.Next() & 1) {
        Table(n, [&](auto& x, auto& y) { NormalPDFValues(m, s, lo, hi, n, x, y); });
      } else {
        Table(n, [&](auto& x, auto& y) { LogNormalPDFValues(m, s, lo, hi, n, x, y); });
      }
      break;
    }
    case 4: {
      const Extended a = Arg(in), x = Arg(in);
      MayRaise([&] { (void)IncompleteGamma(a, x); });
      MayRaise([&] { (void)IncompleteGamma2(a, x); });
      break;
    }
    case 5: {
      const Extended x = Arg(in), x2 = Arg(in);
      const LongWord df = Count(in);
      MayRaise([&] { (void)ChiSquareLess(x, df); });
      MayRaise([&] { (void)ChiSquareGreater(x, df); });
      MayRaise([&] { (void)ChiSquareBetween(x, x2, df); });
      MayRaise([&] { (void)InvChiSquareLess(x, df); });
      MayRaise([&] { (void)InvChiSquareGreater(x, df); });
      MayRaise([&] { (void)ChiSquarePDF(x, df); });
      break;
    }
    case 6: {
      const Extended x = Arg(in), x2 = Arg(in);
      const LongWord df1 = Count(in), df2 = Count(in);
      MayRaise([&] { (void)FDistLess(x, df1, df2); });
      MayRaise([&] { (void)FDistGreater(x, df1, df2); });
      MayRaise([&] { (void)FDistBetween(x, x2, df1, df2); });
      MayRaise([&] { (void)FDistPDF(x, df1, df2); });
      break;
    }
    case 7: {
      const Extended p = Arg(in);
      const LongWord df1 = Count(in), df2 = Count(in);
      MayRaise([&] { (void)InvFDistLess(p, df1, df2); });
      MayRaise([&] { (void)InvFDistGreater(p, df1, df2); });
      break;
    }
    case 8: {
      const Extended t = Arg(in), t2 = Arg(in);
      const LongWord df = Count(in);
      MayRaise([&] { (void)StudentTLess(t, df); });
      MayRaise([&] { (void)StudentTGreater(t, df); });
      MayRaise([&] { (void)StudentTBetween(t, t2, df); });
      MayRaise([&] { (void)InvStudentTLess(t, df); });
      MayRaise([&] { (void)InvStudentTGreater(t, df); });
      MayRaise([&] { (void)StudentTPDF(t, df); });
      break;
    }
    case 9: {
      const LongWord df1 = Count(in), df2 = Count(in);
      const Extended lo = Arg(in), hi = Arg(in);
      const LongWord n = TableSize(in);
      switch (in.Next() % 3) {
        case 0:
          Table(n, [&](auto& x, auto& y) { ChiSquarePDFValues(df1, lo, hi, n, x, y); });
          break;
        case 1:
          Table(n, [&](auto& x, auto& y) { FDistPDFValues(df1, df2, lo, hi, n, x, y); });
          break;
        default:
          Table(n, [&](auto& x, auto& y) { StudentTPDFValues(df1, lo, hi, n, x, y); });
          break;
      }
      break;
    }
    case 10: {
      const Extended m = Arg(in), x = Arg(in), x2 = Arg(in);
      MayRaise([&] { (void)ExponentialLess(m, x); });
      MayRaise([&] { (void)ExponentialGreater(m, x); });
      MayRaise([&] { (void)ExponentialBetween(m, x, x2); });
      MayRaise([&] { (void)ExponentialPDF(x, m); });
      const LongWord n = TableSize(in);
      Table(n, [&](auto& xs, auto& ys) { ExponentialPDFValues(m, x, x2, n, xs, ys); });
      break;
    }
    case 11: {
      const Extended x = Arg(in), x2 = Arg(in), a = Arg(in), b = Arg(in);
      MayRaise([&] { (void)BetaDistLess(x, a, b); });
      MayRaise([&] { (void)BetaDistGreater(x, a, b); });
      MayRaise([&] { (void)BetaDistBetween(x, x2, a, b); });
      MayRaise([&] { (void)InvBetaDistLess(x, a, b); });
      MayRaise([&] { (void)InvBetaDistGreater(x, a, b); });
      MayRaise([&] { (void)BetaPDF(x, a, b); });
      break;
    }
    case 12: {
      const Extended x = Arg(in), x2 = Arg(in), a = Arg(in), b = Arg(in), lo = Arg(in),
                     hi = Arg(in);
      MayRaise([&] { (void)BetaDistLess(x, a, b, lo, hi); });
      MayRaise([&] { (void)BetaDistGreater(x, a, b, lo, hi); });
      MayRaise([&] { (void)BetaDistBetween(x, x2, a, b, lo, hi); });
      MayRaise([&] { (void)InvBetaDistLess(x, a, b, lo, hi); });
      MayRaise([&] { (void)InvBetaDistGreater(x, a, b, lo, hi); });
      MayRaise([&] { (void)BetaPDF(x, a, b, lo, hi); });
      break;
    }
    default: {
      const Extended a = Arg(in), b = Arg(in), lo = Arg(in), hi = Arg(in), xl = Arg(in),
                     xh = Arg(in);
      const LongWord n = TableSize(in);
      if (in.Next() & 1) {
        Table(n, [&](auto& x, auto& y) { BetaPDFValues(a, b, xl, xh, n, x, y); });
      } else {
        Table(n, [&](auto& x, auto& y) { BetaPDFValues(a, b, lo, hi, xl, xh, n, x, y); });
      }
      break;
    }
  }
}

void Discrete(Input& in, int op) {
  switch (op) {
    case 0: {
      const LongWord n = Count(in), r = Count(in);
      MayRaise([&] { (void)Factorial(n); });
      MayRaise([&] { (void)Permutation(n, r); });
      MayRaise([&] { (void)BinomialCoeff(n, r); });
      break;
    }
    case 1: {
      const Extended p = Arg(in);
      const LongWord n = Count(in), r1 = Count(in), r2 = Count(in);
      MayRaise([&] { (void)BinomialEq(p, n, r1); });
      MayRaise([&] { (void)BinomialLess(p, n, r1); });
      MayRaise([&] { (void)BinomialGreater(p, n, r1); });
      MayRaise([&] { (void)BinomialBetween(p, n, r1, r2); });
      break;
    }
    case 2: {
      const LongWord n = Count(in), s = Count(in), m = Count(in), x1 = Count(in), x2 = Count(in);
      MayRaise([&] { (void)HyperGeometricEq(n, s, m, x1); });
      MayRaise([&] { (void)HyperGeometricLess(n, s, m, x1); });
      MayRaise([&] { (void)HyperGeometricGreater(n, s, m, x1); });
      MayRaise([&] { (void)HyperGeometricBetween(n, s, m, x1, x2); });
      break;
    }
    case 3: {
      const Extended mean = Arg(in);
      const LongWord x1 = Count(in), x2 = Count(in);
      MayRaise([&] { (void)PoissonEq(mean, x1); });
      MayRaise([&] { (void)PoissonLess(mean, x1); });
      MayRaise([&] { (void)PoissonGreater(mean, x1); });
      MayRaise([&] { (void)PoissonBetween(mean, x1, x2); });
      break;
    }
    case 4: {
      const auto n =
          static_cast<LongInt>(static_cast<std::int16_t>(in.Raw<std::uint16_t>()) % 2048);
      const Extended p = Arg(in);
      TQENFloatVector v(4, 1.0L);
      if (MayRaise([&] { BinomialPDFValues(n, p, v); })) {
        Expect(n > 0 && v.size() == static_cast<std::size_t>(n) + 1);
      } else {
        Expect(v.empty());
      }
      break;
    }
    case 5: {
      const LongWord n = in.Raw<std::uint16_t>() % 2048, s = in.Raw<std::uint16_t>() % 2048,
                     m = in.Raw<std::uint16_t>() % 2048;
      TQENFloatVector v(4, 1.0L);
      if (MayRaise([&] { HyperGeometricPDFValues(n, s, m, v); })) {
        Expect(v.size() == std::size_t{s} + 1);
      } else {
        Expect(v.empty());
      }
      break;
    }
    default: {
      const auto n =
          static_cast<LongInt>(static_cast<std::int16_t>(in.Raw<std::uint16_t>()) % 2048);
      const Extended mean = Arg(in);
      TQENLIntVector counts(3, 7);
      TQENFloatVector probs(4, 1.0L);
      if (MayRaise([&] { PoissonPDFValues(n, mean, counts, probs); })) {
        Expect(n > 0 && counts.size() == probs.size() && counts.size() <= std::size_t(n));
      } else {
        Expect(counts.empty() && probs.empty());
      }
      break;
    }
  }
}

void Special(Input& in, int op) {
  const Extended x = Arg(in), y = Arg(in), z = Arg(in);
  switch (op) {
    case 0:
      NoRaise([&] {
        (void)FloatIsZero(x);
        (void)FloatIsNotZero(x);
        (void)FloatIsPositive(x);
        (void)FloatIsNegative(x);
        (void)SameFloat(x, y);
        (void)SameFloat(static_cast<Double>(x), static_cast<Double>(y));
        (void)SameFloat(static_cast<Single>(x), static_cast<Single>(y));
        (void)NotSameFloat(x, y);
        (void)MinXY(x, y);
        (void)MaxXY(x, y);
        (void)SignXY(x, y);
      });
      break;
    case 1:
      MayRaise([&] { (void)XtoY(x, y); });
      MayRaise([&] { (void)TwoToY(y); });
      MayRaise([&] { (void)QENLog10(x); });
      MayRaise([&] { (void)QENLog2(x); });
      MayRaise([&] { (void)CubeRoot(x); });
      MayRaise([&] { (void)QENArcCos(x); });
      MayRaise([&] { (void)QENTan(x); });
      MayRaise([&] { (void)QENDistance(x, y, z, Arg(in)); });
      break;
    case 2:
      MayRaise([&] { (void)Gamma(x); });
      MayRaise([&] { (void)LnGamma(x); });
      MayRaise([&] { (void)Beta(x, y); });
      break;
    default:
      MayRaise([&] { (void)IncompleteBeta(x, y, z); });
      MayRaise([&] { (void)InverseIncompleteBeta(x, y, z); });
      break;
  }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  Input in(data, size);
  for (int step = 0; step < 8 && !in.Empty(); ++step) {
    const std::uint8_t op = in.Next();
    const int which = op % 25;
    if (which < 14) {
      Continuous(in, which);
    } else if (which < 21) {
      Discrete(in, which - 14);
    } else {
      Special(in, which - 21);
    }
  }
  return 0;
}
