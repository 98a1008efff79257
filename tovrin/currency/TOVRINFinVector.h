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
#include "tovrin/foundation/TOVRINFoundation.h"

namespace tovrin {

// --- Building ---------------------------------------------------------------------------------
// Appends Value; inserts it at Index when Index is a position of V, else appends; deletes the
// element at Index when Index is a position of V, else does nothing (raise nothing).
void AppendValue2Vector(TQENCurrVector& V, TQENCurrency Value);
void AppendValue2Vector(TQENLongCurrVector& V, TQENLongCurrency Value);
void AppendValue2Vector(TQENCurrencyVector& V, Currency Value);
void AddValue2Vector(TQENCurrVector& V, TQENCurrency Value, LongInt Index);
void AddValue2Vector(TQENLongCurrVector& V, TQENLongCurrency Value, LongInt Index);
void AddValue2Vector(TQENCurrencyVector& V, Currency Value, LongInt Index);
void DeleteValueFromVector(TQENCurrVector& V, LongInt Index);
void DeleteValueFromVector(TQENLongCurrVector& V, LongInt Index);
void DeleteValueFromVector(TQENCurrencyVector& V, LongInt Index);

// --- Aggregates -------------------------------------------------------------------------------
// Extremes by the stored integers (first position of equals; unique flags as MinMaxVector of
// the numeric vectors). All raise rsVectorIsEmpty for an empty V.
TQENCurrency MaxVector(const TQENCurrVector& V);
TQENLongCurrency MaxVector(const TQENLongCurrVector& V);
Currency MaxVector(const TQENCurrencyVector& V);
TQENCurrency MinVector(const TQENCurrVector& V);
TQENLongCurrency MinVector(const TQENLongCurrVector& V);
Currency MinVector(const TQENCurrencyVector& V);
void MinMaxVector(const TQENCurrVector& V, TQENCurrency& MinValue, TQENCurrency& MaxValue,
                  LongWord& MinIndex, LongWord& MaxIndex, bool& MinUnique, bool& MaxUnique);
void MinMaxVector(const TQENLongCurrVector& V, TQENLongCurrency& MinValue,
                  TQENLongCurrency& MaxValue, LongWord& MinIndex, LongWord& MaxIndex,
                  bool& MinUnique, bool& MaxUnique);
void MinMaxVector(const TQENCurrencyVector& V, Currency& MinValue, Currency& MaxValue,
                  LongWord& MinIndex, LongWord& MaxIndex, bool& MinUnique, bool& MaxUnique);
// The sum in the element type: a 32-bit wrapping sum for TQENCurrency, 64-bit for the others.
TQENCurrency SumVector(const TQENCurrVector& V);
TQENLongCurrency SumVector(const TQENLongCurrVector& V);
Currency SumVector(const TQENCurrencyVector& V);

// --- Sign predicates --------------------------------------------------------------------------
// True when every element passes (the visit stops at the first that fails); rsVectorIsEmpty
// for an empty V. TQENCurrency and TQENLongCurrency compare their stored integers exactly with
// 0; Currency tests the amount (stored / 10000) with FloatIsNegative, FloatIsPositive and
// FloatIsZero, so an amount within QENTolerance of 0 counts as zero.
bool VectorNonNegative(const TQENCurrVector& V);
bool VectorNonNegative(const TQENLongCurrVector& V);
bool VectorNonNegative(const TQENCurrencyVector& V);
bool VectorNegative(const TQENCurrVector& V);
bool VectorNegative(const TQENLongCurrVector& V);
bool VectorNegative(const TQENCurrencyVector& V);
bool VectorNonPositive(const TQENCurrVector& V);
bool VectorNonPositive(const TQENLongCurrVector& V);
bool VectorNonPositive(const TQENCurrencyVector& V);
bool VectorNonZero(const TQENCurrVector& V);
bool VectorNonZero(const TQENLongCurrVector& V);
bool VectorNonZero(const TQENCurrencyVector& V);
bool VectorZero(const TQENCurrVector& V);
bool VectorZero(const TQENLongCurrVector& V);
bool VectorZero(const TQENCurrencyVector& V);
bool VectorPositive(const TQENCurrVector& V);
bool VectorPositive(const TQENLongCurrVector& V);
bool VectorPositive(const TQENCurrencyVector& V);

// --- Sorting ----------------------------------------------------------------------------------
// The explicit-stack quick sort of QSortVector, comparing stored integers exactly.
void QSortVector(TQENCurrVector& V, bool Ascending);
void QSortVector(TQENLongCurrVector& V, bool Ascending);
void QSortVector(TQENCurrencyVector& V, bool Ascending);

// --- Arithmetic and transforms ----------------------------------------------------------------
// Element := element x A + B in money terms; rsVectorIsEmpty for an empty V.
// TQENCurrency and TQENLongCurrency: Float2QEN...(Currency2Float(element) x A + B). Currency:
// the stored integer x A + B x 10000. Each rounded half to even, overflow wrapping unreported.
void LinearTransformVector(TQENCurrVector& V, Extended A, Extended B);
void LinearTransformVector(TQENLongCurrVector& V, Extended A, Extended B);
void LinearTransformVector(TQENCurrencyVector& V, Extended A, Extended B);
// The amounts as Extended values (Currency2Float of each element).
TQENFloatVector Vector2FloatVector(const TQENCurrVector& V);
TQENFloatVector Vector2FloatVector(const TQENLongCurrVector& V);
TQENFloatVector Vector2FloatVector(const TQENCurrencyVector& V);
// Element-by-element sums and differences of the stored integers, wrapping at the stored
// width; rsSameDimensions for unequal lengths (two empty vectors are fine).
TQENCurrVector AddVectors(const TQENCurrVector& V1, const TQENCurrVector& V2);
TQENLongCurrVector AddVectors(const TQENLongCurrVector& V1, const TQENLongCurrVector& V2);
TQENCurrencyVector AddVectors(const TQENCurrencyVector& V1, const TQENCurrencyVector& V2);
void AddToVector(TQENCurrVector& V1, const TQENCurrVector& V2);
void AddToVector(TQENLongCurrVector& V1, const TQENLongCurrVector& V2);
void AddToVector(TQENCurrencyVector& V1, const TQENCurrencyVector& V2);
TQENCurrVector SubtractVectors(const TQENCurrVector& V1, const TQENCurrVector& V2);
TQENLongCurrVector SubtractVectors(const TQENLongCurrVector& V1, const TQENLongCurrVector& V2);
TQENCurrencyVector SubtractVectors(const TQENCurrencyVector& V1, const TQENCurrencyVector& V2);
void SubtractFromVector(TQENCurrVector& V1, const TQENCurrVector& V2);
void SubtractFromVector(TQENLongCurrVector& V1, const TQENLongCurrVector& V2);
void SubtractFromVector(TQENCurrencyVector& V1, const TQENCurrencyVector& V2);
// Every element := Value, or 0; the length is kept.
void FillVector(TQENCurrVector& V, TQENCurrency Value);
void FillVector(TQENLongCurrVector& V, TQENLongCurrency Value);
void FillVector(TQENCurrencyVector& V, Currency Value);
void ClearVector(TQENCurrVector& V);
void ClearVector(TQENLongCurrVector& V);
void ClearVector(TQENCurrencyVector& V);
// A new vector: the elements in reverse order; an independent copy.
TQENCurrVector ReverseVector(const TQENCurrVector& V);
TQENLongCurrVector ReverseVector(const TQENLongCurrVector& V);
TQENCurrencyVector ReverseVector(const TQENCurrencyVector& V);
TQENCurrVector CopyVector(const TQENCurrVector& V);
TQENLongCurrVector CopyVector(const TQENLongCurrVector& V);
TQENCurrencyVector CopyVector(const TQENCurrencyVector& V);

// --- Ranking ----------------------------------------------------------------------------------
// 0-based ranks in a sorted copy, ties sharing the lowest rank; -1 for no rank (an Index past
// the end, a Value equal to no element, an empty V). Equality is SameCurrency on the stored
// integers, so two elements are equal exactly when their stored integers are.
TQENLIntVector Vector2RankVector(const TQENCurrVector& V, bool Ascending);
TQENLIntVector Vector2RankVector(const TQENLongCurrVector& V, bool Ascending);
TQENLIntVector Vector2RankVector(const TQENCurrencyVector& V, bool Ascending);
LongInt Vector2Rank(const TQENCurrVector& V, LongWord Index, bool Ascending);
LongInt Vector2Rank(const TQENLongCurrVector& V, LongWord Index, bool Ascending);
LongInt Vector2Rank(const TQENCurrencyVector& V, LongWord Index, bool Ascending);
LongInt Vector2RankValue(const TQENCurrVector& V, TQENCurrency Value, bool Ascending);
LongInt Vector2RankValue(const TQENLongCurrVector& V, TQENLongCurrency Value, bool Ascending);
LongInt Vector2RankValue(const TQENCurrencyVector& V, Currency Value, bool Ascending);

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
