// Descriptive statistics of a sample.
//
// Every function reduces one vector of observations to a measure of location, spread or shape
// (Standardise rescales the vector in place). Results are Extended whatever the element type.
// Failures raise EMathError before anything is written: outputs and the vector stay as they
// were. The order statistics (GetMedian, GetQuartiles, GetDeciles, GetMode, GetMostFrequent,
// TrimmedMean, ExcelTrimmedMean) never sort: they read the vector as stored and are meaningful
// only for an ascending vector (sort it with QSortVector first).
#pragma once

#include <array>
#include <vector>

#include "tovrin/foundation/TOVRINElementTypes.h"
#include "tovrin/foundation/TOVRINFoundation.h"

namespace tovrin {

// --- Mean ----------------------------------------------------------------------------------
// SumVector(X) / n. Integer sums are the wrapping Int64 sums of SumVector.
// Raises rsVectorIsEmpty for an empty X.
template <detail::BuildableElement T>
Extended QENMean(const std::vector<T>& X);

// --- Variance and standard deviation, two passes --------------------------------------------
// SumSqDiffVector(X, mean) / (n - 1) for the sample, / n for the population. The Double and
// Single forms hand the mean over rounded to their element type; the integer forms hand it
// over as Extended. Raise rsVectorIsEmpty for n = 0; the sample forms rsVectorG1 for n = 1
// (the population variance of one element is 0). The StdDev forms are the square roots.
template <detail::BuildableElement T>
Extended SampleVariance(const std::vector<T>& X);

template <detail::BuildableElement T>
Extended PopulationVariance(const std::vector<T>& X);

template <detail::BuildableElement T>
Extended SampleStdDev(const std::vector<T>& X);

template <detail::BuildableElement T>
Extended PopulationStdDev(const std::vector<T>& X);

// --- Variance (or standard deviation) and mean, one pass ------------------------------------
// Running sums S1 = sum x and S2 = sum x^2, then Variance = (S2 - S1^2 / n) / d with d = n - 1
// (Sample) or n (Population), Mean = S1 / n. The textbook one-pass formula: it may differ from
// the two-pass forms in the last digits. The accumulators depend on the element type:
//   Extended, Double, Single  S1, S2 in Extended, squares as Extended products;
//   Int64                     S1, S2 and S1^2 wrapping 64-bit integers, converted at the end;
//   LongWord                  S1, S2 in Extended, each square the low 32 bits of x * x, unsigned;
//   LongInt                   S1, S2 in Extended, each square the low 32 bits of x * x, signed.
// Raise rsVectorIsEmpty for n = 0; the Sample forms rsVectorG1 for n = 1.
template <detail::BuildableElement T>
void SampleVarianceAndMean(const std::vector<T>& X, Extended& Variance, Extended& Mean);

template <detail::BuildableElement T>
void PopulationVarianceAndMean(const std::vector<T>& X, Extended& Variance, Extended& Mean);

template <detail::BuildableElement T>
void SampleStdDevAndMean(const std::vector<T>& X, Extended& StdDev, Extended& Mean);

template <detail::BuildableElement T>
void PopulationStdDevAndMean(const std::vector<T>& X, Extended& StdDev, Extended& Mean);

// --- Median --------------------------------------------------------------------------------
// X sorted ascending. The middle element, or the mean of the two middle ones. The LongInt and
// LongWord forms add the two middle elements in wrapping 32-bit arithmetic, Int64 in wrapping
// 64-bit arithmetic, before the sum is halved in Extended. Raises rsVectorIsEmpty.
template <detail::BuildableElement T>
Extended GetMedian(const std::vector<T>& X);

// --- Trimmed means -------------------------------------------------------------------------
// X sorted ascending. TrimmedMean drops Trunc(n * Alpha) elements at each end, ExcelTrimmedMean
// Trunc(n * Alpha) div 2. Checks in this order: Alpha zero (within tolerance) returns
// QENMean(X); Alpha the same as 0.5 (TrimmedMean) or 1 (ExcelTrimmedMean) returns GetMedian(X);
// Alpha below 0 or above 0.5 (1), or not a number, raises rsInvalidValue; then an empty X raises
// rsVectorIsEmpty and one element is returned as it is. Nothing left after trimming gives 0.
template <detail::BuildableElement T>
Extended TrimmedMean(const std::vector<T>& X, Extended Alpha);

template <detail::BuildableElement T>
Extended ExcelTrimmedMean(const std::vector<T>& X, Extended Alpha);

// --- Mode and most frequent values ---------------------------------------------------------
// X sorted ascending; runs are neighbours that are SameFloat. GetMode returns true, with Mode
// set to the last element of the longest run, only when one run of at least two is longer than
// every other; on false Mode holds -1.1e4932 when no value repeats, or the first of the tied
// runs. One element is its own mode. Raises rsVectorIsEmpty.
bool GetMode(const TQENFloatVector& X, Extended& Mode);
// Every value whose run is as long as the longest run of at least two, ascending (when only the
// last run repeats, the first element of X is reported, by design); an empty vector when no
// value repeats; [X[0]] for one element. Raises rsVectorIsEmpty.
TQENFloatVector GetMostFrequent(const TQENFloatVector& X);

// --- Quartiles and deciles -----------------------------------------------------------------
// X sorted ascending. The quantile at the one-based position p = n q + 0.5 (q = 1/4, 3/4, or
// j/10), p held in single precision: X[k - 1] + (X[k] - X[k - 1]) Frac(p) with k = Trunc(p),
// X[n - 1] past the end, and X[0] for a position before the first element. One element gives
// itself everywhere. Raises rsVectorIsEmpty.
void GetQuartiles(const TQENFloatVector& X, Extended& Q1, Extended& Q3);
// Deciles 1 to 9 in entries 0 to 8.
void GetDeciles(const TQENFloatVector& X, std::array<Extended, 9>& Deciles);

// --- Skew and kurtosis ---------------------------------------------------------------------
// With the mean m and standard deviation s given, S3 = sum (x - m)^3 and S4 = sum (x - m)^4:
//   GetSampleSkew          n S3 / ((n - 1)(n - 2) s^3)
//   GetPopulationSkew      S3 / (n s^3)
//   GetSampleKurtosis      n (n + 1) S4 / ((n - 1)(n - 2)(n - 3) s^4) - 3 (n - 1)^2 / ((n - 2)(n -
//   3)) GetPopulationKurtosis  S4 / (n s^4) - 3
// Both kurtoses are excess kurtoses. The forms without m and s take them from
// SampleStdDevAndMean (sample forms) or PopulationStdDevAndMean (population forms).
// Checks in order: rsVectorIsEmpty; rsVectorG2 for fewer than 3 elements (skews) or rsVectorG3
// for fewer than 4 (kurtoses), the population forms included; rsStdDev when s is zero within
// tolerance.
Extended GetSampleSkew(const TQENFloatVector& X);
Extended GetSampleSkew(const TQENFloatVector& X, Extended Mean, Extended StdDev);
Extended GetPopulationSkew(const TQENFloatVector& X);
Extended GetPopulationSkew(const TQENFloatVector& X, Extended Mean, Extended StdDev);
Extended GetSampleKurtosis(const TQENFloatVector& X);
Extended GetSampleKurtosis(const TQENFloatVector& X, Extended Mean, Extended StdDev);
Extended GetPopulationKurtosis(const TQENFloatVector& X);
Extended GetPopulationKurtosis(const TQENFloatVector& X, Extended Mean, Extended StdDev);

// --- Standardise ---------------------------------------------------------------------------
// Every element becomes (x - Mean) / StdDev, then that times NewStdDev plus NewMean.
// Raises rsVectorIsEmpty, then rsStdDev for a StdDev of exactly 0.
void Standardise(TQENFloatVector& X, Extended Mean, Extended StdDev, Extended NewMean,
                 Extended NewStdDev);
// The same with the mean and standard deviation of X itself (PopulationStdDevAndMean when
// Population, else SampleStdDevAndMean, whose errors it raises): Standardise(X, 0, 1, false)
// gives z-scores.
void Standardise(TQENFloatVector& X, Extended NewMean, Extended NewStdDev, bool Population);

// --- Geometric measures (every element must be positive) -----------------------------------
// exp(sum ln x / n). Raises rsVectorIsEmpty, then rsVectorNotPos unless VectorPositive(X).
Extended GeometricMean(const TQENFloatVector& X);
// exp(sqrt(sum (ln x - ln GeoMean)^2 / d)), d = n - 1 when Sample, else n. Raises
// rsVectorIsEmpty, rsVectorG1 (n = 1 with Sample), then rsVectorNotPos. The form without
// GeoMean first takes it from GeometricMean (and so raises its errors first).
Extended GeometricStdDev(const TQENFloatVector& X, bool Sample);
Extended GeometricStdDev(const TQENFloatVector& X, Extended GeoMean, bool Sample);
// The square of the matching GeometricStdDev (not the exponential of the log variance).
Extended GeometricVariance(const TQENFloatVector& X, bool Sample);
Extended GeometricVariance(const TQENFloatVector& X, Extended GeoMean, bool Sample);

// --- Other means ---------------------------------------------------------------------------
// n / sum (1 / x). Raises rsVectorIsEmpty, then rsVectorNotPos unless VectorPositive(X).
Extended HarmonicMean(const TQENFloatVector& X);
// sqrt(sum x^2 / n). Raises rsVectorIsEmpty.
Extended RootMeanSquare(const TQENFloatVector& X);
// sum |x - Mean| / n; 0 for an empty X (no error).
Extended MeanDeviation(const TQENFloatVector& X, Extended Mean);
// (A + sqrt(A B) + B) / 3. Raises rsValueGEZero when A or B is negative beyond tolerance.
Extended HeronianMean(Extended A, Extended B);

}  // namespace tovrin
