// Discrete distributions and combinatorics: factorials, permutations and binomial coefficients
// as whole numbers held in Extended, and the binomial, hypergeometric and Poisson distributions
// with point probabilities (Eq), cumulative sums (Less, Greater, Between) and tables.
//
// Less(..., R) is P(X < R), strictly below R; Greater(..., R) = 1 - Less(..., R + 1) is
// P(X > R). The Between functions are deliberately asymmetric: BinomialBetween and
// PoissonBetween give P(R1 < X < R2) for R1 < R2 but P(R2 <= X <= R1) for R1 > R2, while
// HyperGeometricBetween gives P(X1 <= X <= X2) for X1 < X2 but P(X2 < X < X1) for X1 > X2.
// Equal bounds give the point probability. Every failed check raises EMathError before any work.
#pragma once

#include "tovrin/foundation/TOVRINFoundation.h"

namespace tovrin {

// --- Combinatorics --------------------------------------------------------------------------
// Factorial raises rsFactOverflow for N > 1754 (1754! is the largest finite in Extended).
// Permutation raises rsPermInvalid for N < R and rsPermOverflowed when the product overflows;
// BinomialCoeff raises rsBinomInvalid for N < K and rsBinomOverflowed on overflow. Both round
// their product half up to a whole number.
Extended Factorial(LongWord N);
Extended Permutation(LongWord N, LongWord R);
Extended BinomialCoeff(LongWord N, LongWord K);

// --- Binomial (P the probability of success, N trials) ---------------------------------------
// N = 0, P outside [0, 1], or a count above N raises rsBinomDistInvalid (Greater and Between
// accept every count up to N); a coefficient beyond Extended raises rsBinomOverflowed.
Extended BinomialEq(Extended P, LongWord N, LongWord R);
Extended BinomialLess(Extended P, LongWord N, LongWord R);
Extended BinomialGreater(Extended P, LongWord N, LongWord R);
Extended BinomialBetween(Extended P, LongWord N, LongWord R1, LongWord R2);

// --- Hypergeometric (sample of S drawn from N of which M are successes) ----------------------
// N = 0, S = 0, S > N or M > N raises rsHyperGeometricInvalid; so does a count above S in Less,
// Greater and Between (unless Between's two counts are equal). Counts that cannot occur have
// probability 0.
Extended HyperGeometricEq(LongWord N, LongWord S, LongWord M, LongWord X);
Extended HyperGeometricLess(LongWord N, LongWord S, LongWord M, LongWord X);
Extended HyperGeometricGreater(LongWord N, LongWord S, LongWord M, LongWord X);
Extended HyperGeometricBetween(LongWord N, LongWord S, LongWord M, LongWord X1, LongWord X2);

// --- Poisson ----------------------------------------------------------------------------------
// Mean <= 0 raises rsPoissonInvalid; a count whose factorial is needed above 1754 raises
// rsFactOverflow.
Extended PoissonEq(Extended Mean, LongWord X);
Extended PoissonLess(Extended Mean, LongWord X);
Extended PoissonGreater(Extended Mean, LongWord X);
Extended PoissonBetween(Extended Mean, LongWord X1, LongWord X2);

// --- Tables -----------------------------------------------------------------------------------
// Every output is emptied on entry, before any check, and stays empty after a failed call.
// BinomialPDFValues: V[k] = BinomialEq(P, N, k) for k = 0..N; N <= 0 or P outside [0, 1] (or
// NaN) raises rsBinomDistInvalid. HyperGeometricPDFValues: V[k] = HyperGeometricEq(N, S, M, k)
// for k = 0..S. PoissonPDFValues: the run of N consecutive counts around Trunc(Mean), clipped
// at 0 (Half = N div 2 counts above Trunc(Mean), Half - 1 (N even) or Half (N odd) below),
// with their probabilities; N <= 0 or Mean not positive raises rsPoissonInvalid.
void BinomialPDFValues(LongInt N, Extended P, TQENFloatVector& V);
void HyperGeometricPDFValues(LongWord N, LongWord S, LongWord M, TQENFloatVector& V);
void PoissonPDFValues(LongInt N, Extended Mean, TQENLIntVector& Counts, TQENFloatVector& Probs);

}  // namespace tovrin
