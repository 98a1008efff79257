// Tolerance predicates, elementary helpers and the special functions of tovrin.
#pragma once

#include "tovrin/foundation/TOVRINGlobals.h"

namespace tovrin {

// --- Tolerance predicates -------------------------------------------------------------------
// Absolute tests against QENTolerance: FloatIsZero is |X| < QENTolerance, FloatIsNotZero its
// negation, FloatIsPositive is X > QENTolerance, FloatIsNegative is X < -QENTolerance.
// A NaN is not zero, not positive and not negative.
bool FloatIsZero(Extended X);
bool FloatIsNotZero(Extended X);
bool FloatIsPositive(Extended X);
bool FloatIsNegative(Extended X);

// X and Y are the same when |X - Y| < T * max(1, |X|, |Y|): absolute for values up to 1,
// relative beyond. T is QENTolerance for Extended, QENDoubleTolerance for Double and
// QENSingleTolerance for Single (the two operands compared at their own precision).
// Equal infinities are the same; a NaN is the same as nothing.
bool SameFloat(Extended X, Extended Y);
bool SameFloat(Double X, Double Y);
bool SameFloat(Single X, Single Y);
bool NotSameFloat(Extended X, Extended Y);

// --- Elementary helpers ---------------------------------------------------------------------
Extended MinXY(Extended X, Extended Y);
LongInt MinXY(LongInt X, LongInt Y);
Int64 MinXY(Int64 X, Int64 Y);
LongWord MinXY(LongWord X, LongWord Y);
Extended MaxXY(Extended X, Extended Y);
Int64 MaxXY(Int64 X, Int64 Y);

// Sign transfer: |X| with the sign of Y (Y = 0 counts as positive).
Extended SignXY(Extended X, Extended Y);
// X raised to the power Y, as the C library's powl (a negative X with an integral Y is fine).
Extended XtoY(Extended X, Extended Y);
// 2 raised to the power Y.
Extended TwoToY(Extended Y);
// Logarithms of a positive X; other arguments give the IEEE result (-inf or NaN).
Extended QENLog10(Extended X);
Extended QENLog2(Extended X);
Extended CubeRoot(Extended X);
Extended QENArcCos(Extended X);
Extended QENTan(Extended X);
// Euclidean distance between the plane points (X1, Y1) and (X2, Y2), without overflow on
// the way.
Extended QENDistance(Extended X1, Extended Y1, Extended X2, Extended Y2);

// --- Special functions ----------------------------------------------------------------------
// All five work in the 80-bit type: on their tested domains the relative error is within a few
// units of 1e-19 for Gamma, LnGamma and Beta and within 1e-16 for the incomplete beta and its
// inverse (see TOVRINMath_GammaBeta_test.cpp and its reference table). A NaN argument gives
// NaN; no loop runs without a bound.
//
// Gamma(X) for X not zero or a negative integer; rsGammaPole there and at -inf. Finite up to
// X = 1755.5 (so 1754! = Gamma(1755) is finite), +inf beyond; for X below about -1760 the
// result underflows to a signed zero.
Extended Gamma(Extended X);
// LnGamma(X) = ln|Gamma(X)|, finite for every finite X that is not a pole (rsGammaPole at the
// poles and at -inf); +inf at +inf. Near its zeros on the negative axis (between -2 and -4 and
// so on) the error is absolute, about 1e-19, rather than relative.
Extended LnGamma(Extended X);
// Beta(A, B) = Gamma(A) Gamma(B) / Gamma(A + B) for A, B > 0 (rsArgOutsideDomain otherwise,
// including -inf); 0 when a shape is +inf; over- and underflows to +inf and 0.
Extended Beta(Extended A, Extended B);
// The regularised incomplete beta function I_X(A, B) for 0 <= X <= 1 and A, B > 0
// (rsArgOutsideDomain outside that domain); I_0 = 0 and I_1 = 1 exactly. An infinite shape
// gives 0 (A) or 1 (B), two infinite shapes NaN. Shapes beyond 1e10 use the leading term of an
// asymptotic expansion (relative error about 1/sqrt(min(A, B))).
Extended IncompleteBeta(Extended X, Extended A, Extended B);
// The X in [0, 1] with I_X(A, B) = P, for 0 <= P <= 1 and A, B > 0 (rsArgOutsideDomain
// otherwise); P = 0 and P = 1 give 0 and 1. A root below the smallest subnormal gives 0.
// Its relative error is that of I_X divided by about min(A, 1).
Extended InverseIncompleteBeta(Extended P, Extended A, Extended B);

}  // namespace tovrin
