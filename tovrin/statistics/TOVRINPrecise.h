// The precise distribution family: the classic continuous and discrete distribution functions
// under their own names, argument orders and meanings, computed to the full accuracy of the
// 80-bit Extended type over their whole domains.
//
// Where the classic functions follow their written methods (power series, 1 - Less for every
// Greater, sums of point probabilities, bisection), these compute every tail directly: the
// complementary error function, both tails of the incomplete gamma and beta functions (the
// smaller one always computed, never 1 - a value near 1), ratios such as t^2 / (DF + t^2) and
// their complements carried to twice the working precision, point probabilities through
// Stirling's remainder and the saddle-point deviance (so they neither overflow nor underflow
// before the result does), and inverses by a first estimate refined with Newton or Halley
// steps to the last bit.
//
// Degrees of freedom are Extended here (any positive value, not only whole ones); counts stay
// LongWord. The argument checks and their identifiers are those of the classic functions:
// rsStdDev, rsValue01, rsValue01Inc, rsValueGEZero, rsValueGZero, rsDF (DF not positive),
// rsExpDistInvalid, rsSameValue, rsBinomDistInvalid, rsHyperGeometricInvalid,
// rsPoissonInvalid. A NaN argument that passes the checks gives NaN.
#pragma once

#include "tovrin/foundation/TOVRINGlobals.h"

namespace tovrin::precise {

// --- Standard normal ------------------------------------------------------------------------
// Less is P(Z < z), Greater P(Z > z); the inverses raise rsValue01 unless 0 < P < 1.
Extended NormalZ(Extended Z);
Extended NormalLess(Extended Z);
Extended NormalGreater(Extended Z);
Extended InvNormalLess(Extended P);
Extended InvNormalGreater(Extended P);
Extended ZAlpha(Extended Alpha);

// --- Normal with mean and standard deviation (rsStdDev when StdDev is not positive) --------
Extended NormalPDF(Extended Mean, Extended StdDev, Extended X);
Extended NormalDistLess(Extended Mean, Extended StdDev, Extended X);
Extended NormalDistGreater(Extended Mean, Extended StdDev, Extended X);
Extended InvNormalDistLess(Extended Mean, Extended StdDev, Extended P);
Extended InvNormalDistGreater(Extended Mean, Extended StdDev, Extended P);

// --- Log-normal: Mean and StdDev of ln X; rsValueGZero for X <= 0 in the density ------------
Extended LogNormalPDF(Extended Mean, Extended StdDev, Extended X);
Extended LogNormalLess(Extended Mean, Extended StdDev, Extended X);
Extended LogNormalGreater(Extended Mean, Extended StdDev, Extended X);
Extended InvLogNormalLess(Extended Mean, Extended StdDev, Extended P);
Extended InvLogNormalGreater(Extended Mean, Extended StdDev, Extended P);

// --- Incomplete gamma: P(A, X) and Q(A, X) = 1 - P(A, X) ------------------------------------
// rsValueGEZero for X < 0, rsValueGZero for A <= 0.
Extended IncompleteGamma(Extended A, Extended X);
Extended IncompleteGammaUpper(Extended A, Extended X);

// --- Chi-square: rsValueGEZero for X < 0, rsDF for DF <= 0 ----------------------------------
// The inverses raise rsValue01Inc outside [0, 1]; P = 1 (Less) gives +inf.
Extended ChiSquareLess(Extended X, Extended DF);
Extended ChiSquareGreater(Extended X, Extended DF);
Extended InvChiSquareLess(Extended P, Extended DF);
Extended InvChiSquareGreater(Extended P, Extended DF);
Extended ChiSquarePDF(Extended X, Extended DF);

// --- F: rsValueGZero for X <= 0 (rsValueGEZero for X < 0 in the density), rsDF -------------
// InvFDistLess(1, ...) is 0, as in the classic function.
Extended FDistLess(Extended X, Extended DF1, Extended DF2);
Extended FDistGreater(Extended X, Extended DF1, Extended DF2);
Extended InvFDistLess(Extended P, Extended DF1, Extended DF2);
Extended InvFDistGreater(Extended P, Extended DF1, Extended DF2);
Extended FDistPDF(Extended X, Extended DF1, Extended DF2);

// --- Student t: rsDF; the inverses raise rsValue01Inc and give -inf and +inf at 0 and 1 -----
Extended StudentTLess(Extended T, Extended DF);
Extended StudentTGreater(Extended T, Extended DF);
Extended InvStudentTLess(Extended P, Extended DF);
Extended InvStudentTGreater(Extended P, Extended DF);
Extended StudentTPDF(Extended T, Extended DF);

// --- Exponential: Mean first (the density takes X first); rsExpDistInvalid -----------------
Extended ExponentialLess(Extended Mean, Extended X);
Extended ExponentialGreater(Extended Mean, Extended X);
Extended ExponentialPDF(Extended X, Extended Mean);

// --- Beta on [0, 1] and on [Lower, Upper] (either order; rsSameValue for equal bounds) ------
// rsValueGZero for shapes that are not positive; rsValue01Inc for P outside [0, 1].
Extended BetaDistLess(Extended X, Extended A, Extended B);
Extended BetaDistLess(Extended X, Extended A, Extended B, Extended Lower, Extended Upper);
Extended BetaDistGreater(Extended X, Extended A, Extended B);
Extended BetaDistGreater(Extended X, Extended A, Extended B, Extended Lower, Extended Upper);
Extended InvBetaDistLess(Extended P, Extended A, Extended B);
Extended InvBetaDistLess(Extended P, Extended A, Extended B, Extended Lower, Extended Upper);
Extended InvBetaDistGreater(Extended P, Extended A, Extended B);
Extended InvBetaDistGreater(Extended P, Extended A, Extended B, Extended Lower, Extended Upper);
Extended BetaPDF(Extended X, Extended A, Extended B);
Extended BetaPDF(Extended X, Extended A, Extended B, Extended Lower, Extended Upper);

// --- Binomial (P, N trials, R): rsBinomDistInvalid for N = 0, R > N or P outside [0, 1] ------
// Less is P(X < R), Greater P(X > R), both in constant time in N.
Extended BinomialEq(Extended P, LongWord N, LongWord R);
Extended BinomialLess(Extended P, LongWord N, LongWord R);
Extended BinomialGreater(Extended P, LongWord N, LongWord R);

// --- Hypergeometric (population N, sample S, successes M, count X) --------------------------
// rsHyperGeometricInvalid for N = 0, S = 0, S > N or M > N, and (Less, Greater) for X > S.
Extended HyperGeometricEq(LongWord N, LongWord S, LongWord M, LongWord X);
Extended HyperGeometricLess(LongWord N, LongWord S, LongWord M, LongWord X);
Extended HyperGeometricGreater(LongWord N, LongWord S, LongWord M, LongWord X);

// --- Poisson: rsPoissonInvalid for Mean <= 0; Less and Greater in constant time in X --------
Extended PoissonEq(Extended Mean, LongWord X);
Extended PoissonLess(Extended Mean, LongWord X);
Extended PoissonGreater(Extended Mean, LongWord X);

}  // namespace tovrin::precise
