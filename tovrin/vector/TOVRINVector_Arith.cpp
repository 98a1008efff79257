// Arithmetic, transforms, two-vector operations, conversions and polynomials of the vector
// unit.
#include <cmath>
#include <cstddef>
#include <span>
#include <type_traits>

#include "tovrin/foundation/detail/ElementRules.h"
#include "tovrin/vector/TOVRINVector.h"
#include "tovrin/vector/detail/VectorAlgorithms.h"

namespace tovrin {
namespace {

using detail::kIsFloatElement;
using detail::ValueOf;

// x * x stored back in the element type: rounded from Extended for floats, the low 64 bits
// for Int64, the low 32 bits for LongInt and LongWord.
template <typename T>
ValueOf<T> SquareInPlace(ValueOf<T> x) {
  if constexpr (kIsFloatElement<T>) {
    return static_cast<ValueOf<T>>(Extended(x) * Extended(x));
  } else if constexpr (std::is_same_v<T, Int64>) {
    return detail::WrappingMul64(x, x);
  } else if constexpr (std::is_same_v<T, LongWord>) {
    return static_cast<LongWord>(detail::WrappingSquareU32(x));
  } else {
    static_assert(std::is_same_v<T, LongInt>);
    return static_cast<LongInt>(detail::WrappingSquare32(x));
  }
}

template <typename T>
void SquareElements(std::vector<T>& V) {
  detail::RequireElements(V);
  detail::ApplyInPlace(V, [](ValueOf<T> x) { return SquareInPlace<T>(x); });
}

// An element-wise float function applied in Extended after the whole-vector check `valid`
// (one of the sign predicates, which raises rsVectorIsEmpty itself) has passed.
template <typename T, typename Valid, typename F>
void CheckedFloatTransform(std::vector<T>& V, Valid valid, TResStringId failure, F f) {
  if (!valid(V)) detail::RaiseMathError(failure);
  detail::ApplyInPlace(V, [&f](ValueOf<T> x) { return static_cast<ValueOf<T>>(f(Extended(x))); });
}

template <typename T>
void LinearTransform(std::vector<T>& V, ValueOf<T> M, ValueOf<T> C) {
  detail::RequireElements(V);
  if constexpr (kIsFloatElement<T>) {
    const Extended m = M;
    const Extended c = C;
    detail::ApplyInPlace(V, [m, c](ValueOf<T> x) { return static_cast<ValueOf<T>>(m * x + c); });
  } else {
    static_assert(std::is_same_v<T, Int64>);
    detail::ApplyInPlace(
        V, [M, C](Int64 x) { return detail::WrappingAdd64(detail::WrappingMul64(M, x), C); });
  }
}

template <typename T, typename Func>
void TransformElements(std::vector<T>& V, const Func& F) {
  detail::RequireElements(V);
  if (!F) detail::RaiseMathError(rsInvalidValue);  // an empty function, before any write
  detail::ApplyInPlace(V, [&F](ValueOf<T> x) { return F(x); });
}

// Each window is summed afresh, in index order; a window longer than V is rejected rather
// than read past the end.
template <typename T>
std::vector<T> WindowAverages(const std::vector<T>& V, LongWord Window, LongWord Offset) {
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

// Sums and differences stored in the element type: rounded from Extended for floats,
// wrapping in the element's width for integers.
template <typename T>
ValueOf<T> ElementSum(ValueOf<T> a, ValueOf<T> b) {
  if constexpr (kIsFloatElement<T>) {
    return static_cast<ValueOf<T>>(Extended(a) + Extended(b));
  } else if constexpr (std::is_same_v<T, Int64>) {
    return detail::WrappingAdd64(a, b);
  } else {
    static_assert(std::is_same_v<T, LongInt>);
    return static_cast<LongInt>(static_cast<LongWord>(a) + static_cast<LongWord>(b));
  }
}

template <typename T>
ValueOf<T> ElementDifference(ValueOf<T> a, ValueOf<T> b) {
  if constexpr (kIsFloatElement<T>) {
    return static_cast<ValueOf<T>>(Extended(a) - Extended(b));
  } else if constexpr (std::is_same_v<T, Int64>) {
    return detail::WrappingSub64(a, b);
  } else {
    static_assert(std::is_same_v<T, LongInt>);
    return detail::WrappingSub32(a, b);
  }
}

// The sum from 0 over i of term(V1[i], V2[i]) in index order, after the length and then the
// emptiness check: in Extended for floats, in a wrapping Int64 for integers.
template <typename T, typename Term>
auto PairedSum(const std::vector<T>& V1, const std::vector<T>& V2, Term term) {
  detail::RequireSameLength(V1, V2);
  detail::RequireElements(V1);
  using Sum = std::conditional_t<kIsFloatElement<T>, Extended, Int64>;
  Sum sum = 0;
  for (std::size_t i = 0; i < V1.size(); ++i) {
    const Sum t = term(static_cast<ValueOf<T>>(V1[i]), static_cast<ValueOf<T>>(V2[i]));
    if constexpr (kIsFloatElement<T>) {
      sum += t;
    } else {
      sum = detail::WrappingAdd64(sum, t);
    }
  }
  return sum;
}

// Products of DotProdVectors: Extended for floats, 64-bit wrapping for Int64, the low 32 bits
// taken signed for LongInt and unsigned for LongWord.
template <typename T>
auto ProductTerm(ValueOf<T> a, ValueOf<T> b) {
  if constexpr (kIsFloatElement<T>) {
    return Extended(a) * Extended(b);
  } else if constexpr (std::is_same_v<T, Int64>) {
    return detail::WrappingMul64(a, b);
  } else if constexpr (std::is_same_v<T, LongWord>) {
    return static_cast<Int64>(static_cast<LongWord>(static_cast<std::uint64_t>(a) * b));
  } else {
    static_assert(std::is_same_v<T, LongInt>);
    return static_cast<Int64>(
        static_cast<LongInt>(static_cast<LongWord>(a) * static_cast<LongWord>(b)));
  }
}

// Squared differences of SumSqDiffVectors: Extended for floats; integers widened to Int64
// (with sign or zero extension), then a 64-bit wrapping difference and square.
template <typename T>
auto SquaredDifferenceTerm(ValueOf<T> a, ValueOf<T> b) {
  if constexpr (kIsFloatElement<T>) {
    const Extended d = Extended(a) - Extended(b);
    return d * d;
  } else {
    const Int64 d = detail::WrappingSub64(static_cast<Int64>(a), static_cast<Int64>(b));
    return detail::WrappingMul64(d, d);
  }
}

template <typename T>
Extended Magnitude(const std::vector<T>& V) {
  Extended sum = 0;
  for (const T& e : V) {
    const Extended x = static_cast<ValueOf<T>>(e);
    sum += x * x;
  }
  return std::sqrt(sum);
}

// The magnitudes are tested before the lengths, which DotProdVectors checks.
template <typename T>
Extended Angle(const std::vector<T>& V1, const std::vector<T>& V2) {
  const Extended m1 = Magnitude(V1);
  const Extended m2 = Magnitude(V2);
  if (m1 == 0 || m2 == 0) detail::RaiseMathError(rsMagZero);
  const Extended d = static_cast<Extended>(DotProdVectors(V1, V2));
  return QENArcCos(d / (m2 * m1));
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

void SquareVector(TQENFloatVector& V) { SquareElements(V); }
void SquareVector(TQENDoubleVector& V) { SquareElements(V); }
void SquareVector(TQENSingleVector& V) { SquareElements(V); }
void SquareVector(TQENInt64Vector& V) { SquareElements(V); }
void SquareVector(TQENLWordVector& V) { SquareElements(V); }
void SquareVector(TQENLIntVector& V) { SquareElements(V); }

void SqrtVector(TQENFloatVector& V) {
  CheckedFloatTransform(
      V, [](const TQENFloatVector& v) { return VectorNonNegative(v); }, rsVectorNeg,
      [](Extended x) { return std::sqrt(x); });
}
void SqrtVector(TQENDoubleVector& V) {
  CheckedFloatTransform(
      V, [](const TQENDoubleVector& v) { return VectorNonNegative(v); }, rsVectorNeg,
      [](Extended x) { return std::sqrt(x); });
}
void SqrtVector(TQENSingleVector& V) {
  CheckedFloatTransform(
      V, [](const TQENSingleVector& v) { return VectorNonNegative(v); }, rsVectorNeg,
      [](Extended x) { return std::sqrt(x); });
}

void InvVector(TQENFloatVector& V) {
  CheckedFloatTransform(
      V, [](const TQENFloatVector& v) { return VectorNonZero(v); }, rsVectorZero,
      [](Extended x) { return 1 / x; });
}
void InvVector(TQENDoubleVector& V) {
  CheckedFloatTransform(
      V, [](const TQENDoubleVector& v) { return VectorNonZero(v); }, rsVectorZero,
      [](Extended x) { return 1 / x; });
}
void InvVector(TQENSingleVector& V) {
  CheckedFloatTransform(
      V, [](const TQENSingleVector& v) { return VectorNonZero(v); }, rsVectorZero,
      [](Extended x) { return 1 / x; });
}

void LnVector(TQENFloatVector& V) {
  CheckedFloatTransform(
      V, [](const TQENFloatVector& v) { return VectorPositive(v); }, rsVectorNotPos,
      [](Extended x) { return std::log(x); });
}
void LnVector(TQENDoubleVector& V) {
  CheckedFloatTransform(
      V, [](const TQENDoubleVector& v) { return VectorPositive(v); }, rsVectorNotPos,
      [](Extended x) { return std::log(x); });
}
void LnVector(TQENSingleVector& V) {
  CheckedFloatTransform(
      V, [](const TQENSingleVector& v) { return VectorPositive(v); }, rsVectorNotPos,
      [](Extended x) { return std::log(x); });
}
void Log10Vector(TQENFloatVector& V) {
  CheckedFloatTransform(
      V, [](const TQENFloatVector& v) { return VectorPositive(v); }, rsVectorNotPos, QENLog10);
}
void Log10Vector(TQENDoubleVector& V) {
  CheckedFloatTransform(
      V, [](const TQENDoubleVector& v) { return VectorPositive(v); }, rsVectorNotPos, QENLog10);
}
void Log10Vector(TQENSingleVector& V) {
  CheckedFloatTransform(
      V, [](const TQENSingleVector& v) { return VectorPositive(v); }, rsVectorNotPos, QENLog10);
}
void Log2Vector(TQENFloatVector& V) {
  CheckedFloatTransform(
      V, [](const TQENFloatVector& v) { return VectorPositive(v); }, rsVectorNotPos, QENLog2);
}
void Log2Vector(TQENDoubleVector& V) {
  CheckedFloatTransform(
      V, [](const TQENDoubleVector& v) { return VectorPositive(v); }, rsVectorNotPos, QENLog2);
}
void Log2Vector(TQENSingleVector& V) {
  CheckedFloatTransform(
      V, [](const TQENSingleVector& v) { return VectorPositive(v); }, rsVectorNotPos, QENLog2);
}

void LinearTransformVector(TQENFloatVector& V, Extended M, Extended C) { LinearTransform(V, M, C); }
void LinearTransformVector(TQENDoubleVector& V, Double M, Double C) { LinearTransform(V, M, C); }
void LinearTransformVector(TQENSingleVector& V, Single M, Single C) { LinearTransform(V, M, C); }
void LinearTransformVector(TQENInt64Vector& V, Int64 M, Int64 C) { LinearTransform(V, M, C); }

void TransformVector(TQENFloatVector& V, const TQENFloatTransformFunc& Func) {
  TransformElements(V, Func);
}
void TransformVector(TQENDoubleVector& V, const TQENDoubleTransformFunc& Func) {
  TransformElements(V, Func);
}
void TransformVector(TQENSingleVector& V, const TQENSingleTransformFunc& Func) {
  TransformElements(V, Func);
}

void FillVector(TQENFloatVector& V, Extended Value) { detail::FillElements(V, Value); }
void FillVector(TQENDoubleVector& V, Double Value) { detail::FillElements(V, Value); }
void FillVector(TQENSingleVector& V, Single Value) { detail::FillElements(V, Value); }
void FillVector(TQENInt64Vector& V, Int64 Value) { detail::FillElements(V, Value); }
void FillVector(TQENLWordVector& V, LongWord Value) { detail::FillElements(V, Value); }
void FillVector(TQENLIntVector& V, LongInt Value) { detail::FillElements(V, Value); }
void FillVector(TQENWordVector& V, Word Value) { detail::FillElements(V, Value); }
void FillVector(TQENSmallIntVector& V, SmallInt Value) { detail::FillElements(V, Value); }
void FillVector(TQENByteVector& V, Byte Value) { detail::FillElements(V, Value); }
void FillVector(TQENSIntVector& V, ShortInt Value) { detail::FillElements(V, Value); }

void ClearVector(TQENFloatVector& V) { detail::ClearElements(V); }
void ClearVector(TQENDoubleVector& V) { detail::ClearElements(V); }
void ClearVector(TQENSingleVector& V) { detail::ClearElements(V); }
void ClearVector(TQENInt64Vector& V) { detail::ClearElements(V); }
void ClearVector(TQENLWordVector& V) { detail::ClearElements(V); }
void ClearVector(TQENLIntVector& V) { detail::ClearElements(V); }
void ClearVector(TQENWordVector& V) { detail::ClearElements(V); }
void ClearVector(TQENSmallIntVector& V) { detail::ClearElements(V); }
void ClearVector(TQENByteVector& V) { detail::ClearElements(V); }
void ClearVector(TQENSIntVector& V) { detail::ClearElements(V); }

TQENFloatVector MovingAverage(const TQENFloatVector& V, LongWord Window, LongWord Offset) {
  return WindowAverages(V, Window, Offset);
}
TQENDoubleVector MovingAverage(const TQENDoubleVector& V, LongWord Window, LongWord Offset) {
  return WindowAverages(V, Window, Offset);
}
TQENSingleVector MovingAverage(const TQENSingleVector& V, LongWord Window, LongWord Offset) {
  return WindowAverages(V, Window, Offset);
}

TQENFloatVector ReverseVector(const TQENFloatVector& V) { return detail::Reversed(V); }
TQENDoubleVector ReverseVector(const TQENDoubleVector& V) { return detail::Reversed(V); }
TQENSingleVector ReverseVector(const TQENSingleVector& V) { return detail::Reversed(V); }
TQENInt64Vector ReverseVector(const TQENInt64Vector& V) { return detail::Reversed(V); }
TQENLWordVector ReverseVector(const TQENLWordVector& V) { return detail::Reversed(V); }
TQENLIntVector ReverseVector(const TQENLIntVector& V) { return detail::Reversed(V); }
TQENWordVector ReverseVector(const TQENWordVector& V) { return detail::Reversed(V); }
TQENSmallIntVector ReverseVector(const TQENSmallIntVector& V) { return detail::Reversed(V); }
TQENByteVector ReverseVector(const TQENByteVector& V) { return detail::Reversed(V); }
TQENSIntVector ReverseVector(const TQENSIntVector& V) { return detail::Reversed(V); }

TQENFloatVector CopyVector(const TQENFloatVector& V) { return detail::CopyOf(V); }
TQENDoubleVector CopyVector(const TQENDoubleVector& V) { return detail::CopyOf(V); }
TQENSingleVector CopyVector(const TQENSingleVector& V) { return detail::CopyOf(V); }
TQENInt64Vector CopyVector(const TQENInt64Vector& V) { return detail::CopyOf(V); }
TQENLWordVector CopyVector(const TQENLWordVector& V) { return detail::CopyOf(V); }
TQENLIntVector CopyVector(const TQENLIntVector& V) { return detail::CopyOf(V); }
TQENWordVector CopyVector(const TQENWordVector& V) { return detail::CopyOf(V); }
TQENSmallIntVector CopyVector(const TQENSmallIntVector& V) { return detail::CopyOf(V); }
TQENByteVector CopyVector(const TQENByteVector& V) { return detail::CopyOf(V); }
TQENSIntVector CopyVector(const TQENSIntVector& V) { return detail::CopyOf(V); }

TQENFloatVector AddVectors(const TQENFloatVector& V1, const TQENFloatVector& V2) {
  return detail::Combined(V1, V2, ElementSum<TQENFloatVector::value_type>);
}
TQENDoubleVector AddVectors(const TQENDoubleVector& V1, const TQENDoubleVector& V2) {
  return detail::Combined(V1, V2, ElementSum<TQENDoubleVector::value_type>);
}
TQENSingleVector AddVectors(const TQENSingleVector& V1, const TQENSingleVector& V2) {
  return detail::Combined(V1, V2, ElementSum<TQENSingleVector::value_type>);
}
TQENInt64Vector AddVectors(const TQENInt64Vector& V1, const TQENInt64Vector& V2) {
  return detail::Combined(V1, V2, ElementSum<TQENInt64Vector::value_type>);
}
TQENLIntVector AddVectors(const TQENLIntVector& V1, const TQENLIntVector& V2) {
  return detail::Combined(V1, V2, ElementSum<TQENLIntVector::value_type>);
}
TQENFloatVector SubtractVectors(const TQENFloatVector& V1, const TQENFloatVector& V2) {
  return detail::Combined(V1, V2, ElementDifference<TQENFloatVector::value_type>);
}
TQENDoubleVector SubtractVectors(const TQENDoubleVector& V1, const TQENDoubleVector& V2) {
  return detail::Combined(V1, V2, ElementDifference<TQENDoubleVector::value_type>);
}
TQENSingleVector SubtractVectors(const TQENSingleVector& V1, const TQENSingleVector& V2) {
  return detail::Combined(V1, V2, ElementDifference<TQENSingleVector::value_type>);
}
TQENInt64Vector SubtractVectors(const TQENInt64Vector& V1, const TQENInt64Vector& V2) {
  return detail::Combined(V1, V2, ElementDifference<TQENInt64Vector::value_type>);
}
TQENLIntVector SubtractVectors(const TQENLIntVector& V1, const TQENLIntVector& V2) {
  return detail::Combined(V1, V2, ElementDifference<TQENLIntVector::value_type>);
}
void AddToVector(TQENFloatVector& V1, const TQENFloatVector& V2) {
  detail::CombineInto(V1, V2, ElementSum<TQENFloatVector::value_type>);
}
void AddToVector(TQENDoubleVector& V1, const TQENDoubleVector& V2) {
  detail::CombineInto(V1, V2, ElementSum<TQENDoubleVector::value_type>);
}
void AddToVector(TQENSingleVector& V1, const TQENSingleVector& V2) {
  detail::CombineInto(V1, V2, ElementSum<TQENSingleVector::value_type>);
}
void AddToVector(TQENInt64Vector& V1, const TQENInt64Vector& V2) {
  detail::CombineInto(V1, V2, ElementSum<TQENInt64Vector::value_type>);
}
void AddToVector(TQENLIntVector& V1, const TQENLIntVector& V2) {
  detail::CombineInto(V1, V2, ElementSum<TQENLIntVector::value_type>);
}
void SubtractFromVector(TQENFloatVector& V1, const TQENFloatVector& V2) {
  detail::CombineInto(V1, V2, ElementDifference<TQENFloatVector::value_type>);
}
void SubtractFromVector(TQENDoubleVector& V1, const TQENDoubleVector& V2) {
  detail::CombineInto(V1, V2, ElementDifference<TQENDoubleVector::value_type>);
}
void SubtractFromVector(TQENSingleVector& V1, const TQENSingleVector& V2) {
  detail::CombineInto(V1, V2, ElementDifference<TQENSingleVector::value_type>);
}
void SubtractFromVector(TQENInt64Vector& V1, const TQENInt64Vector& V2) {
  detail::CombineInto(V1, V2, ElementDifference<TQENInt64Vector::value_type>);
}
void SubtractFromVector(TQENLIntVector& V1, const TQENLIntVector& V2) {
  detail::CombineInto(V1, V2, ElementDifference<TQENLIntVector::value_type>);
}

Extended DotProdVectors(const TQENFloatVector& V1, const TQENFloatVector& V2) {
  return PairedSum(V1, V2, ProductTerm<TQENFloatVector::value_type>);
}
Extended DotProdVectors(const TQENDoubleVector& V1, const TQENDoubleVector& V2) {
  return PairedSum(V1, V2, ProductTerm<TQENDoubleVector::value_type>);
}
Extended DotProdVectors(const TQENSingleVector& V1, const TQENSingleVector& V2) {
  return PairedSum(V1, V2, ProductTerm<TQENSingleVector::value_type>);
}
Int64 DotProdVectors(const TQENInt64Vector& V1, const TQENInt64Vector& V2) {
  return PairedSum(V1, V2, ProductTerm<TQENInt64Vector::value_type>);
}
Int64 DotProdVectors(const TQENLWordVector& V1, const TQENLWordVector& V2) {
  return PairedSum(V1, V2, ProductTerm<TQENLWordVector::value_type>);
}
Int64 DotProdVectors(const TQENLIntVector& V1, const TQENLIntVector& V2) {
  return PairedSum(V1, V2, ProductTerm<TQENLIntVector::value_type>);
}

Extended SumSqDiffVectors(const TQENFloatVector& V1, const TQENFloatVector& V2) {
  return PairedSum(V1, V2, SquaredDifferenceTerm<TQENFloatVector::value_type>);
}
Extended SumSqDiffVectors(const TQENDoubleVector& V1, const TQENDoubleVector& V2) {
  return PairedSum(V1, V2, SquaredDifferenceTerm<TQENDoubleVector::value_type>);
}
Extended SumSqDiffVectors(const TQENSingleVector& V1, const TQENSingleVector& V2) {
  return PairedSum(V1, V2, SquaredDifferenceTerm<TQENSingleVector::value_type>);
}
Int64 SumSqDiffVectors(const TQENInt64Vector& V1, const TQENInt64Vector& V2) {
  return PairedSum(V1, V2, SquaredDifferenceTerm<TQENInt64Vector::value_type>);
}
Int64 SumSqDiffVectors(const TQENLWordVector& V1, const TQENLWordVector& V2) {
  return PairedSum(V1, V2, SquaredDifferenceTerm<TQENLWordVector::value_type>);
}
Int64 SumSqDiffVectors(const TQENLIntVector& V1, const TQENLIntVector& V2) {
  return PairedSum(V1, V2, SquaredDifferenceTerm<TQENLIntVector::value_type>);
}

Extended VectorMagnitude(const TQENFloatVector& V) { return Magnitude(V); }
Extended VectorMagnitude(const TQENDoubleVector& V) { return Magnitude(V); }
Extended VectorMagnitude(const TQENSingleVector& V) { return Magnitude(V); }
Extended VectorMagnitude(const TQENInt64Vector& V) { return Magnitude(V); }
Extended VectorMagnitude(const TQENLWordVector& V) { return Magnitude(V); }
Extended VectorMagnitude(const TQENLIntVector& V) { return Magnitude(V); }
Extended VectorMagnitude(const TQENWordVector& V) { return Magnitude(V); }
Extended VectorMagnitude(const TQENSmallIntVector& V) { return Magnitude(V); }
Extended VectorMagnitude(const TQENByteVector& V) { return Magnitude(V); }
Extended VectorMagnitude(const TQENSIntVector& V) { return Magnitude(V); }

Extended AngleBetweenVectors(const TQENFloatVector& V1, const TQENFloatVector& V2) {
  return Angle(V1, V2);
}
Extended AngleBetweenVectors(const TQENDoubleVector& V1, const TQENDoubleVector& V2) {
  return Angle(V1, V2);
}
Extended AngleBetweenVectors(const TQENSingleVector& V1, const TQENSingleVector& V2) {
  return Angle(V1, V2);
}
Extended AngleBetweenVectors(const TQENInt64Vector& V1, const TQENInt64Vector& V2) {
  return Angle(V1, V2);
}
Extended AngleBetweenVectors(const TQENLWordVector& V1, const TQENLWordVector& V2) {
  return Angle(V1, V2);
}
Extended AngleBetweenVectors(const TQENLIntVector& V1, const TQENLIntVector& V2) {
  return Angle(V1, V2);
}

TQENFloatVector Array2FloatVector(std::span<const Extended> A) {
  return Converted<PackedExtended>(A);
}
TQENFloatVector Array2FloatVector(std::span<const Double> A) {
  return Converted<PackedExtended>(A);
}
TQENFloatVector Array2FloatVector(std::span<const Single> A) {
  return Converted<PackedExtended>(A);
}
TQENFloatVector Array2FloatVector(std::span<const Int64> A) { return Converted<PackedExtended>(A); }
TQENFloatVector Array2FloatVector(std::span<const LongWord> A) {
  return Converted<PackedExtended>(A);
}
TQENFloatVector Array2FloatVector(std::span<const LongInt> A) {
  return Converted<PackedExtended>(A);
}
TQENFloatVector Array2FloatVector(std::span<const Word> A) { return Converted<PackedExtended>(A); }
TQENFloatVector Array2FloatVector(std::span<const SmallInt> A) {
  return Converted<PackedExtended>(A);
}
TQENFloatVector Array2FloatVector(std::span<const Byte> A) { return Converted<PackedExtended>(A); }
TQENFloatVector Array2FloatVector(std::span<const ShortInt> A) {
  return Converted<PackedExtended>(A);
}
TQENFloatVector Vector2FloatVector(const TQENFloatVector& V) {
  return Converted<PackedExtended>(V);
}
TQENFloatVector Vector2FloatVector(const TQENDoubleVector& V) {
  return Converted<PackedExtended>(V);
}
TQENFloatVector Vector2FloatVector(const TQENSingleVector& V) {
  return Converted<PackedExtended>(V);
}
TQENFloatVector Vector2FloatVector(const TQENInt64Vector& V) {
  return Converted<PackedExtended>(V);
}
TQENFloatVector Vector2FloatVector(const TQENLWordVector& V) {
  return Converted<PackedExtended>(V);
}
TQENFloatVector Vector2FloatVector(const TQENLIntVector& V) { return Converted<PackedExtended>(V); }
TQENFloatVector Vector2FloatVector(const TQENWordVector& V) { return Converted<PackedExtended>(V); }
TQENFloatVector Vector2FloatVector(const TQENSmallIntVector& V) {
  return Converted<PackedExtended>(V);
}
TQENFloatVector Vector2FloatVector(const TQENByteVector& V) { return Converted<PackedExtended>(V); }
TQENFloatVector Vector2FloatVector(const TQENSIntVector& V) { return Converted<PackedExtended>(V); }
TQENInt64Vector Array2Int64Vector(std::span<const Int64> A) { return Converted<Int64>(A); }
TQENInt64Vector Array2Int64Vector(std::span<const LongWord> A) { return Converted<Int64>(A); }
TQENInt64Vector Array2Int64Vector(std::span<const LongInt> A) { return Converted<Int64>(A); }
TQENInt64Vector Array2Int64Vector(std::span<const Word> A) { return Converted<Int64>(A); }
TQENInt64Vector Array2Int64Vector(std::span<const SmallInt> A) { return Converted<Int64>(A); }
TQENInt64Vector Array2Int64Vector(std::span<const Byte> A) { return Converted<Int64>(A); }
TQENInt64Vector Array2Int64Vector(std::span<const ShortInt> A) { return Converted<Int64>(A); }
TQENInt64Vector Vector2Int64Vector(const TQENInt64Vector& V) { return Converted<Int64>(V); }
TQENInt64Vector Vector2Int64Vector(const TQENLWordVector& V) { return Converted<Int64>(V); }
TQENInt64Vector Vector2Int64Vector(const TQENLIntVector& V) { return Converted<Int64>(V); }
TQENInt64Vector Vector2Int64Vector(const TQENWordVector& V) { return Converted<Int64>(V); }
TQENInt64Vector Vector2Int64Vector(const TQENSmallIntVector& V) { return Converted<Int64>(V); }
TQENInt64Vector Vector2Int64Vector(const TQENByteVector& V) { return Converted<Int64>(V); }
TQENInt64Vector Vector2Int64Vector(const TQENSIntVector& V) { return Converted<Int64>(V); }
TQENLIntVector Array2LIntVector(std::span<const LongInt> A) { return Converted<LongInt>(A); }
TQENLIntVector Array2LIntVector(std::span<const Word> A) { return Converted<LongInt>(A); }
TQENLIntVector Array2LIntVector(std::span<const SmallInt> A) { return Converted<LongInt>(A); }
TQENLIntVector Array2LIntVector(std::span<const Byte> A) { return Converted<LongInt>(A); }
TQENLIntVector Array2LIntVector(std::span<const ShortInt> A) { return Converted<LongInt>(A); }
TQENLIntVector Vector2LIntVector(const TQENLIntVector& V) { return Converted<LongInt>(V); }
TQENLIntVector Vector2LIntVector(const TQENWordVector& V) { return Converted<LongInt>(V); }
TQENLIntVector Vector2LIntVector(const TQENSmallIntVector& V) { return Converted<LongInt>(V); }
TQENLIntVector Vector2LIntVector(const TQENByteVector& V) { return Converted<LongInt>(V); }
TQENLIntVector Vector2LIntVector(const TQENSIntVector& V) { return Converted<LongInt>(V); }

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
