// Both tails of the incomplete gamma and beta functions, each to full relative accuracy, and
// the pieces of the densities that stand beside them. These serve the precise distribution
// family; the public special functions of TOVRINMath.h keep their own methods.
//
// None of them checks its arguments: callers pass shapes A, B > 0 and points inside the
// domain (NaN in, NaN out).
#pragma once

#include <limits>

#include "tovrin/foundation/TOVRINGlobals.h"

namespace tovrin::detail {

// A probability and its complement, each computed directly where it is the smaller one (the
// larger is 1 - the smaller, which loses nothing), and the factor of the density at the point
// (X^A e^-X / Gamma(A), or x^A y^B / B(A, B)) where the tails formed it on the way, NaN where
// they did not.
struct Tails {
  Extended lower;
  Extended upper;
  Extended factor = std::numeric_limits<Extended>::quiet_NaN();
};

// P(A, X) and Q(A, X), the regularised lower and upper incomplete gamma functions, for A > 0
// and X >= 0 (X = +inf allowed).
Tails IncompleteGammaTails(Extended A, Extended X);

// X^A e^-X / Gamma(A), the factor shared by the incomplete gamma and its density (which is
// this divided by X), without overflow or underflow before the result does.
Extended GammaPowerFactor(Extended A, Extended X);

// I_x(A, B) and 1 - I_x(A, B) at the point x = X + XLo, with y = 1 - x = Y + YLo given as well,
// so that a point near 1 keeps its distance from 1. XLo and YLo are small corrections (0 when
// X and Y are exact).
Tails IncompleteBetaTails(Extended X, Extended XLo, Extended Y, Extended YLo, Extended A,
                          Extended B);

// x^A y^B / B(A, B) at that point: the beta density is this divided by x y.
Extended BetaPowerFactor(Extended X, Extended XLo, Extended Y, Extended YLo, Extended A,
                         Extended B);

// The root x of I_x(A, B) = P, given P and Q = 1 - P (each exact where it is the smaller), as
// the pair (x, 1 - x) whose smaller member is computed directly. Start, when given, is a first
// estimate of the root that the caller knows better than the general one.
struct BetaRoot {
  Extended x;
  Extended y;
};
BetaRoot InverseIncompleteBetaTails(Extended P, Extended Q, Extended A, Extended B,
                                    const BetaRoot* Start = nullptr);

// X^A for X > 0, faster than pow and still well inside the precise family's bound: sqrt for
// A = 1/2, exp(A ln X) while |A ln X| <= 8 (an error of about that many units in the last
// place), pow beyond.
Extended PrecisePower(Extended X, Extended A);

// Stirling's remainder ln Gamma(X) - ((X - 1/2) ln X - X + ln(2 pi) / 2) for X > 0.
Extended StirlingRemainder(Extended X);

// T - log1p(T) for T > -1, without cancellation for small T.
Extended XMinusLog1p(Extended T);

}  // namespace tovrin::detail
