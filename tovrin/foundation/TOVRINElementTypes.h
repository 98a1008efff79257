// The element-type lists of the overloaded families.
//
// Each family of the vector, matrix and statistics units exists for one fixed list of element
// types. Every list is written here once, as a macro that applies X to each stored element
// type in the order of the family tables (PackedExtended stands for the Extended elements of
// a TQENFloatVector). Both the constraints of the public templates (the concepts below) and
// the explicit instantiations in the sources are generated from these lists, so a family
// exists for exactly the types of its list and for no other: a call with an unlisted type
// does not compile.
#pragma once

#include <concepts>
#include <type_traits>
#include <vector>

#include "tovrin/foundation/TOVRINGlobals.h"

// Extended, Double, Single.
#define TOVRIN_FLOAT_ELEMENTS(X) X(PackedExtended) X(Double) X(Single)
// The floats and Int64: the sign predicates and the vector linear transform.
#define TOVRIN_SIGNED_ELEMENTS(X) TOVRIN_FLOAT_ELEMENTS(X) X(Int64)
// The floats, Int64 and LongInt: element-wise sums, differences and scaling.
#define TOVRIN_ARITHMETIC_ELEMENTS(X) TOVRIN_SIGNED_ELEMENTS(X) X(LongInt)
// The six buildable types: the floats, Int64, LongWord and LongInt.
#define TOVRIN_BUILDABLE_ELEMENTS(X) TOVRIN_SIGNED_ELEMENTS(X) X(LongWord) X(LongInt)
// All ten element types.
#define TOVRIN_ALL_ELEMENTS(X) TOVRIN_BUILDABLE_ELEMENTS(X) X(Word) X(SmallInt) X(Byte) X(ShortInt)
// Int64, LongWord and LongInt: the integer samples of the statistics.
#define TOVRIN_WIDE_INTEGER_ELEMENTS(X) X(Int64) X(LongWord) X(LongInt)
// The seven integer types: the sources of the conversions to Int64.
#define TOVRIN_INTEGER_ELEMENTS(X) \
  TOVRIN_WIDE_INTEGER_ELEMENTS(X) X(Word) X(SmallInt) X(Byte) X(ShortInt)
// The integer types no wider than LongInt: the sources of the conversions to LongInt.
#define TOVRIN_LONGINT_SOURCE_ELEMENTS(X) X(LongInt) X(Word) X(SmallInt) X(Byte) X(ShortInt)
// The row and column sums: all ten but LongInt.
#define TOVRIN_ROW_SUM_ELEMENTS(X) \
  TOVRIN_SIGNED_ELEMENTS(X) X(LongWord) X(Word) X(SmallInt) X(Byte) X(ShortInt)
// The three money types: TQENCurrency, TQENLongCurrency and Currency.
#define TOVRIN_MONEY_ELEMENTS(X) X(TQENCurrency) X(TQENLongCurrency) X(Currency)
// The ten and the three money types: the families that only move, compare and copy elements
// (extremes, fills, copies, the quick sort, the matrix shape queries and row and column moves).
#define TOVRIN_ALL_AND_MONEY_ELEMENTS(X) TOVRIN_ALL_ELEMENTS(X) TOVRIN_MONEY_ELEMENTS(X)
// The six buildable and the three money types: appending, inserting and deleting elements.
#define TOVRIN_BUILDABLE_AND_MONEY_ELEMENTS(X) TOVRIN_BUILDABLE_ELEMENTS(X) TOVRIN_MONEY_ELEMENTS(X)

namespace tovrin::detail {

#define TOVRIN_DETAIL_OR_IS(E) || std::is_same_v<T, E>

template <typename T>
concept FloatElement = false TOVRIN_FLOAT_ELEMENTS(TOVRIN_DETAIL_OR_IS);
template <typename T>
concept SignedElement = false TOVRIN_SIGNED_ELEMENTS(TOVRIN_DETAIL_OR_IS);
template <typename T>
concept ArithmeticElement = false TOVRIN_ARITHMETIC_ELEMENTS(TOVRIN_DETAIL_OR_IS);
template <typename T>
concept BuildableElement = false TOVRIN_BUILDABLE_ELEMENTS(TOVRIN_DETAIL_OR_IS);
template <typename T>
concept AnyElement = false TOVRIN_ALL_ELEMENTS(TOVRIN_DETAIL_OR_IS);
template <typename T>
concept WideIntegerElement = false TOVRIN_WIDE_INTEGER_ELEMENTS(TOVRIN_DETAIL_OR_IS);
template <typename T>
concept IntegerElement = false TOVRIN_INTEGER_ELEMENTS(TOVRIN_DETAIL_OR_IS);
template <typename T>
concept LongIntSourceElement = false TOVRIN_LONGINT_SOURCE_ELEMENTS(TOVRIN_DETAIL_OR_IS);
template <typename T>
concept RowSumElement = false TOVRIN_ROW_SUM_ELEMENTS(TOVRIN_DETAIL_OR_IS);
template <typename T>
concept MoneyElement = false TOVRIN_MONEY_ELEMENTS(TOVRIN_DETAIL_OR_IS);
template <typename T>
concept AnyOrMoneyElement = false TOVRIN_ALL_AND_MONEY_ELEMENTS(TOVRIN_DETAIL_OR_IS);
template <typename T>
concept BuildableOrMoneyElement = false TOVRIN_BUILDABLE_AND_MONEY_ELEMENTS(TOVRIN_DETAIL_OR_IS);

#undef TOVRIN_DETAIL_OR_IS

// The stored element type as arithmetic sees it: PackedExtended reads as Extended.
template <typename T>
using ValueOf = std::conditional_t<std::is_same_v<T, PackedExtended>, Extended, T>;

// The stored element type of a value type: Extended is stored as PackedExtended.
template <typename T>
using StoredElementOf = std::conditional_t<std::is_same_v<T, Extended>, PackedExtended, T>;

template <typename T>
inline constexpr bool kIsFloatElement =
    std::is_same_v<T, PackedExtended> || std::is_floating_point_v<T>;

// The type of a sum of elements: Extended for the floats, a wrapping Int64 for the integers.
template <typename T>
using SumOf = std::conditional_t<kIsFloatElement<T>, Extended, Int64>;

// The constant of the matrix scaling: Extended for the floats, the element type otherwise.
template <typename T>
using ScalarOf = std::conditional_t<kIsFloatElement<T>, Extended, T>;

// A matrix of element type T: a vector of rows that may differ in length.
template <typename T>
using MatrixOf = std::vector<std::vector<T>>;

}  // namespace tovrin::detail
