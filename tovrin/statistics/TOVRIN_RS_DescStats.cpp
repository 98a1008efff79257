#include "tovrin/statistics/TOVRIN_RS_DescStats.h"

#include <array>
#include <utility>

#include "tovrin/foundation/detail/ResStringTable.h"

namespace tovrin {
namespace {

#define TOVRIN_RS(id, text) (detail::ResString{#id, text})
constexpr std::array<detail::ResString, rsDescStatsStringCount> kDescStatsStrings{{
    TOVRIN_RS(rsDSNoOfValues, "Number of Values:"),
    TOVRIN_RS(rsDSMaximum, "Maximum:"),
    TOVRIN_RS(rsDSMinimum, "Minimum:"),
    TOVRIN_RS(rsDSRange, "Range:"),
    TOVRIN_RS(rsDSSum, "Sum:"),
    TOVRIN_RS(rsDSSumSQ, "Sum of Squares:"),
    TOVRIN_RS(rsDSMean, "Mean:"),
    TOVRIN_RS(rsDSMode, "Mode:"),
    TOVRIN_RS(rsDSNoMode, "No Modal Value"),
    TOVRIN_RS(rsDSMedian, "Median:"),
    TOVRIN_RS(rsDSNEVariance, "Not enough Values for Variance"),
    TOVRIN_RS(rsDSNEStdDev, "Not enough Values for Standard Deviation"),
    TOVRIN_RS(rsDSVariance, "Variance:"),
    TOVRIN_RS(rsDSStdDev, "Standard Deviation:"),
    TOVRIN_RS(rsDSNEKurtosis, "Not enough Values for Kurtosis"),
    TOVRIN_RS(rsDSSDKurtosis, "Standard Deviation needs to be > 0 for Kurtosis"),
    TOVRIN_RS(rsDSKurtosis, "Kurtosis:"),
    TOVRIN_RS(rsDSNESkew, "Not enough Values for Skew"),
    TOVRIN_RS(rsDSSDSkew, "Standard Deviation needs to be > 0 for Skew"),
    TOVRIN_RS(rsDSSkew, "Skew:"),
    TOVRIN_RS(rsDSQtr1, "First Quartile:"),
    TOVRIN_RS(rsDSQtr3, "Third Quartile:"),
    TOVRIN_RS(rsDSIQR, "Inter-Quartile Range:"),
    TOVRIN_RS(rsDSLowerFence, "Lower Fence for Outliers:"),
    TOVRIN_RS(rsDSUpperFence, "Upper Fence for Outliers:"),
    TOVRIN_RS(rsDSConfidenceIntervalM, "Confidence Interval for the Mean:"),
    TOVRIN_RS(rsDSConfidenceIntervalV, "Confidence Interval for the Variance:"),
    TOVRIN_RS(rsDSSignificance, "Significance Level:"),
    TOVRIN_RS(rsNotRejected, "Null Hypothesis is NOT Rejected!"),
    TOVRIN_RS(rsNotRejectReason,
              "There is insufficient Statistical evidence to reject the proposal behind the Null "
              "Hypothesis"),
    TOVRIN_RS(rsNullHypothesis, "Null Hypothesis:"),
    TOVRIN_RS(rsPValue, "p-Value:"),
    TOVRIN_RS(rsRejected, "Null Hypothesis is Rejected!"),
    TOVRIN_RS(rsRejectionRegion, "Rejection Region:"),
    TOVRIN_RS(rsRejectReason,
              "There is sufficient Statistical evidence to reject the proposal behind the Null "
              "Hypothesis"),
    TOVRIN_RS(rsTestStatistic, "Test Statistic:"),
    TOVRIN_RS(rsDSCoeffCor, "Coefficient of Correlation"),
    TOVRIN_RS(rsDSCoeffDet, "Coefficient of Determination"),
    TOVRIN_RS(rsDSRegressionLine, "Regression Line:"),
    TOVRIN_RS(rsDSSSE, "Sum of Squares Error:"),
    TOVRIN_RS(rsDSStdDevX, "Standard Deviation of X Values:"),
    TOVRIN_RS(rsDSStdDevY, "Standard Deviation of Y Values:"),
    TOVRIN_RS(rsAlternateHypothesis, "Alternate Hypothesis:"),
    TOVRIN_RS(rsDSConfidence, "Confidence Level:"),
    TOVRIN_RS(rsDSCovar, "Covariance:"),
    TOVRIN_RS(rsDSMeanX, "Mean of X Values:"),
    TOVRIN_RS(rsDSMeanY, "Mean of Y Values:"),
}};
#undef TOVRIN_RS
// The published interface of the report labels: 25 for the component's report, 22 for reports
// of paired data and of hypothesis tests.
static_assert(rsDSUpperFence - rsDSNoOfValues + 1 == 25 && rsDescStatsStringCount == 47);

constexpr auto Table = detail::TableOf<rsDescStatsStringCount, kDescStatsStrings>;

}  // namespace

std::string LoadResString(TDescStatsStringId Ident) { return Table().Load(Ident); }
void SetResString(TDescStatsStringId Ident, std::string Text) {
  Table().Set(Ident, std::move(Text));
}
void ResetDescStatsStrings() { Table().Reset(); }
const char* ResStringName(TDescStatsStringId Ident) { return Table().Name(Ident); }

}  // namespace tovrin
