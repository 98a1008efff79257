// Arithmetic, transforms, two-vector operations, conversions and polynomials of the vector
// unit.
#include <cmath>
#include <cstddef>
#include <span>

#include "tovrin/detail/ElementRules.h"
#include "tovrin/detail/VectorAlgorithms.h"
#include "tovrin/vector/TOVRINVector.h"

namespace tovrin {
namespace {

using detail::ElementRules;
using detail::ValueOf;

// An element-wise float function applied in Extended after the whole-vector check `valid`
// (one of the sign predicates, which raises rsVectorIsEmpty itself) has passed.
template <typename T, typename F>
void CheckedFloatTransform(std::vector<T>& V, bool valid, TResStringId failure, F f) {
  if (!valid) detail::RaiseMathError(failure);
  detail::ApplyInPlace(V, [&f](ValueOf<T> x) { return static_cast<ValueOf<T>>(f(Extended(x))); });
}

// The sum from 0 over i of term(V1[i], V2[i]) in index order, after the length and then the
// emptiness check: in Extended for floats, in a wrapping Int64 for integers.
template <typename T, typename Term>
detail::SumOf<T> PairedSum(const std::vector<T>& V1, const std::vector<T>& V2, Term term) {
  detail::RequireSameLength(V1, V2);
  detail::RequireElements(V1);
  detail::SumOf<T> sum = 0;
  for (std::size_t i = 0; i < V1.size(); ++i) {
    sum = ElementRules<T>::SumAdd(
        sum, term(static_cast<ValueOf<T>>(V1[i]), static_cast<ValueOf<T>>(V2[i])));
  }
  return sum;
}

// A vector of R holding every element of A converted (exactly: the conversions offered only
// widen).
template <typename R, typename Source>
std::vector<R> Converted(const Source& A) {
  std::vector<R> result(A.size());
  for (std::size_t i = 0; i < A.size(); ++i) {
    result[i] = static_cast<ValueOf<R>>(static_cast<ValueOf<typename Source::value_type>>(A[i]));
  }
  return result;
}

}  // namespace

template <detail::BuildableElement T>
void SquareVector(std::vector<T>& V) {
  detail::RequireElements(V);
  detail::ApplyInPlace(V, [](ValueOf<T> x) { return ElementRules<T>::Square(x); });
}

// The checked float transforms: Name applies Fn to every element once every element passes
// the predicate Passes, else raises Ident.
#define TOVRIN_DEFINE_FLOAT_TRANSFORM(Name, Passes, Ident, Fn) \
  template <detail::FloatElement T>                            \
  void Name(std::vector<T>& V) {                               \
    CheckedFloatTransform(V, Passes(V), Ident, Fn);            \
  }
TOVRIN_DEFINE_FLOAT_TRANSFORM(SqrtVector, VectorNonNegative, rsVectorNeg,
                              [](Extended x) { return std::sqrt(x); })
TOVRIN_DEFINE_FLOAT_TRANSFORM(InvVector, VectorNonZero, rsVectorZero,
                              [](Extended x) { return 1 / x; })
TOVRIN_DEFINE_FLOAT_TRANSFORM(LnVector, VectorPositive, rsVectorNotPos,
                              [](Extended x) { return std::log(x); })
TOVRIN_DEFINE_FLOAT_TRANSFORM(Log10Vector, VectorPositive, rsVectorNotPos, QENLog10)
TOVRIN_DEFINE_FLOAT_TRANSFORM(Log2Vector, VectorPositive, rsVectorNotPos, QENLog2)
#undef TOVRIN_DEFINE_FLOAT_TRANSFORM

template <detail::SignedElement T>
void LinearTransformVector(std::vector<T>& V, detail::ValueOf<T> M, detail::ValueOf<T> C) {
  detail::RequireElements(V);
  detail::ApplyInPlace(V, [M, C](ValueOf<T> x) { return ElementRules<T>::Linear(x, M, C); });
}

template <detail::FloatElement T>
void TransformVector(std::vector<T>& V, const detail::TransformFuncOf<T>& Func) {
  detail::RequireElements(V);
  if (!Func) detail::RaiseMathError(rsInvalidValue);  // an empty function, before any write
  detail::ApplyInPlace(V, [&Func](ValueOf<T> x) { return Func(x); });
}

template <detail::AnyOrMoneyElement T>
void FillVector(std::vector<T>& V, detail::ValueOf<T> Value) {
  detail::FillElements(V, Value);
}

template <detail::AnyOrMoneyElement T>
void ClearVector(std::vector<T>& V) {
  detail::ClearElements(V);
}

// Each window is summed afresh, in index order; a window longer than V is rejected rather
// than read past the end.
template <detail::FloatElement T>
std::vector<T> MovingAverage(const std::vector<T>& V, LongWord Window, LongWord Offset) {
  detail::RequireElements(V);
  if (Window == 0) detail::RaiseMathError(rsValueNotZero);
  if (Window > V.size()) detail::RaiseMathError(rsInvalidValue);
  if (Offset >= Window) Offset = Window - 1;
  std::vector<T> result(V.size());
  for (std::size_t i = 0; i + Window <= V.size(); ++i) {
    Extended sum = 0;
    for (std::size_t k = i; k < i + Window; ++k) sum += Extended(V[k]);
    result[i + Offset] = static_cast<ValueOf<T>>(sum / Window);
  }
  return result;
}

template <detail::AnyOrMoneyElement T>
std::vector<T> ReverseVector(const std::vector<T>& V) {
  return detail::Reversed(V);
}

template <detail::AnyOrMoneyElement T>
std::vector<T> CopyVector(const std::vector<T>& V) {
  return detail::CopyOf(V);
}

TOVRIN_DEFINE_VECTOR_COMBINATIONS(detail::ArithmeticElement, ElementRules)

template <detail::BuildableElement T>
detail::SumOf<T> DotProdVectors(const std::vector<T>& V1, const std::vector<T>& V2) {
  return PairedSum(V1, V2, ElementRules<T>::Product);
}

template <detail::BuildableElement T>
detail::SumOf<T> SumSqDiffVectors(const std::vector<T>& V1, const std::vector<T>& V2) {
  return PairedSum(V1, V2, ElementRules<T>::SquaredDifference);
}

// Squares summed in Extended, integers converted first, so nothing wraps.
template <detail::AnyElement T>
Extended VectorMagnitude(const std::vector<T>& V) {
  Extended sum = 0;
  for (const T& e : V) {
    const Extended x = static_cast<ValueOf<T>>(e);
    sum += x * x;
  }
  return std::sqrt(sum);
}

// The magnitudes are tested before the lengths, which DotProdVectors checks.
template <detail::BuildableElement T>
Extended AngleBetweenVectors(const std::vector<T>& V1, const std::vector<T>& V2) {
  const Extended m1 = VectorMagnitude(V1);
  const Extended m2 = VectorMagnitude(V2);
  if (m1 == 0 || m2 == 0) detail::RaiseMathError(rsMagZero);
  const Extended d = static_cast<Extended>(DotProdVectors(V1, V2));
  return QENArcCos(d / (m2 * m1));
}

template <typename T>
requires detail::AnyElement<detail::StoredElementOf<T>> TQENFloatVector
Array2FloatVector(std::span<const T> A) {
  return Converted<PackedExtended>(A);
}

template <detail::AnyElement T>
TQENFloatVector Vector2FloatVector(const std::vector<T>& V) {
  return Converted<PackedExtended>(V);
}

// The integer conversions: Array2NameVector and Vector2NameVector into TQENNameVector, of
// element type To, from the types of Concept.
#define TOVRIN_DEFINE_CONVERSIONS(Concept, Name, To)                  \
  template <Concept T>                                                \
  TQEN##Name##Vector Array2##Name##Vector(std::span<const T> A) {     \
    return Converted<To>(A);                                          \
  }                                                                   \
  template <Concept T>                                                \
  TQEN##Name##Vector Vector2##Name##Vector(const std::vector<T>& V) { \
    return Converted<To>(V);                                          \
  }
