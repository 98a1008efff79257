// Continuous distributions: tail probabilities (Less, Greater, Between), inverses, densities
// and density tables of the normal, log-normal, chi-square, F, Student t, exponential and beta
// distributions, and the incomplete gamma function they rest on.
//
// Greater is always 1 - Less of the same arguments. Between is Less(second bound) -
// Less(first bound), with no reordering, except NormalDistBetween, which does not depend on
// the order of its bounds. Every failed check raises EMathError before any work is done.
//
// The density tables (PDFValues) empty both outputs first, run the distribution's checks,
// and then give N + 1 points XLow + i * (XHigh - XLow) / N (one point at XLow when N = 0).
// Densities defined only for x >= 0 (chi-square, F, exponential) give 0 at a negative x.
// A failed table leaves both outputs empty.
#pragma once

#include "tovrin/foundation/TOVRINFoundation.h"

namespace tovrin {

// --- Standard normal ------------------------------------------------------------------------
// NormalZ is the density; NormalLess sums the power series
// Phi(z) = 1/2 + phi(z) (z + z^3/3 + z^5/(3*5) + ...), which is exact to a few 1e-19 in
// absolute terms (so its relative accuracy fades deep in the lower tail), and returns 0 or 1
// outright once phi(z) < 1e-20. InvNormalLess is Wichura's AS 241 (about 1 part in 1e16) and
// raises rsValue01 unless 0 < P < 1. ZAlpha(Alpha) is the z with Alpha above it.
Extended NormalZ(Extended Z);
Extended NormalLess(Extended Z);
Extended NormalGreater(Extended Z);
Extended InvNormalLess(Extended P);
Extended InvNormalGreater(Extended P);
Extended ZAlpha(Extended Alpha);

// --- Normal with mean and standard deviation ------------------------------------------------
// A standard deviation that is not positive (within the tolerance) raises rsStdDev; the
// inverses raise rsValue01 first, unless 0 < P < 1, and then rsStdDev for a standard deviation
// that is zero within the tolerance or negative (so QENTolerance itself passes there).
Extended NormalPDF(Extended Mean, Extended StdDev, Extended X);
void NormalPDFValues(Extended Mean, Extended StdDev, Extended XLow, Extended XHigh, LongWord N,
                     TQENFloatVector& XValues, TQENFloatVector& YValues);
Extended NormalDistLess(Extended Mean, Extended StdDev, Extended X);
Extended NormalDistGreater(Extended Mean, Extended StdDev, Extended X);
Extended NormalDistBetween(Extended Mean, Extended StdDev, Extended X1, Extended X2);
Extended InvNormalDistLess(Extended Mean, Extended StdDev, Extended P);
Extended InvNormalDistGreater(Extended Mean, Extended StdDev, Extended P);

// --- Log-normal -----------------------------------------------------------------------------
// Mean and StdDev are those of ln X. rsStdDev as for the normal; LogNormalPDF raises
// rsValueGZero for X <= 0 (LogNormalLess gives 0 there), and so does the table when any of
// its points is not positive. The inverses raise rsValue01, then rsStdDev.
Extended LogNormalPDF(Extended Mean, Extended StdDev, Extended X);
Extended LogNormalLess(Extended Mean, Extended StdDev, Extended X);
Extended LogNormalGreater(Extended Mean, Extended StdDev, Extended X);
Extended LogNormalBetween(Extended Mean, Extended StdDev, Extended X1, Extended X2);
Extended InvLogNormalLess(Extended Mean, Extended StdDev, Extended P);
Extended InvLogNormalGreater(Extended Mean, Extended StdDev, Extended P);
void LogNormalPDFValues(Extended Mean, Extended StdDev, Extended XLow, Extended XHigh, LongWord N,
                        TQENFloatVector& XValues, TQENFloatVector& YValues);

// --- Incomplete gamma -----------------------------------------------------------------------
// IncompleteGamma(A, X) is the regularised lower incomplete gamma P(A, X), by its series (X <= 1
// or X < A) or the continued fraction of the upper tail, both stopped at QENTolerance (so the
// result is good to roughly 1e-11 relative, less where X is near a large A). It is 0 when X is
// zero within the tolerance, 1 when X > 1e8, and results below exp(-88) flush to 0 (or, for
// the upper tail, to 1). X < 0 raises rsValueGEZero, A <= 0 rsValueGZero; NaN gives NaN.
// IncompleteGamma2(A, X) is the unregularised upper Gamma(A, X) for whole and half-whole A:
// ChiSquareGreater(2X, Round(2A)) * Gamma(A) (so A <= 0.25, rounding to 0, raises rsDF).
Extended IncompleteGamma(Extended A, Extended X);
Extended IncompleteGamma2(Extended A, Extended X);

// --- Chi-square -----------------------------------------------------------------------------
// X < 0 raises rsValueGEZero, DF = 0 raises rsDF. InvChiSquareLess starts from Best and
// Roberts' AS 91 and bisects ChiSquareLess to 1e-16 within 10 % of that start; it raises rsDF
// for DF = 0, and rsValueGEZero for P outside AS 91's range [0.000002, 0.999998] (where AS 91
// gives no start: its failure value -1 would put the whole bracket below zero).
Extended ChiSquareLess(Extended X, LongWord DF);
Extended ChiSquareGreater(Extended X, LongWord DF);
Extended ChiSquareBetween(Extended X1, Extended X2, LongWord DF);
Extended InvChiSquareLess(Extended P, LongWord DF);
Extended InvChiSquareGreater(Extended P, LongWord DF);
Extended ChiSquarePDF(Extended X, LongWord DF);
void ChiSquarePDFValues(LongWord DF, Extended XLow, Extended XHigh, LongWord N,
                        TQENFloatVector& XValues, TQENFloatVector& YValues);

// --- F --------------------------------------------------------------------------------------
// FDistLess raises rsValueGZero for X <= 0 (or NaN) and rsDF for a zero DF. FDistPDF raises
// rsDF, and rsValueGEZero for X < 0; it is evaluated as a binomial term in saddle-point form
// (Stirling errors and deviances), so any degrees of freedom keep its relative error within a
// few units in the last place times (1 + |ln f|). InvFDistLess raises rsValue01Inc for P outside
// [0, 1] and rsDF; P = 1 gives 0. It brackets the root from [1e-16, 100] outwards and refines it by
// Ridders' method until FDistLess is within QENTolerance of P; rsInvalidValue when no bracket
// or no convergence is found (a bracket pushed below zero raises FDistLess's rsValueGZero).
Extended FDistLess(Extended X, LongWord DF1, LongWord DF2);
Extended FDistGreater(Extended X, LongWord DF1, LongWord DF2);
Extended FDistBetween(Extended X1, Extended X2, LongWord DF1, LongWord DF2);
Extended InvFDistLess(Extended P, LongWord DF1, LongWord DF2);
Extended InvFDistGreater(Extended P, LongWord DF1, LongWord DF2);
Extended FDistPDF(Extended X, LongWord DF1, LongWord DF2);
void FDistPDFValues(LongWord DF1, LongWord DF2, Extended XLow, Extended XHigh, LongWord N,
                    TQENFloatVector& XValues, TQENFloatVector& YValues);

// --- Student t ------------------------------------------------------------------------------
// DF = 0 raises rsDF. InvStudentTLess raises rsValue01Inc for P outside [0, 1] (P = 0 and 1
// give -inf and +inf) and bisects StudentTLess to 1e-16 within 10 % of a Hill-type start.
Extended StudentTLess(Extended T, LongWord DF);
Extended StudentTGreater(Extended T, LongWord DF);
Extended StudentTBetween(Extended T1, Extended T2, LongWord DF);
Extended InvStudentTLess(Extended P, LongWord DF);
Extended InvStudentTGreater(Extended P, LongWord DF);
Extended StudentTPDF(Extended T, LongWord DF);
void StudentTPDFValues(LongWord DF, Extended XLow, Extended XHigh, LongWord N,
                       TQENFloatVector& XValues, TQENFloatVector& YValues);

// --- Exponential ----------------------------------------------------------------------------
// Mean is 1/lambda. Mean <= 0 or X < 0 raises rsExpDistInvalid (ExponentialPDF also for a NaN
// mean). Note ExponentialPDF's argument order: X first, then Mean.
Extended ExponentialLess(Extended Mean, Extended X);
Extended ExponentialGreater(Extended Mean, Extended X);
Extended ExponentialBetween(Extended Mean, Extended X1, Extended X2);
Extended ExponentialPDF(Extended X, Extended Mean);
void ExponentialPDFValues(Extended Mean, Extended XLow, Extended XHigh, LongWord N,
                          TQENFloatVector& XValues, TQENFloatVector& YValues);

// --- Beta -----------------------------------------------------------------------------------
// Shapes A, B not positive (or NaN) raise rsValueGZero; the inverses raise rsValue01Inc first
// for P outside [0, 1]. X is clamped to the support. The interval forms take the smaller of
// Lower and Upper as the lower end and raise rsSameValue (before anything else) when the two
// are equal; their density is the standard one divided by the interval's width.
Extended BetaDistLess(Extended X, Extended A, Extended B);
Extended BetaDistLess(Extended X, Extended A, Extended B, Extended Lower, Extended Upper);
Extended BetaDistGreater(Extended X, Extended A, Extended B);
Extended BetaDistGreater(Extended X, Extended A, Extended B, Extended Lower, Extended Upper);
Extended BetaDistBetween(Extended X1, Extended X2, Extended A, Extended B);
Extended BetaDistBetween(Extended X1, Extended X2, Extended A, Extended B, Extended Lower,
                         Extended Upper);
Extended InvBetaDistLess(Extended P, Extended A, Extended B);
Extended InvBetaDistLess(Extended P, Extended A, Extended B, Extended Lower, Extended Upper);
Extended InvBetaDistGreater(Extended P, Extended A, Extended B);
Extended InvBetaDistGreater(Extended P, Extended A, Extended B, Extended Lower, Extended Upper);
Extended BetaPDF(Extended X, Extended A, Extended B);
Extended BetaPDF(Extended X, Extended A, Extended B, Extended Lower, Extended Upper);
void BetaPDFValues(Extended A, Extended B, Extended XLow, Extended XHigh, LongWord N,
                   TQENFloatVector& XValues, TQENFloatVector& YValues);
void BetaPDFValues(Extended A, Extended B, Extended Lower, Extended Upper, Extended XLow,
                   Extended XHigh, LongWord N, TQENFloatVector& XValues, TQENFloatVector& YValues);

}  // namespace tovrin
