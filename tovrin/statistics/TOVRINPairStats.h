// Paired data: correlation and regression.
//
// X (independent) and Y (dependent) are paired element by element. Sums are taken in Extended.
// Outputs are written only after every check has passed.
#pragma once

#include "tovrin/foundation/TOVRINFoundation.h"

namespace tovrin {

// Pearson's correlation coefficient r from the sums, sums of squares and the dot product.
// Unequal lengths or fewer than two pairs give 0 (no error); zero spread divides by zero.
Extended CoeffCorrelation(const TQENFloatVector& X, const TQENFloatVector& Y);
// r squared, with the same 0 for unequal or too short samples.
Extended CoeffDetermination(const TQENFloatVector& X, const TQENFloatVector& Y);
// The least-squares line y = Intercept + Slope x. Raises rsSameDimensions for unequal lengths,
// then rsVectorIsEmpty for empty samples. All X equal divides by zero (unchecked).
void GetRegressionLine(const TQENFloatVector& X, const TQENFloatVector& Y, Extended& Intercept,
                       Extended& Slope);
// The least-squares parabola y = A + B x + C x^2 by Cramer's rule on the normal equations.
// Raises rsSameDimensions for unequal lengths, rsDivideByZero when the determinant is zero
// within tolerance (fewer than three distinct x values, or no pairs at all).
void GetQuadraticCurve(const TQENFloatVector& X, const TQENFloatVector& Y, Extended& A, Extended& B,
                       Extended& C);
// sum (Slope X[i] + Intercept - Y[i])^2; 0 for two empty vectors. Raises rsSameDimensions.
Extended GetSSE(const TQENFloatVector& X, const TQENFloatVector& Y, Extended Intercept,
                Extended Slope);

}  // namespace tovrin
