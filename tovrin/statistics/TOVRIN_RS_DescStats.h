// The labels of the statistics reports (rsDSMean, rsDSNoMode, ...). They are resource
// strings like every message of the library, held in a table of the statistics subsystem:
// LoadResString(rsDSMean) reads the text in force, SetResString replaces it (for translation)
// and ResStringName names it, through the overloads below for TDescStatsStringId (the
// foundation's table, TResStringId, holds the error messages). ResetDescStatsStrings restores
// the labels' own texts. All are safe to call from several threads.
//
// The 25 labels of the TQENDescStats report, in report order:
//   rsDSNoOfValues "Number of Values:"         rsDSMaximum "Maximum:"
//   rsDSMinimum "Minimum:"                     rsDSRange "Range:"
//   rsDSSum "Sum:"                             rsDSSumSQ "Sum of Squares:"
//   rsDSMean "Mean:"                           rsDSMode "Mode:"
//   rsDSNoMode "No Modal Value"                rsDSMedian "Median:"
//   rsDSNEVariance "Not enough Values for Variance"
//   rsDSNEStdDev "Not enough Values for Standard Deviation"
//   rsDSVariance "Variance:"                   rsDSStdDev "Standard Deviation:"
//   rsDSNEKurtosis "Not enough Values for Kurtosis"
//   rsDSSDKurtosis "Standard Deviation needs to be > 0 for Kurtosis"
//   rsDSKurtosis "Kurtosis:"                   rsDSNESkew "Not enough Values for Skew"
//   rsDSSDSkew "Standard Deviation needs to be > 0 for Skew"
//   rsDSSkew "Skew:"                           rsDSQtr1 "First Quartile:"
//   rsDSQtr3 "Third Quartile:"                 rsDSIQR "Inter-Quartile Range:"
//   rsDSLowerFence "Lower Fence for Outliers:" rsDSUpperFence "Upper Fence for Outliers:"
//
// The 22 labels for reports of paired data and of hypothesis tests:
//   rsDSConfidenceIntervalM "Confidence Interval for the Mean:"
//   rsDSConfidenceIntervalV "Confidence Interval for the Variance:"
//   rsDSSignificance "Significance Level:"     rsNotRejected "Null Hypothesis is NOT Rejected!"
//   rsNotRejectReason "There is insufficient Statistical evidence to reject the proposal
//                      behind the Null Hypothesis"
//   rsNullHypothesis "Null Hypothesis:"        rsPValue "p-Value:"
//   rsRejected "Null Hypothesis is Rejected!"  rsRejectionRegion "Rejection Region:"
//   rsRejectReason "There is sufficient Statistical evidence to reject the proposal behind
//                   the Null Hypothesis"
//   rsTestStatistic "Test Statistic:"          rsDSCoeffCor "Coefficient of Correlation"
//   rsDSCoeffDet "Coefficient of Determination"
//   rsDSRegressionLine "Regression Line:"      rsDSSSE "Sum of Squares Error:"
//   rsDSStdDevX "Standard Deviation of X Values:"
//   rsDSStdDevY "Standard Deviation of Y Values:"
//   rsAlternateHypothesis "Alternate Hypothesis:"
//   rsDSConfidence "Confidence Level:"         rsDSCovar "Covariance:"
//   rsDSMeanX "Mean of X Values:"              rsDSMeanY "Mean of Y Values:"
#pragma once

#include <cstdint>
#include <string>

#include "tovrin/foundation/TOVRINErrors.h"

namespace tovrin {

enum TDescStatsStringId : std::uint16_t {
  // The TQENDescStats report, in report order
  rsDSNoOfValues,
  rsDSMaximum,
  rsDSMinimum,
  rsDSRange,
  rsDSSum,
  rsDSSumSQ,
  rsDSMean,
  rsDSMode,
  rsDSNoMode,
  rsDSMedian,
  rsDSNEVariance,
  rsDSNEStdDev,
  rsDSVariance,
  rsDSStdDev,
  rsDSNEKurtosis,
  rsDSSDKurtosis,
  rsDSKurtosis,
  rsDSNESkew,
  rsDSSDSkew,
  rsDSSkew,
  rsDSQtr1,
  rsDSQtr3,
  rsDSIQR,
  rsDSLowerFence,
  rsDSUpperFence,
  // Reports of paired data and of hypothesis tests
  rsDSConfidenceIntervalM,
  rsDSConfidenceIntervalV,
  rsDSSignificance,
  rsNotRejected,
  rsNotRejectReason,
  rsNullHypothesis,
  rsPValue,
  rsRejected,
  rsRejectionRegion,
  rsRejectReason,
  rsTestStatistic,
  rsDSCoeffCor,
  rsDSCoeffDet,
  rsDSRegressionLine,
  rsDSSSE,
  rsDSStdDevX,
  rsDSStdDevY,
  rsAlternateHypothesis,
  rsDSConfidence,
  rsDSCovar,
  rsDSMeanX,
  rsDSMeanY,
  rsDescStatsStringCount  // not an identifier: the number of identifiers
};

// The first and the last of the 47 report labels; they are contiguous.
inline constexpr TDescStatsStringId kFirstDescStatsString = rsDSNoOfValues;
inline constexpr TDescStatsStringId kLastDescStatsString = rsDSMeanY;

// The text in force for a label.
std::string LoadResString(TDescStatsStringId Ident);
// Replaces the text of a label (for translation). Raises std::out_of_range for a value that is
// not an identifier.
void SetResString(TDescStatsStringId Ident, std::string Text);
// Restores every label to the library's own text.
void ResetDescStatsStrings();
// The identifier's name, e.g. "rsDSMean".
const char* ResStringName(TDescStatsStringId Ident);

}  // namespace tovrin
