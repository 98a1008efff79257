#include "tovrin/foundation/TOVRINErrors.h"

#include <array>
#include <mutex>
#include <optional>
#include <shared_mutex>
#include <stdexcept>
#include <utility>

namespace tovrin {
namespace {

struct ResString {
  const char* name;
  const char* text;
};

#define TOVRIN_RS(id, text) (ResString{#id, text})
constexpr std::array<ResString, rsResStringCount> kResStrings{{
    TOVRIN_RS(rsVectorIsEmpty, "Vector is empty"),
    TOVRIN_RS(rsVectorNeg, "Vector has a negative element"),
    TOVRIN_RS(rsVectorZero, "Vector has a zero element"),
    TOVRIN_RS(rsVectorNotPos, "Vector has an element that is not positive"),
    TOVRIN_RS(rsValueNotZero, "Value must not be zero"),
    TOVRIN_RS(rsSameDimensions, "Vectors must have the same dimensions"),
    TOVRIN_RS(rsMagZero, "Vector has a magnitude of zero"),
    TOVRIN_RS(rsDivideByZero, "Division by zero"),
    TOVRIN_RS(rsVectorG1, "Vector needs more than one value"),
    TOVRIN_RS(rsVectorG2, "Vector needs more than two values"),
    TOVRIN_RS(rsVectorG3, "Vector needs more than three values"),
    TOVRIN_RS(rsStdDev, "Standard deviation must be greater than zero"),
    TOVRIN_RS(rsValue01, "Value must lie strictly between 0 and 1"),
    TOVRIN_RS(rsValue01Inc, "Value must lie between 0 and 1 inclusive"),
    TOVRIN_RS(rsValueGEZero, "Value must be greater than or equal to zero"),
    TOVRIN_RS(rsValueGZero, "Value must be greater than zero"),
    TOVRIN_RS(rsValue2, "Value must be at least 2"),
    TOVRIN_RS(rsDF, "Degrees of freedom must be at least 1"),
    TOVRIN_RS(rsSameValue, "Values must differ"),
    TOVRIN_RS(rsInvalidValue, "Invalid value"),
    TOVRIN_RS(rsBinomInvalid, "Binomial coefficient needs 0 <= R <= N"),
    TOVRIN_RS(rsBinomOverflowed, "Binomial coefficient overflowed"),
    TOVRIN_RS(rsBinomDistInvalid, "Invalid parameters for the binomial distribution"),
    TOVRIN_RS(rsPermInvalid, "Permutation needs 0 <= R <= N"),
    TOVRIN_RS(rsPermOverflowed, "Permutation overflowed"),
    TOVRIN_RS(rsFactOverflow, "Factorial overflowed"),
    TOVRIN_RS(rsPoissonInvalid, "Invalid parameters for the Poisson distribution"),
    TOVRIN_RS(rsHyperGeometricInvalid, "Invalid parameters for the hypergeometric distribution"),
    TOVRIN_RS(rsExpDistInvalid, "Invalid parameters for the exponential distribution"),
    TOVRIN_RS(rsMedianNotFound, "Median class not found"),
    TOVRIN_RS(rsQuartilesNotFound, "Quartile class not found"),
    TOVRIN_RS(rsMatrixIsEmpty, "Matrix is empty"),
    TOVRIN_RS(rsMatrixRect, "Matrix must be rectangular"),
    TOVRIN_RS(rsMatrixSqr, "Matrix must be square"),
    TOVRIN_RS(rsMatrixMult, "Matrix dimensions do not allow multiplication"),
    TOVRIN_RS(rsMatrixNeg, "Matrix has a negative element"),
    TOVRIN_RS(rsMatrixNotPos, "Matrix has an element that is not positive"),
    TOVRIN_RS(rsMatrixZero, "Matrix has a zero element"),
    TOVRIN_RS(rsInvalidRow, "Invalid row"),
    TOVRIN_RS(rsInvalidCol, "Invalid column"),
    TOVRIN_RS(rsNoInvert, "Matrix cannot be inverted"),
    TOVRIN_RS(rsInvalidMean, "Invalid mean"),
    TOVRIN_RS(rsInvalidStdDev, "Invalid standard deviation"),
    TOVRIN_RS(rsInvalidShape, "Invalid shape parameter"),
    TOVRIN_RS(rsShapeTooSmall, "Shape parameter is too small"),
    TOVRIN_RS(rsVectorEmpty, "Vector of parameters is empty"),
    TOVRIN_RS(rsVectorTooSmall, "Vector of parameters is too small"),
    TOVRIN_RS(rsLengthNotNeg, "Length must not be negative"),
    TOVRIN_RS(rsInvalidSides, "Sides do not form a triangle"),
    TOVRIN_RS(rsAngleNotLEPi, "Angle must not exceed pi"),
    TOVRIN_RS(rsNA, "N/A"),
    TOVRIN_RS(rsArgOutsideDomain, "Argument is outside the function's domain"),
    TOVRIN_RS(rsGammaPole, "Gamma function has a pole at zero and the negative integers"),
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

// Replacement texts set at run time; guarded because a raise on one thread may read while
// another thread installs a translation.
class ResStringTable {
 public:
  std::string Load(TResStringId id) {
    std::shared_lock lock(mutex_);
    const auto& text = overrides_[Index(id)];
    return text ? *text : std::string(kResStrings[Index(id)].text);
  }
  void Set(TResStringId id, std::string text) {
    std::size_t index = Index(id);
    std::unique_lock lock(mutex_);
    overrides_[index] = std::move(text);
  }
  void Reset() {
    std::unique_lock lock(mutex_);
    for (auto& text : overrides_) text.reset();
  }
  static std::size_t Index(TResStringId id) {
    auto index = static_cast<std::size_t>(id);
    if (index >= kResStrings.size()) throw std::out_of_range("not a resource string identifier");
    return index;
  }

 private:
  std::shared_mutex mutex_;
  std::array<std::optional<std::string>, rsResStringCount> overrides_;
};

ResStringTable& Table() {
  static ResStringTable table;
  return table;
}

}  // namespace

std::string LoadResString(TResStringId Ident) { return Table().Load(Ident); }
void SetResString(TResStringId Ident, std::string Text) { Table().Set(Ident, std::move(Text)); }
void ResetResStrings() { Table().Reset(); }
const char* ResStringName(TResStringId Ident) {
  return kResStrings[ResStringTable::Index(Ident)].name;
}

EMathError::EMathError(TResStringId Ident) : ident_(Ident), message_(LoadResString(Ident)) {}

namespace detail {
void RaiseMathError(TResStringId Ident) { throw EMathError(Ident); }
}  // namespace detail

}  // namespace tovrin