TOVRIN_DEFINE_CONVERSIONS(detail::IntegerElement, Int64, Int64)
TOVRIN_DEFINE_CONVERSIONS(detail::LongIntSourceElement, LInt, LongInt)
#undef TOVRIN_DEFINE_CONVERSIONS

using detail::SumOf;

#define TOVRIN_INSTANTIATE(T)                                   \
  template void FillVector(std::vector<T>&, ValueOf<T>);        \
  template void ClearVector(std::vector<T>&);                   \
  template std::vector<T> ReverseVector(const std::vector<T>&); \
  template std::vector<T> CopyVector(const std::vector<T>&);
TOVRIN_ALL_AND_MONEY_ELEMENTS(TOVRIN_INSTANTIATE)
#undef TOVRIN_INSTANTIATE

#define TOVRIN_INSTANTIATE(T)                                              \
  template Extended VectorMagnitude(const std::vector<T>&);                \
  template TQENFloatVector Array2FloatVector(std::span<const ValueOf<T>>); \
  template TQENFloatVector Vector2FloatVector(const std::vector<T>&);
TOVRIN_ALL_ELEMENTS(TOVRIN_INSTANTIATE)
#undef TOVRIN_INSTANTIATE

#define TOVRIN_INSTANTIATE(T)                                                       \
  template void SquareVector(std::vector<T>&);                                      \
  template SumOf<T> DotProdVectors(const std::vector<T>&, const std::vector<T>&);   \
  template SumOf<T> SumSqDiffVectors(const std::vector<T>&, const std::vector<T>&); \
  template Extended AngleBetweenVectors(const std::vector<T>&, const std::vector<T>&);
