#include "tovrin/foundation/TOVRINErrors.h"

#include <array>
#include <utility>

#include "tovrin/foundation/detail/ResStringTable.h"

namespace tovrin {
namespace {

#define TOVRIN_RS(id, text) (detail::ResString{#id, text})
constexpr std::array<detail::ResString, rsResStringCount> kResStrings{{
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
}};
#undef TOVRIN_RS

constexpr auto Table = detail::TableOf<rsResStringCount, kResStrings>;

}  // namespace

std::string LoadResString(TResStringId Ident) { return Table().Load(Ident); }
void SetResString(TResStringId Ident, std::string Text) { Table().Set(Ident, std::move(Text)); }
void ResetResStrings() { Table().Reset(); }
const char* ResStringName(TResStringId Ident) { return Table().Name(Ident); }

EMathError::EMathError(TResStringId Ident) : ident_(Ident), message_(LoadResString(Ident)) {}

namespace detail {
void RaiseMathError(TResStringId Ident) { throw EMathError(Ident); }
}  // namespace detail

}  // namespace tovrin
