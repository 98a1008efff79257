// Statistics of grouped frequency data.
//
// The data are a frequency table of equally wide, adjacent classes: Freqs[i] counts the
// observations of class i, which covers [Start + i Width, Start + (i + 1) Width) and has the
// midpoint i Width + Start + Width / 2. F is the total frequency (a 64-bit sum); cumulative
// frequencies are 32-bit and wrap past 2^32 - 1. Every function raises rsVectorIsEmpty for an
// empty Freqs, before it writes anything (GroupedSums zeroes its outputs first).
#pragma once

#include <array>

#include "tovrin/foundation/TOVRINFoundation.h"

namespace tovrin {

// --- Location ------------------------------------------------------------------------------
// sum f mid / F, or 0 when F = 0.
Extended GroupedMean(const TQENLWordVector& Freqs, Extended Start, Extended Width);
// The interpolated median: with k the first class whose cumulative frequency reaches F / 2,
// (k Width + Start) + (F / 2 - C[k - 1]) Width / f[k]. Raises rsMedianNotFound when no class
// reaches it.
Extended GroupedMedian(const TQENLWordVector& Freqs, Extended Start, Extended Width);
// The interpolated mode of the modal class k: (k Width + Start) + d1 Width / (d1 + d2) with
// d1 = f[k] - f[k - 1] and d2 = f[k] - f[k + 1] (f[k] at either end), in 32-bit unsigned
// arithmetic. Returns false, leaving Mode as it was, when two classes share the largest
// frequency.
bool GroupedMode(const TQENLWordVector& Freqs, Extended Start, Extended Width, Extended& Mode);
// The same interpolation as the median for the targets F / 4 and 3F / 4. Raises
// rsQuartilesNotFound when a target is not reached.
void GroupedQuartiles(const TQENLWordVector& Freqs, Extended Start, Extended Width, Extended& Q1,
                      Extended& Q3);
// The targets F j / 10 for j = 1 to 9, into entries 0 to 8. Raises rsQuartilesNotFound when a
// target is not reached.
void GetGroupedDeciles(const TQENLWordVector& Freqs, Extended Start, Extended Width,
                       std::array<Extended, 9>& Deciles);

// --- Spread --------------------------------------------------------------------------------
// sum f (mid - mean)^2 / (F - 1), or 0 when F < 2 (no error); the population form divides by F
// (0 when F = 0). The StdDev forms are the square roots.
Extended GroupedSampleVariance(const TQENLWordVector& Freqs, Extended Start, Extended Width);
Extended GroupedPopulationVariance(const TQENLWordVector& Freqs, Extended Start, Extended Width);
Extended GroupedSampleStdDev(const TQENLWordVector& Freqs, Extended Start, Extended Width);
Extended GroupedPopulationStdDev(const TQENLWordVector& Freqs, Extended Start, Extended Width);
// Sum = sum f mid and SumSq = sum mid^2 f, both set to 0 before the emptiness check.
void GroupedSums(const TQENLWordVector& Freqs, Extended Start, Extended Width, Extended& Sum,
                 Extended& SumSq);
// sum f |mid - Mean| / F, or 0 when F = 0.
Extended GetGroupedMeanDev(const TQENLWordVector& Freqs, Extended Start, Extended Width,
                           Extended Mean);

// --- Shape ---------------------------------------------------------------------------------
// Mean and StdDev are those of the data, given by the caller. The central sums run over the
// classes without frequency weights, S3 = sum (mid - Mean)^3 and S4 = sum (mid - Mean)^4; only
// F carries the frequencies. The two skew names carry each other's textbook formulas:
//   GetGroupedSampleSkew          S3 / (F StdDev^3)
//   GetGroupedPopulationSkew      F S3 / ((F - 1)(F - 2) StdDev^3)
//   GetGroupedSampleKurtosis      F (F + 1) S4 / ((F - 1)(F - 2)(F - 3) StdDev^4)
//                                 - 3 (F - 1)^2 / ((F - 2)(F - 3))
//   GetGroupedPopulationKurtosis  S4 / (F StdDev^4) - 3
// with the products of F terms formed in wrapping 64-bit integers. Checks in order:
// rsVectorIsEmpty; rsVectorG2 when F < 3 (skews) or rsVectorG3 when F < 4 (kurtoses);
// rsStdDev when StdDev is zero within tolerance.
Extended GetGroupedSampleSkew(const TQENLWordVector& Freqs, Extended Start, Extended Width,
                              Extended Mean, Extended StdDev);
Extended GetGroupedPopulationSkew(const TQENLWordVector& Freqs, Extended Start, Extended Width,
                                  Extended Mean, Extended StdDev);
Extended GetGroupedSampleKurtosis(const TQENLWordVector& Freqs, Extended Start, Extended Width,
                                  Extended Mean, Extended StdDev);
Extended GetGroupedPopulationKurtosis(const TQENLWordVector& Freqs, Extended Start, Extended Width,
                                      Extended Mean, Extended StdDev);

}  // namespace tovrin
