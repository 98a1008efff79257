// Money vectors: the vector operations over TQENCurrency, TQENLongCurrency and Currency.
//
// Each function has the name, argument order, checks and result shape of its namesake in
// TOVRINVector.h and runs the same algorithm; what differs is the element arithmetic. Stored
// integers are compared, copied and swapped as they are; sums wrap at the stored width (32
// bits for TQENCurrency, 64 for the others) without an error. Every rounding and overflow
// follows the one rule of TOVRINFinancials.h: the Extended result rounded half to even, an
// overflow not reported (wrapped); nothing here raises for a value out of range.
#pragma once

#include "tovrin/currency/TOVRINFinancials.h"
#include "tovrin/foundation/TOVRINElementTypes.h"
#include "tovrin/foundation/TOVRINFoundation.h"
#include "tovrin/vector/TOVRINVector.h"

namespace tovrin {

// --- Building, extremes, fills, copies and the quick sort ---------------------------------------
// AppendValue2Vector, AddValue2Vector, DeleteValueFromVector, MaxVector, MinVector,
// MinMaxVector, FillVector, ClearVector, ReverseVector, CopyVector and QSortVector are the
// templates of TOVRINVector.h, which take the money vectors too: they only move, compare and
// copy elements, comparing stored integers exactly, with the checks stated there.

// --- Aggregates -------------------------------------------------------------------------------
// The sum in the element type: a 32-bit wrapping sum for TQENCurrency, 64-bit for the others.
template <detail::MoneyElement T>
T SumVector(const std::vector<T>& V);

// --- Sign predicates --------------------------------------------------------------------------
// True when every element passes (the visit stops at the first that fails); rsVectorIsEmpty
// for an empty V. TQENCurrency and TQENLongCurrency compare their stored integers exactly with
// 0; Currency tests the amount (stored / 10000) with FloatIsNegative, FloatIsPositive and
// FloatIsZero, so an amount within QENTolerance of 0 counts as zero.
template <detail::MoneyElement T>
bool VectorNonNegative(const std::vector<T>& V);
template <detail::MoneyElement T>
bool VectorNegative(const std::vector<T>& V);
template <detail::MoneyElement T>
bool VectorNonPositive(const std::vector<T>& V);
template <detail::MoneyElement T>
bool VectorNonZero(const std::vector<T>& V);
template <detail::MoneyElement T>
bool VectorZero(const std::vector<T>& V);
template <detail::MoneyElement T>
bool VectorPositive(const std::vector<T>& V);

// --- Arithmetic and transforms ----------------------------------------------------------------
// Element := element x A + B in money terms; rsVectorIsEmpty for an empty V.
// TQENCurrency and TQENLongCurrency: Float2QEN...(Currency2Float(element) x A + B). Currency:
// the stored integer x A + B x 10000. Each rounded half to even, overflow wrapping unreported.
template <detail::MoneyElement T>
void LinearTransformVector(std::vector<T>& V, Extended A, Extended B);
// The amounts as Extended values (Currency2Float of each element).
template <detail::MoneyElement T>
TQENFloatVector Vector2FloatVector(const std::vector<T>& V);
// Element-by-element sums and differences of the stored integers, wrapping at the stored
// width; rsSameDimensions for unequal lengths (two empty vectors are fine).
template <detail::MoneyElement T>
std::vector<T> AddVectors(const std::vector<T>& V1, const std::vector<T>& V2);
template <detail::MoneyElement T>
void AddToVector(std::vector<T>& V1, const std::vector<T>& V2);
template <detail::MoneyElement T>
std::vector<T> SubtractVectors(const std::vector<T>& V1, const std::vector<T>& V2);
template <detail::MoneyElement T>
void SubtractFromVector(std::vector<T>& V1, const std::vector<T>& V2);

// --- Ranking ----------------------------------------------------------------------------------
// 0-based ranks in a sorted copy, ties sharing the lowest rank; -1 for no rank (an Index past
// the end, a Value equal to no element, an empty V). Equality is SameCurrency on the stored
// integers, so two elements are equal exactly when their stored integers are.
template <detail::MoneyElement T>
TQENLIntVector Vector2RankVector(const std::vector<T>& V, bool Ascending);
template <detail::MoneyElement T>
LongInt Vector2Rank(const std::vector<T>& V, LongWord Index, bool Ascending);
template <detail::MoneyElement T>
LongInt Vector2RankValue(const std::vector<T>& V, T Value, bool Ascending);

// --- Conversions between vectors --------------------------------------------------------------
// A vector of the source's length (empty for an empty source, no error). The same type is
// copied; other money types go through the conversion services (QENCurrency2QENLongCurrency
// and the rest); a float vector through Float2QENCurrency and Float2QENLongCurrency, or for
// Currency the Extended product x x 10000 rounded to the nearest unit. All round halves to
// even and wrap an overflow unreported (modulo 2^64, then the low 32 bits for TQENCurrency; a
// NaN or an infinity gives -2^63): Vector2QENCurrencyVector({0.00065L}) stores 6.
TQENCurrVector Vector2QENCurrVector(const TQENCurrVector& V);
TQENCurrVector Vector2QENCurrVector(const TQENLongCurrVector& V);
TQENCurrVector Vector2QENCurrVector(const TQENCurrencyVector& V);
TQENCurrVector Vector2QENCurrVector(const TQENFloatVector& V);
TQENLongCurrVector Vector2QENLongCurrVector(const TQENCurrVector& V);
TQENLongCurrVector Vector2QENLongCurrVector(const TQENLongCurrVector& V);
TQENLongCurrVector Vector2QENLongCurrVector(const TQENCurrencyVector& V);
TQENLongCurrVector Vector2QENLongCurrVector(const TQENFloatVector& V);
TQENCurrencyVector Vector2QENCurrencyVector(const TQENCurrVector& V);
TQENCurrencyVector Vector2QENCurrencyVector(const TQENLongCurrVector& V);
TQENCurrencyVector Vector2QENCurrencyVector(const TQENCurrencyVector& V);
TQENCurrencyVector Vector2QENCurrencyVector(const TQENFloatVector& V);

}  // namespace tovrin
