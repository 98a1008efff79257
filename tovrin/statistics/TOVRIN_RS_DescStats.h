// The labels of the statistics reports (rsDSMean, rsDSNoMode, ...). They are resource
// strings like every message of the library: LoadResString(rsDSMean) reads the text in force
// and SetResString replaces it (for translation). The identifiers are members of
// TResStringId (TOVRINErrors.h); this header is their home in the statistics subsystem.
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

#include "tovrin/foundation/TOVRINErrors.h"

namespace tovrin {

// The first and the last of the 47 report labels in TResStringId; they are contiguous.
inline constexpr TResStringId kFirstDescStatsString = rsDSNoOfValues;
inline constexpr TResStringId kLastDescStatsString = rsDSMeanY;

}  // namespace tovrin
