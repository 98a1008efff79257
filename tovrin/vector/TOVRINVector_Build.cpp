// Building and aggregates of the vector unit.
#include <type_traits>

#include "tovrin/foundation/detail/ElementRules.h"
#include "tovrin/vector/TOVRINVector.h"
#include "tovrin/vector/detail/VectorAlgorithms.h"

namespace tovrin {
namespace {

using detail::kIsFloatElement;
using detail::ValueOf;

// Float sums accumulate in Extended; integer sums in Int64, wrapping modulo 2^64.
template <typename T>
auto SumOf(const std::vector<T>& V) {
  if constexpr (kIsFloatElement<T>) {
    return detail::SumOfTerms(
        V, [](Extended x) { return x; }, [](Extended s, Extended t) { return s + t; });
  } else {
    return detail::SumOfTerms(
        V, [](ValueOf<T> x) { return static_cast<Int64>(x); },
        [](Int64 s, Int64 t) { return detail::WrappingAdd64(s, t); });
  }
}

// How an element's square is formed: in Extended for floats, wrapping in 64 bits for Int64,
// the low 32 bits unsigned for LongWord and signed for every narrower or signed 32-bit type.
template <typename T>
auto SquareTerm(ValueOf<T> x) {
  if constexpr (kIsFloatElement<T>) {
    return Extended(x) * Extended(x);
  } else if constexpr (std::is_same_v<T, Int64>) {
    return detail::WrappingMul64(x, x);
  } else if constexpr (std::is_same_v<T, LongWord>) {
    return detail::WrappingSquareU32(x);
  } else {
    return detail::WrappingSquare32(x);
  }
}

template <typename T>
auto SumOfSquares(const std::vector<T>& V) {
  using Sum = decltype(SquareTerm<T>(ValueOf<T>{}));
  return detail::SumOfTerms(
      V, [](ValueOf<T> x) { return SquareTerm<T>(x); },
      [](Sum s, Sum t) {
        if constexpr (std::is_same_v<Sum, Extended>) {
          return s + t;
        } else {
          return detail::WrappingAdd64(s, t);
        }
      });
}

// (x - Mean)^2 as each overload forms it: in Extended for floats and for an Extended centre;
// otherwise in the element's own width, wrapping (64 bits for Int64, 32 for LongInt and
// LongWord, whose squares then follow SquareTerm).
template <typename T, typename M>
auto DeviationSquare(ValueOf<T> x, M mean) {
  if constexpr (kIsFloatElement<T> || std::is_same_v<M, Extended>) {
    const Extended d = Extended(x) - Extended(mean);
    return d * d;
  } else if constexpr (std::is_same_v<T, Int64>) {
    const Int64 d = detail::WrappingSub64(x, mean);
    return detail::WrappingMul64(d, d);
  } else if constexpr (std::is_same_v<T, LongInt>) {
    return detail::WrappingSquare32(detail::WrappingSub32(x, mean));
  } else {
    static_assert(std::is_same_v<T, LongWord>);
    return detail::WrappingSquareU32(static_cast<LongWord>(x - mean));
  }
}

template <typename T, typename M>
auto SumOfSquaredDeviations(const std::vector<T>& V, M Mean) {
  using Sum = decltype(DeviationSquare<T>(ValueOf<T>{}, Mean));
  return detail::SumOfTerms(
      V, [Mean](ValueOf<T> x) { return DeviationSquare<T>(x, Mean); },
      [](Sum s, Sum t) {
        if constexpr (std::is_same_v<Sum, Extended>) {
          return s + t;
        } else {
          return detail::WrappingAdd64(s, t);
        }
      });
}

enum class Sign { kNonNegative, kNegative, kNonZero, kZero, kNonPositive, kPositive };

// Whether one element passes a sign predicate. Floats go through the tolerance predicates,
// except the Single non-zero test, which is exact; Int64 compares exactly, except its
// non-zero test, which asks FloatIsZero of the widened element.
template <Sign S, typename T>
bool ElementIs(ValueOf<T> x) {
  if constexpr (kIsFloatElement<T>) {
    const Extended e = x;
    if constexpr (S == Sign::kNonNegative) return !FloatIsNegative(e);
    if constexpr (S == Sign::kNegative) return FloatIsNegative(e);
    if constexpr (S == Sign::kNonZero) {
      if constexpr (std::is_same_v<T, Single>) {
        return x != 0;
      } else {
        return !FloatIsZero(e);
      }
    }
    if constexpr (S == Sign::kZero) return !FloatIsNotZero(e);
    if constexpr (S == Sign::kNonPositive) return !FloatIsPositive(e);
    if constexpr (S == Sign::kPositive) return FloatIsPositive(e);
  } else {
    static_assert(std::is_same_v<T, Int64>);
    if constexpr (S == Sign::kNonNegative) return x >= 0;
    if constexpr (S == Sign::kNegative) return x < 0;
    if constexpr (S == Sign::kNonZero) return !FloatIsZero(static_cast<Extended>(x));
    if constexpr (S == Sign::kZero) return x == 0;
    if constexpr (S == Sign::kNonPositive) return x <= 0;
    if constexpr (S == Sign::kPositive) return x > 0;
  }
}

template <Sign S, typename T>
bool EveryElementIs(const std::vector<T>& V) {
  return detail::EveryElement(V, [](ValueOf<T> x) { return ElementIs<S, T>(x); });
}

}  // namespace

void AppendValue2Vector(TQENFloatVector& V, Extended Value) { detail::AppendElement(V, Value); }
void AppendValue2Vector(TQENDoubleVector& V, Double Value) { detail::AppendElement(V, Value); }
void AppendValue2Vector(TQENSingleVector& V, Single Value) { detail::AppendElement(V, Value); }
void AppendValue2Vector(TQENInt64Vector& V, Int64 Value) { detail::AppendElement(V, Value); }
void AppendValue2Vector(TQENLWordVector& V, LongWord Value) { detail::AppendElement(V, Value); }
void AppendValue2Vector(TQENLIntVector& V, LongInt Value) { detail::AppendElement(V, Value); }

void AddValue2Vector(TQENFloatVector& V, Extended Value, LongInt Index) {
  detail::InsertElement(V, Value, Index);
}
void AddValue2Vector(TQENDoubleVector& V, Double Value, LongInt Index) {
  detail::InsertElement(V, Value, Index);
}
void AddValue2Vector(TQENSingleVector& V, Single Value, LongInt Index) {
  detail::InsertElement(V, Value, Index);
}
void AddValue2Vector(TQENInt64Vector& V, Int64 Value, LongInt Index) {
  detail::InsertElement(V, Value, Index);
}
void AddValue2Vector(TQENLWordVector& V, LongWord Value, LongInt Index) {
  detail::InsertElement(V, Value, Index);
}
void AddValue2Vector(TQENLIntVector& V, LongInt Value, LongInt Index) {
  detail::InsertElement(V, Value, Index);
}

void DeleteValueFromVector(TQENFloatVector& V, LongInt Index) { detail::DeleteElement(V, Index); }
void DeleteValueFromVector(TQENDoubleVector& V, LongInt Index) { detail::DeleteElement(V, Index); }
void DeleteValueFromVector(TQENSingleVector& V, LongInt Index) { detail::DeleteElement(V, Index); }
void DeleteValueFromVector(TQENInt64Vector& V, LongInt Index) { detail::DeleteElement(V, Index); }
void DeleteValueFromVector(TQENLWordVector& V, LongInt Index) { detail::DeleteElement(V, Index); }
void DeleteValueFromVector(TQENLIntVector& V, LongInt Index) { detail::DeleteElement(V, Index); }

Extended MaxVector(const TQENFloatVector& V) { return detail::LargestElement(V); }
Double MaxVector(const TQENDoubleVector& V) { return detail::LargestElement(V); }
Single MaxVector(const TQENSingleVector& V) { return detail::LargestElement(V); }
Int64 MaxVector(const TQENInt64Vector& V) { return detail::LargestElement(V); }
LongWord MaxVector(const TQENLWordVector& V) { return detail::LargestElement(V); }
LongInt MaxVector(const TQENLIntVector& V) { return detail::LargestElement(V); }
Word MaxVector(const TQENWordVector& V) { return detail::LargestElement(V); }
SmallInt MaxVector(const TQENSmallIntVector& V) { return detail::LargestElement(V); }
Byte MaxVector(const TQENByteVector& V) { return detail::LargestElement(V); }
ShortInt MaxVector(const TQENSIntVector& V) { return detail::LargestElement(V); }

Extended MinVector(const TQENFloatVector& V) { return detail::SmallestElement(V); }
Double MinVector(const TQENDoubleVector& V) { return detail::SmallestElement(V); }
Single MinVector(const TQENSingleVector& V) { return detail::SmallestElement(V); }
Int64 MinVector(const TQENInt64Vector& V) { return detail::SmallestElement(V); }
LongWord MinVector(const TQENLWordVector& V) { return detail::SmallestElement(V); }
LongInt MinVector(const TQENLIntVector& V) { return detail::SmallestElement(V); }
Word MinVector(const TQENWordVector& V) { return detail::SmallestElement(V); }
SmallInt MinVector(const TQENSmallIntVector& V) { return detail::SmallestElement(V); }
Byte MinVector(const TQENByteVector& V) { return detail::SmallestElement(V); }
ShortInt MinVector(const TQENSIntVector& V) { return detail::SmallestElement(V); }

void MinMaxVector(const TQENFloatVector& V, Extended& MinValue, Extended& MaxValue,
                  LongWord& MinIndex, LongWord& MaxIndex, bool& MinUnique, bool& MaxUnique) {
  detail::Extremes(V, MinValue, MaxValue, MinIndex, MaxIndex, MinUnique, MaxUnique);
}
void MinMaxVector(const TQENDoubleVector& V, Double& MinValue, Double& MaxValue, LongWord& MinIndex,
                  LongWord& MaxIndex, bool& MinUnique, bool& MaxUnique) {
  detail::Extremes(V, MinValue, MaxValue, MinIndex, MaxIndex, MinUnique, MaxUnique);
}
void MinMaxVector(const TQENSingleVector& V, Single& MinValue, Single& MaxValue, LongWord& MinIndex,
                  LongWord& MaxIndex, bool& MinUnique, bool& MaxUnique) {
  detail::Extremes(V, MinValue, MaxValue, MinIndex, MaxIndex, MinUnique, MaxUnique);
}
void MinMaxVector(const TQENInt64Vector& V, Int64& MinValue, Int64& MaxValue, LongWord& MinIndex,
                  LongWord& MaxIndex, bool& MinUnique, bool& MaxUnique) {
  detail::Extremes(V, MinValue, MaxValue, MinIndex, MaxIndex, MinUnique, MaxUnique);
}
void MinMaxVector(const TQENLWordVector& V, LongWord& MinValue, LongWord& MaxValue,
                  LongWord& MinIndex, LongWord& MaxIndex, bool& MinUnique, bool& MaxUnique) {
  detail::Extremes(V, MinValue, MaxValue, MinIndex, MaxIndex, MinUnique, MaxUnique);
}
void MinMaxVector(const TQENLIntVector& V, LongInt& MinValue, LongInt& MaxValue, LongWord& MinIndex,
                  LongWord& MaxIndex, bool& MinUnique, bool& MaxUnique) {
  detail::Extremes(V, MinValue, MaxValue, MinIndex, MaxIndex, MinUnique, MaxUnique);
}
void MinMaxVector(const TQENWordVector& V, Word& MinValue, Word& MaxValue, LongWord& MinIndex,
                  LongWord& MaxIndex, bool& MinUnique, bool& MaxUnique) {
  detail::Extremes(V, MinValue, MaxValue, MinIndex, MaxIndex, MinUnique, MaxUnique);
}
void MinMaxVector(const TQENSmallIntVector& V, SmallInt& MinValue, SmallInt& MaxValue,
                  LongWord& MinIndex, LongWord& MaxIndex, bool& MinUnique, bool& MaxUnique) {
  detail::Extremes(V, MinValue, MaxValue, MinIndex, MaxIndex, MinUnique, MaxUnique);
}
void MinMaxVector(const TQENByteVector& V, Byte& MinValue, Byte& MaxValue, LongWord& MinIndex,
                  LongWord& MaxIndex, bool& MinUnique, bool& MaxUnique) {
  detail::Extremes(V, MinValue, MaxValue, MinIndex, MaxIndex, MinUnique, MaxUnique);
}
void MinMaxVector(const TQENSIntVector& V, ShortInt& MinValue, ShortInt& MaxValue,
                  LongWord& MinIndex, LongWord& MaxIndex, bool& MinUnique, bool& MaxUnique) {
  detail::Extremes(V, MinValue, MaxValue, MinIndex, MaxIndex, MinUnique, MaxUnique);
}

Extended SumVector(const TQENFloatVector& V) { return SumOf(V); }
Extended SumVector(const TQENDoubleVector& V) { return SumOf(V); }
Extended SumVector(const TQENSingleVector& V) { return SumOf(V); }
Int64 SumVector(const TQENInt64Vector& V) { return SumOf(V); }
Int64 SumVector(const TQENLWordVector& V) { return SumOf(V); }
Int64 SumVector(const TQENLIntVector& V) { return SumOf(V); }
Int64 SumVector(const TQENWordVector& V) { return SumOf(V); }
Int64 SumVector(const TQENSmallIntVector& V) { return SumOf(V); }
Int64 SumVector(const TQENByteVector& V) { return SumOf(V); }
Int64 SumVector(const TQENSIntVector& V) { return SumOf(V); }

Extended SumSqVector(const TQENFloatVector& V) { return SumOfSquares(V); }
Extended SumSqVector(const TQENDoubleVector& V) { return SumOfSquares(V); }
Extended SumSqVector(const TQENSingleVector& V) { return SumOfSquares(V); }
Int64 SumSqVector(const TQENInt64Vector& V) { return SumOfSquares(V); }
Int64 SumSqVector(const TQENLWordVector& V) { return SumOfSquares(V); }
Int64 SumSqVector(const TQENLIntVector& V) { return SumOfSquares(V); }
Int64 SumSqVector(const TQENWordVector& V) { return SumOfSquares(V); }
Int64 SumSqVector(const TQENSmallIntVector& V) { return SumOfSquares(V); }
Int64 SumSqVector(const TQENByteVector& V) { return SumOfSquares(V); }
Int64 SumSqVector(const TQENSIntVector& V) { return SumOfSquares(V); }

Extended SumSqDiffVector(const TQENFloatVector& V, Extended Mean) {
  return SumOfSquaredDeviations(V, Mean);
}
Extended SumSqDiffVector(const TQENDoubleVector& V, Double Mean) {
  return SumOfSquaredDeviations(V, Mean);
}
Extended SumSqDiffVector(const TQENSingleVector& V, Single Mean) {
  return SumOfSquaredDeviations(V, Mean);
}
Int64 SumSqDiffVector(const TQENInt64Vector& V, Int64 Mean) {
  return SumOfSquaredDeviations(V, Mean);
}
Int64 SumSqDiffVector(const TQENLWordVector& V, LongWord Mean) {
  return SumOfSquaredDeviations(V, Mean);
}
Int64 SumSqDiffVector(const TQENLIntVector& V, LongInt Mean) {
  return SumOfSquaredDeviations(V, Mean);
}
Extended SumSqDiffVector(const TQENInt64Vector& V, Extended Mean) {
  return SumOfSquaredDeviations(V, Mean);
}
Extended SumSqDiffVector(const TQENLWordVector& V, Extended Mean) {
  return SumOfSquaredDeviations(V, Mean);
}
Extended SumSqDiffVector(const TQENLIntVector& V, Extended Mean) {
  return SumOfSquaredDeviations(V, Mean);
}

bool VectorNonNegative(const TQENFloatVector& V) { return EveryElementIs<Sign::kNonNegative>(V); }
bool VectorNonNegative(const TQENDoubleVector& V) { return EveryElementIs<Sign::kNonNegative>(V); }
bool VectorNonNegative(const TQENSingleVector& V) { return EveryElementIs<Sign::kNonNegative>(V); }
bool VectorNonNegative(const TQENInt64Vector& V) { return EveryElementIs<Sign::kNonNegative>(V); }

bool VectorNegative(const TQENFloatVector& V) { return EveryElementIs<Sign::kNegative>(V); }
bool VectorNegative(const TQENDoubleVector& V) { return EveryElementIs<Sign::kNegative>(V); }
bool VectorNegative(const TQENSingleVector& V) { return EveryElementIs<Sign::kNegative>(V); }
bool VectorNegative(const TQENInt64Vector& V) { return EveryElementIs<Sign::kNegative>(V); }

bool VectorNonZero(const TQENFloatVector& V) { return EveryElementIs<Sign::kNonZero>(V); }
bool VectorNonZero(const TQENDoubleVector& V) { return EveryElementIs<Sign::kNonZero>(V); }
bool VectorNonZero(const TQENSingleVector& V) { return EveryElementIs<Sign::kNonZero>(V); }
bool VectorNonZero(const TQENInt64Vector& V) { return EveryElementIs<Sign::kNonZero>(V); }

bool VectorZero(const TQENFloatVector& V) { return EveryElementIs<Sign::kZero>(V); }
bool VectorZero(const TQENDoubleVector& V) { return EveryElementIs<Sign::kZero>(V); }
bool VectorZero(const TQENSingleVector& V) { return EveryElementIs<Sign::kZero>(V); }
bool VectorZero(const TQENInt64Vector& V) { return EveryElementIs<Sign::kZero>(V); }

bool VectorNonPositive(const TQENFloatVector& V) { return EveryElementIs<Sign::kNonPositive>(V); }
bool VectorNonPositive(const TQENDoubleVector& V) { return EveryElementIs<Sign::kNonPositive>(V); }
bool VectorNonPositive(const TQENSingleVector& V) { return EveryElementIs<Sign::kNonPositive>(V); }
bool VectorNonPositive(const TQENInt64Vector& V) { return EveryElementIs<Sign::kNonPositive>(V); }

bool VectorPositive(const TQENFloatVector& V) { return EveryElementIs<Sign::kPositive>(V); }
bool VectorPositive(const TQENDoubleVector& V) { return EveryElementIs<Sign::kPositive>(V); }
bool VectorPositive(const TQENSingleVector& V) { return EveryElementIs<Sign::kPositive>(V); }
bool VectorPositive(const TQENInt64Vector& V) { return EveryElementIs<Sign::kPositive>(V); }

}  // namespace tovrin
