// Vector building, aggregates, arithmetic, transforms, sorting and ranking.
//
// Every operation is one function template over the element types of its family; the
// constraint of each template names the family's list (foundation/TOVRINElementTypes.h), the
// definitions are instantiated for exactly those types, and no other element type compiles. Three
// shapes occur: queries take `const V&` and return a scalar, in-place operations take `V&` and
// change it, producers return a fresh vector that shares nothing with their operands. Each check
// runs before any work, so a call that raises EMathError leaves its operands exactly as they were.
// A value "of the element type" of a TQENFloatVector is an Extended. Integer sums, products and
// squares wrap silently as stated per family; float work is done in Extended and rounded only when
// stored. The families that only move, compare and copy elements (building, the extremes, fills,
// reversal, copies and the quick sort) also take the three money vectors of TOVRINFinVector.h,
// whose stored integers they compare exactly.
#pragma once

#include <functional>
#include <ranges>
#include <span>
#include <type_traits>
#include <vector>

#include "tovrin/foundation/TOVRINElementTypes.h"
#include "tovrin/foundation/TOVRINFoundation.h"

namespace tovrin {

// Functions applied to every element by TransformVector: a plain function or a lambda taking
// and returning the element type.
using TQENFloatTransformFunc = std::function<Extended(Extended)>;
using TQENDoubleTransformFunc = std::function<Double(Double)>;
using TQENSingleTransformFunc = std::function<Single(Single)>;
namespace detail {
template <typename T>
using TransformFuncOf = std::function<ValueOf<T>(ValueOf<T>)>;
}

// ============================================================================================
// Building
// ============================================================================================

// Appends Value as the new last element.
template <detail::BuildableOrMoneyElement T>
void AppendValue2Vector(std::vector<T>& V, detail::ValueOf<T> Value);

// Inserts Value at position Index, moving the later elements up one place. An Index that is
// not a position of V (negative, at or past the end, any Index on an empty V) appends
// instead; nothing is raised.
template <detail::BuildableOrMoneyElement T>
void AddValue2Vector(std::vector<T>& V, detail::ValueOf<T> Value, LongInt Index);

// Removes the element at position Index. An Index that is not a position of V does nothing;
// removing the only element leaves the empty vector (its storage released).
template <detail::BuildableOrMoneyElement T>
void DeleteValueFromVector(std::vector<T>& V, LongInt Index);

// ============================================================================================
// Aggregates: one pass each; every one raises rsVectorIsEmpty for an empty V
// ============================================================================================

// The largest and the smallest element, compared exactly (no tolerance, also for floats).
template <detail::AnyOrMoneyElement T>
detail::ValueOf<T> MaxVector(const std::vector<T>& V);
template <detail::AnyOrMoneyElement T>
detail::ValueOf<T> MinVector(const std::vector<T>& V);

// Both extremes in one pass: their values, the first positions at which they occur, and
// whether each occurs exactly once. Comparisons are exact. Outputs are written only after
// the emptiness check.
template <detail::AnyOrMoneyElement T>
void MinMaxVector(const std::vector<T>& V, detail::ValueOf<T>& MinValue,
                  detail::ValueOf<T>& MaxValue, LongWord& MinIndex, LongWord& MaxIndex,
                  bool& MinUnique, bool& MaxUnique);

// The sum of the elements in index order: accumulated in Extended for the float types, in a
// wrapping Int64 for the integer types (each element sign- or zero-extended first).
template <detail::AnyElement T>
detail::SumOf<T> SumVector(const std::vector<T>& V);

// The sum of the squared elements in index order. Floats square in Extended; Int64 squares
// wrap modulo 2^64; LongInt, SmallInt, ShortInt, Word and Byte squares are the low 32 bits
// taken as a signed LongInt (65535 squared counts as -131071); LongWord squares are the low
// 32 bits taken unsigned. The terms are summed in a wrapping Int64.
template <detail::AnyElement T>
detail::SumOf<T> SumSqVector(const std::vector<T>& V);

// The sum of (x - Mean)^2 in index order. With a Mean of the element type: floats work in
// Extended; Int64 differences and squares wrap in 64 bits; LongInt and LongWord differences
// wrap in 32 bits and square as SumSqVector does (3 - 5 is 4294967294 for LongWord). With an
// Extended Mean the integer elements are widened and everything is done in Extended. Pass
// the Mean with its exact type: the two integer overloads of a vector type are otherwise
// equally good matches.
template <detail::BuildableElement T>
detail::SumOf<T> SumSqDiffVector(const std::vector<T>& V, detail::ValueOf<T> Mean);
template <detail::WideIntegerElement T>
Extended SumSqDiffVector(const std::vector<T>& V, Extended Mean);

// Sign predicates: True when every element is non-negative, negative, non-zero, zero,
// non-positive or positive; the visit stops at the first element that fails. The float
// overloads test with the tolerance predicates (FloatIsNegative, FloatIsZero, ...), except
// that the Single VectorNonZero compares with 0 exactly. The Int64 overloads compare
// exactly, except that the Int64 VectorNonZero asks FloatIsZero of the widened element.
template <detail::SignedElement T>
bool VectorNonNegative(const std::vector<T>& V);
template <detail::SignedElement T>
bool VectorNegative(const std::vector<T>& V);
template <detail::SignedElement T>
bool VectorNonZero(const std::vector<T>& V);
template <detail::SignedElement T>
bool VectorZero(const std::vector<T>& V);
template <detail::SignedElement T>
bool VectorNonPositive(const std::vector<T>& V);
template <detail::SignedElement T>
bool VectorPositive(const std::vector<T>& V);

// ============================================================================================
// In-place transforms: each checks the whole vector first and leaves it untouched on failure
// ============================================================================================

// V[i] := V[i] * V[i]. Raises rsVectorIsEmpty. Floats square in Extended; Int64 squares keep
// the low 64 bits, LongInt and LongWord squares the low 32 bits.
template <detail::BuildableElement T>
void SquareVector(std::vector<T>& V);

// V[i] := square root of V[i]. Raises rsVectorIsEmpty, then rsVectorNeg unless
// VectorNonNegative(V) (an element negative within the tolerance passes and gives NaN).
template <detail::FloatElement T>
void SqrtVector(std::vector<T>& V);

// V[i] := 1 / V[i]. Raises rsVectorIsEmpty, then rsVectorZero unless VectorNonZero(V).
template <detail::FloatElement T>
void InvVector(std::vector<T>& V);

// V[i] := natural, base-10 and base-2 logarithm of V[i]. Raise rsVectorIsEmpty, then
// rsVectorNotPos unless VectorPositive(V).
template <detail::FloatElement T>
void LnVector(std::vector<T>& V);
template <detail::FloatElement T>
void Log10Vector(std::vector<T>& V);
template <detail::FloatElement T>
void Log2Vector(std::vector<T>& V);

// V[i] := M * V[i] + C. Raises rsVectorIsEmpty. The Int64 overload wraps in 64 bits.
template <detail::SignedElement T>
void LinearTransformVector(std::vector<T>& V, detail::ValueOf<T> M, detail::ValueOf<T> C);

// V[i] := Func(V[i]) in index order. Raises rsVectorIsEmpty, then rsInvalidValue for an empty
// Func (V untouched). What Func returns is stored as
// it is; an exception from Func passes through, the elements before it already transformed.
template <detail::FloatElement T>
void TransformVector(std::vector<T>& V, const detail::TransformFuncOf<T>& Func);

// Every element := Value, or 0; the length is kept (ClearVector does not empty V).
template <detail::AnyOrMoneyElement T>
void FillVector(std::vector<T>& V, detail::ValueOf<T> Value);
template <detail::AnyOrMoneyElement T>
void ClearVector(std::vector<T>& V);

// ============================================================================================
// Producers
// ============================================================================================

// A vector of V's length holding averages of Window consecutive elements: the average of
// V[i], ..., V[i + Window - 1] (each window summed afresh, in Extended) is written at
// i + Offset, Offset being cut to Window - 1; every other position holds 0. Raises
// rsVectorIsEmpty, then rsValueNotZero for Window 0, then rsInvalidValue for a Window longer
// than V.
template <detail::FloatElement T>
std::vector<T> MovingAverage(const std::vector<T>& V, LongWord Window, LongWord Offset);

// The elements of V in reverse order, and an independent copy of V.
template <detail::AnyOrMoneyElement T>
std::vector<T> ReverseVector(const std::vector<T>& V);
template <detail::AnyOrMoneyElement T>
std::vector<T> CopyVector(const std::vector<T>& V);

// ============================================================================================
// Two vectors: each raises rsSameDimensions when the lengths differ
// ============================================================================================

// V1 + V2 and V1 - V2 element by element, as a new vector or into V1. Two empty vectors give
// an empty result. LongInt sums wrap in 32 bits, Int64 sums in 64 bits.
template <detail::ArithmeticElement T>
std::vector<T> AddVectors(const std::vector<T>& V1, const std::vector<T>& V2);
template <detail::ArithmeticElement T>
std::vector<T> SubtractVectors(const std::vector<T>& V1, const std::vector<T>& V2);
template <detail::ArithmeticElement T>
void AddToVector(std::vector<T>& V1, const std::vector<T>& V2);
template <detail::ArithmeticElement T>
void SubtractFromVector(std::vector<T>& V1, const std::vector<T>& V2);

// The sum of V1[i] * V2[i], from 0 in index order. Raises rsSameDimensions, then
// rsVectorIsEmpty. Int64 products wrap in 64 bits; LongInt products are the low 32 bits
// taken signed, LongWord products the low 32 bits taken unsigned; summed in a wrapping Int64.
template <detail::BuildableElement T>
detail::SumOf<T> DotProdVectors(const std::vector<T>& V1, const std::vector<T>& V2);

// The sum of (V1[i] - V2[i])^2, from 0 in index order. Raises rsSameDimensions, then
// rsVectorIsEmpty. The integer elements are widened to 64 bits first (unlike SumSqDiffVector)
// and the differences and squares wrap in 64 bits.
template <detail::BuildableElement T>
detail::SumOf<T> SumSqDiffVectors(const std::vector<T>& V1, const std::vector<T>& V2);

// The Euclidean length, squares summed in Extended (integers converted first, nothing
// wraps). An empty vector has magnitude 0.
template <detail::AnyElement T>
Extended VectorMagnitude(const std::vector<T>& V);

// The angle between V1 and V2 in radians, 0 to pi. Raises rsMagZero when either magnitude is
// exactly 0 (two empty vectors included), and only then rsSameDimensions for unequal lengths.
template <detail::BuildableElement T>
Extended AngleBetweenVectors(const std::vector<T>& V1, const std::vector<T>& V2);

// ============================================================================================
// Conversions: a vector of the source's length, every element converted exactly
// ============================================================================================

// Array2...: from an open array (a span); Vector2...: from a vector. Signed sources are
// sign-extended, unsigned ones zero-extended; only widening conversions are offered.
template <typename T>
requires detail::AnyElement<detail::StoredElementOf<T>> TQENFloatVector
Array2FloatVector(std::span<const T> A);
template <detail::AnyElement T>
TQENFloatVector Vector2FloatVector(const std::vector<T>& V);
template <detail::IntegerElement T>
TQENInt64Vector Array2Int64Vector(std::span<const T> A);
template <detail::IntegerElement T>
TQENInt64Vector Vector2Int64Vector(const std::vector<T>& V);
template <detail::LongIntSourceElement T>
TQENLIntVector Array2LIntVector(std::span<const T> A);
template <detail::LongIntSourceElement T>
TQENLIntVector Vector2LIntVector(const std::vector<T>& V);

namespace detail {
// A contiguous range of a listed element type other than the span itself (a vector, a
// std::array, a C array, a span of non-const elements): it passes as its span, as it would to
// one non-template overload per element type.
template <typename R>
concept ArraySource = std::ranges::contiguous_range<R> && std::ranges::sized_range<R> &&
    !std::is_same_v<std::remove_cvref_t<R>, std::span<const std::ranges::range_value_t<R>>>;
template <typename R>
using ArraySpan = std::span<const std::ranges::range_value_t<R>>;
}  // namespace detail
template <detail::ArraySource R>
requires detail::AnyElement<detail::StoredElementOf<std::ranges::range_value_t<R>>> TQENFloatVector
Array2FloatVector(const R& A) {
  return Array2FloatVector(detail::ArraySpan<R>(A));
}
template <detail::ArraySource R>
requires detail::IntegerElement<std::ranges::range_value_t<R>> TQENInt64Vector
Array2Int64Vector(const R& A) {
  return Array2Int64Vector(detail::ArraySpan<R>(A));
}
template <detail::ArraySource R>
requires detail::LongIntSourceElement<std::ranges::range_value_t<R>> TQENLIntVector
Array2LIntVector(const R& A) {
  return Array2LIntVector(detail::ArraySpan<R>(A));
}

// ============================================================================================
// Polynomial
// ============================================================================================

// Coeffs[0] + Coeffs[1] * X + Coeffs[2] * X^2 + ..., each power built from the previous one
// by one multiplication (not Horner's scheme), in Extended. Empty Coeffs give 0.
Extended QENPolynomial(const TQENFloatVector& Coeffs, Extended X);

// ============================================================================================
// Sorting and ranking
// ============================================================================================

// Sorts V in place, ascending or descending, by exact comparison: a non-recursive quick sort
// with an explicit stack of Round(log2 N) + 2 entries; not stable. Fewer than two elements are
// left alone.
template <detail::AnyOrMoneyElement T>
void QSortVector(std::vector<T>& V, bool Ascending);

// Ranks: the 0-based first position, in a copy of V sorted in the chosen order, of a value
// equal to the one ranked. Equality is SameFloat at the element's own precision for floats,
// exact for integers; ties share the lowest rank of their group, and the rank after a group
// skips its size ([5, 3, 5] ascending ranks as [1, 0, 1]). Computed with one sort and a search
// of the sorted copy (O(N log N)). Nothing is raised.
//
// Vector2RankVector: the rank of every element (an empty V gives an empty result).
// Vector2Rank: the rank of V[Index], or -1 when Index is not a position of V.
// Vector2RankValue: the rank Value would share with its equals in V, or -1 when none is equal.
template <detail::AnyElement T>
TQENLIntVector Vector2RankVector(const std::vector<T>& V, bool Ascending);
template <detail::AnyElement T>
LongInt Vector2Rank(const std::vector<T>& V, LongWord Index, bool Ascending);
template <detail::AnyElement T>
LongInt Vector2RankValue(const std::vector<T>& V, detail::ValueOf<T> Value, bool Ascending);

}  // namespace tovrin
