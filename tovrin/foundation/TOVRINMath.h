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
// Gamma(X) for X not zero or a negative integer (raises rsGammaPole there); overflows to
// +inf past about 1755.5. LnGamma(X) is ln|Gamma(X)|, raising rsGammaPole at the poles.
Extended Gamma(Extended X);
Extended LnGamma(Extended X);
// Beta(A, B) = Gamma(A) Gamma(B) / Gamma(A + B) for A, B > 0 (rsArgOutsideDomain otherwise).
Extended Beta(Extended A, Extended B);
// The regularised incomplete beta function I_X(A, B) for 0 <= X <= 1 and A, B > 0;
// I_0 = 0 and I_1 = 1 exactly. Raises rsArgOutsideDomain outside that domain.
Extended IncompleteBeta(Extended X, Extended A, Extended B);
// The X in [0, 1] with I_X(A, B) = P, for 0 <= P <= 1 and A, B > 0.
Extended InverseIncompleteBeta(Extended P, Extended A, Extended B);

}  // namespace tovrin