TOVRIN_BUILDABLE_ELEMENTS(TOVRIN_INSTANTIATE)
#undef TOVRIN_INSTANTIATE

#define TOVRIN_INSTANTIATE(T) TOVRIN_INSTANTIATE_VECTOR_COMBINATIONS(T)
TOVRIN_ARITHMETIC_ELEMENTS(TOVRIN_INSTANTIATE)
#undef TOVRIN_INSTANTIATE

#define TOVRIN_INSTANTIATE(T) \
  template void LinearTransformVector(std::vector<T>&, ValueOf<T>, ValueOf<T>);
TOVRIN_SIGNED_ELEMENTS(TOVRIN_INSTANTIATE)
#undef TOVRIN_INSTANTIATE

#define TOVRIN_INSTANTIATE(T)                                                        \
  template void SqrtVector(std::vector<T>&);                                         \
  template void InvVector(std::vector<T>&);                                          \
  template void LnVector(std::vector<T>&);                                           \
  template void Log10Vector(std::vector<T>&);                                        \
  template void Log2Vector(std::vector<T>&);                                         \
  template void TransformVector(std::vector<T>&, const detail::TransformFuncOf<T>&); \
  template std::vector<T> MovingAverage(const std::vector<T>&, LongWord, LongWord);
TOVRIN_FLOAT_ELEMENTS(TOVRIN_INSTANTIATE)
#undef TOVRIN_INSTANTIATE

#define TOVRIN_INSTANTIATE(T)                                     \
  template TQENInt64Vector Array2Int64Vector(std::span<const T>); \
  template TQENInt64Vector Vector2Int64Vector(const std::vector<T>&);
TOVRIN_INTEGER_ELEMENTS(TOVRIN_INSTANTIATE)
#undef TOVRIN_INSTANTIATE

#define TOVRIN_INSTANTIATE(T)                                   \
  template TQENLIntVector Array2LIntVector(std::span<const T>); \
  template TQENLIntVector Vector2LIntVector(const std::vector<T>&);
TOVRIN_LONGINT_SOURCE_ELEMENTS(TOVRIN_INSTANTIATE)
#undef TOVRIN_INSTANTIATE

// Powers are built one multiplication at a time, deliberately not by Horner's scheme, so
// that results match the term-by-term sum to the last bit.
Extended QENPolynomial(const TQENFloatVector& Coeffs, Extended X) {
  if (Coeffs.empty()) return 0;
  Extended result = Coeffs[0];
  Extended power = 1;
  for (std::size_t k = 1; k < Coeffs.size(); ++k) {
    power *= X;
    result += Extended(Coeffs[k]) * power;
  }
  return result;
}

}  // namespace tovrin
