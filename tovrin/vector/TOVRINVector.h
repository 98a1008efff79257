// Vector building, aggregates, arithmetic, transforms, sorting and ranking.
//
// Every operation is a free function overloaded by element type; only the overloads listed
// here exist. Three shapes occur: queries take `const V&` and return a scalar, in-place
// operations take `V&` and change it, producers return a fresh vector that shares nothing
// with their operands. Each check runs before any work, so a call that raises EMathError
// leaves its operands exactly as they were. A value "of the element type" of a
// TQENFloatVector is an Extended. Integer sums, products and squares wrap silently as stated
// per family; float work is done in Extended and rounded only when stored.
#pragma once

#include <functional>
#include <span>

#include "tovrin/foundation/TOVRINFoundation.h"

namespace tovrin {

// Functions applied to every element by TransformVector: a plain function or a lambda taking
// and returning the element type.
using TQENFloatTransformFunc = std::function<Extended(Extended)>;
using TQENDoubleTransformFunc = std::function<Double(Double)>;
using TQENSingleTransformFunc = std::function<Single(Single)>;

// ============================================================================================
// Building
// ============================================================================================

// Appends Value as the new last element.
void AppendValue2Vector(TQENFloatVector& V, Extended Value);
void AppendValue2Vector(TQENDoubleVector& V, Double Value);
void AppendValue2Vector(TQENSingleVector& V, Single Value);
void AppendValue2Vector(TQENInt64Vector& V, Int64 Value);
void AppendValue2Vector(TQENLWordVector& V, LongWord Value);
void AppendValue2Vector(TQENLIntVector& V, LongInt Value);

// Inserts Value at position Index, moving the later elements up one place. An Index that is
// not a position of V (negative, at or past the end, any Index on an empty V) appends
// instead; nothing is raised.
void AddValue2Vector(TQENFloatVector& V, Extended Value, LongInt Index);
void AddValue2Vector(TQENDoubleVector& V, Double Value, LongInt Index);
void AddValue2Vector(TQENSingleVector& V, Single Value, LongInt Index);
void AddValue2Vector(TQENInt64Vector& V, Int64 Value, LongInt Index);
void AddValue2Vector(TQENLWordVector& V, LongWord Value, LongInt Index);
void AddValue2Vector(TQENLIntVector& V, LongInt Value, LongInt Index);

// Removes the element at position Index. An Index that is not a position of V does nothing;
// removing the only element leaves the empty vector (its storage released).
void DeleteValueFromVector(TQENFloatVector& V, LongInt Index);
void DeleteValueFromVector(TQENDoubleVector& V, LongInt Index);
void DeleteValueFromVector(TQENSingleVector& V, LongInt Index);
void DeleteValueFromVector(TQENInt64Vector& V, LongInt Index);
void DeleteValueFromVector(TQENLWordVector& V, LongInt Index);
void DeleteValueFromVector(TQENLIntVector& V, LongInt Index);

// ============================================================================================
// Aggregates: one pass each; every one raises rsVectorIsEmpty for an empty V
// ============================================================================================

// The largest and the smallest element, compared exactly (no tolerance, also for floats).
Extended MaxVector(const TQENFloatVector& V);
Double MaxVector(const TQENDoubleVector& V);
Single MaxVector(const TQENSingleVector& V);
Int64 MaxVector(const TQENInt64Vector& V);
LongWord MaxVector(const TQENLWordVector& V);
LongInt MaxVector(const TQENLIntVector& V);
Word MaxVector(const TQENWordVector& V);
SmallInt MaxVector(const TQENSmallIntVector& V);
Byte MaxVector(const TQENByteVector& V);
ShortInt MaxVector(const TQENSIntVector& V);
Extended MinVector(const TQENFloatVector& V);
Double MinVector(const TQENDoubleVector& V);
Single MinVector(const TQENSingleVector& V);
Int64 MinVector(const TQENInt64Vector& V);
LongWord MinVector(const TQENLWordVector& V);
LongInt MinVector(const TQENLIntVector& V);
Word MinVector(const TQENWordVector& V);
SmallInt MinVector(const TQENSmallIntVector& V);
Byte MinVector(const TQENByteVector& V);
ShortInt MinVector(const TQENSIntVector& V);

// Both extremes in one pass: their values, the first positions at which they occur, and
// whether each occurs exactly once. Comparisons are exact. Outputs are written only after
// the emptiness check.
void MinMaxVector(const TQENFloatVector& V, Extended& MinValue, Extended& MaxValue,
                  LongWord& MinIndex, LongWord& MaxIndex, bool& MinUnique, bool& MaxUnique);
void MinMaxVector(const TQENDoubleVector& V, Double& MinValue, Double& MaxValue, LongWord& MinIndex,
                  LongWord& MaxIndex, bool& MinUnique, bool& MaxUnique);
void MinMaxVector(const TQENSingleVector& V, Single& MinValue, Single& MaxValue, LongWord& MinIndex,
                  LongWord& MaxIndex, bool& MinUnique, bool& MaxUnique);
void MinMaxVector(const TQENInt64Vector& V, Int64& MinValue, Int64& MaxValue, LongWord& MinIndex,
                  LongWord& MaxIndex, bool& MinUnique, bool& MaxUnique);
void MinMaxVector(const TQENLWordVector& V, LongWord& MinValue, LongWord& MaxValue,
                  LongWord& MinIndex, LongWord& MaxIndex, bool& MinUnique, bool& MaxUnique);
void MinMaxVector(const TQENLIntVector& V, LongInt& MinValue, LongInt& MaxValue, LongWord& MinIndex,
                  LongWord& MaxIndex, bool& MinUnique, bool& MaxUnique);
void MinMaxVector(const TQENWordVector& V, Word& MinValue, Word& MaxValue, LongWord& MinIndex,
                  LongWord& MaxIndex, bool& MinUnique, bool& MaxUnique);
void MinMaxVector(const TQENSmallIntVector& V, SmallInt& MinValue, SmallInt& MaxValue,
                  LongWord& MinIndex, LongWord& MaxIndex, bool& MinUnique, bool& MaxUnique);
void MinMaxVector(const TQENByteVector& V, Byte& MinValue, Byte& MaxValue, LongWord& MinIndex,
                  LongWord& MaxIndex, bool& MinUnique, bool& MaxUnique);
void MinMaxVector(const TQENSIntVector& V, ShortInt& MinValue, ShortInt& MaxValue,
                  LongWord& MinIndex, LongWord& MaxIndex, bool& MinUnique, bool& MaxUnique);

// The sum of the elements in index order: accumulated in Extended for the float types, in a
// wrapping Int64 for the integer types (each element sign- or zero-extended first).
Extended SumVector(const TQENFloatVector& V);
Extended SumVector(const TQENDoubleVector& V);
Extended SumVector(const TQENSingleVector& V);
Int64 SumVector(const TQENInt64Vector& V);
Int64 SumVector(const TQENLWordVector& V);
Int64 SumVector(const TQENLIntVector& V);
Int64 SumVector(const TQENWordVector& V);
Int64 SumVector(const TQENSmallIntVector& V);
Int64 SumVector(const TQENByteVector& V);
Int64 SumVector(const TQENSIntVector& V);

// The sum of the squared elements in index order. Floats square in Extended; Int64 squares
// wrap modulo 2^64; LongInt, SmallInt, ShortInt, Word and Byte squares are the low 32 bits
// taken as a signed LongInt (65535 squared counts as -131071); LongWord squares are the low
// 32 bits taken unsigned. The terms are summed in a wrapping Int64.
Extended SumSqVector(const TQENFloatVector& V);
Extended SumSqVector(const TQENDoubleVector& V);
Extended SumSqVector(const TQENSingleVector& V);
Int64 SumSqVector(const TQENInt64Vector& V);
Int64 SumSqVector(const TQENLWordVector& V);
Int64 SumSqVector(const TQENLIntVector& V);
Int64 SumSqVector(const TQENWordVector& V);
Int64 SumSqVector(const TQENSmallIntVector& V);
Int64 SumSqVector(const TQENByteVector& V);
Int64 SumSqVector(const TQENSIntVector& V);

// The sum of (x - Mean)^2 in index order. With a Mean of the element type: floats work in
// Extended; Int64 differences and squares wrap in 64 bits; LongInt and LongWord differences
// wrap in 32 bits and square as SumSqVector does (3 - 5 is 4294967294 for LongWord). With an
// Extended Mean the integer elements are widened and everything is done in Extended. Pass
// the Mean with its exact type: the two integer overloads of a vector type are otherwise
// equally good matches.
Extended SumSqDiffVector(const TQENFloatVector& V, Extended Mean);
Extended SumSqDiffVector(const TQENDoubleVector& V, Double Mean);
Extended SumSqDiffVector(const TQENSingleVector& V, Single Mean);
Int64 SumSqDiffVector(const TQENInt64Vector& V, Int64 Mean);
Int64 SumSqDiffVector(const TQENLWordVector& V, LongWord Mean);
Int64 SumSqDiffVector(const TQENLIntVector& V, LongInt Mean);
Extended SumSqDiffVector(const TQENInt64Vector& V, Extended Mean);
Extended SumSqDiffVector(const TQENLWordVector& V, Extended Mean);
Extended SumSqDiffVector(const TQENLIntVector& V, Extended Mean);

// Sign predicates: True when every element is non-negative, negative, non-zero, zero,
// non-positive or positive; the visit stops at the first element that fails. The float
// overloads test with the tolerance predicates (FloatIsNegative, FloatIsZero, ...), except
// that the Single VectorNonZero compares with 0 exactly. The Int64 overloads compare
// exactly, except that the Int64 VectorNonZero asks FloatIsZero of the widened element.
bool VectorNonNegative(const TQENFloatVector& V);
bool VectorNonNegative(const TQENDoubleVector& V);
bool VectorNonNegative(const TQENSingleVector& V);
bool VectorNonNegative(const TQENInt64Vector& V);
bool VectorNegative(const TQENFloatVector& V);
bool VectorNegative(const TQENDoubleVector& V);
bool VectorNegative(const TQENSingleVector& V);
bool VectorNegative(const TQENInt64Vector& V);
bool VectorNonZero(const TQENFloatVector& V);
bool VectorNonZero(const TQENDoubleVector& V);
bool VectorNonZero(const TQENSingleVector& V);
bool VectorNonZero(const TQENInt64Vector& V);
bool VectorZero(const TQENFloatVector& V);
bool VectorZero(const TQENDoubleVector& V);
bool VectorZero(const TQENSingleVector& V);
bool VectorZero(const TQENInt64Vector& V);
bool VectorNonPositive(const TQENFloatVector& V);
bool VectorNonPositive(const TQENDoubleVector& V);
bool VectorNonPositive(const TQENSingleVector& V);
bool VectorNonPositive(const TQENInt64Vector& V);
bool VectorPositive(const TQENFloatVector& V);
bool VectorPositive(const TQENDoubleVector& V);
bool VectorPositive(const TQENSingleVector& V);
bool VectorPositive(const TQENInt64Vector& V);

// ============================================================================================
// In-place transforms: each checks the whole vector first and leaves it untouched on failure
// ============================================================================================

// V[i] := V[i] * V[i]. Raises rsVectorIsEmpty. Floats square in Extended; Int64 squares keep
// the low 64 bits, LongInt and LongWord squares the low 32 bits.
void SquareVector(TQENFloatVector& V);
void SquareVector(TQENDoubleVector& V);
void SquareVector(TQENSingleVector& V);
void SquareVector(TQENInt64Vector& V);
void SquareVector(TQENLWordVector& V);
void SquareVector(TQENLIntVector& V);

// V[i] := square root of V[i]. Raises rsVectorIsEmpty, then rsVectorNeg unless
// VectorNonNegative(V) (an element negative within the tolerance passes and gives NaN).
void SqrtVector(TQENFloatVector& V);
void SqrtVector(TQENDoubleVector& V);
void SqrtVector(TQENSingleVector& V);

// V[i] := 1 / V[i]. Raises rsVectorIsEmpty, then rsVectorZero unless VectorNonZero(V).
void InvVector(TQENFloatVector& V);
void InvVector(TQENDoubleVector& V);
void InvVector(TQENSingleVector& V);

// V[i] := natural, base-10 and base-2 logarithm of V[i]. Raise rsVectorIsEmpty, then
// rsVectorNotPos unless VectorPositive(V).
void LnVector(TQENFloatVector& V);
void LnVector(TQENDoubleVector& V);
void LnVector(TQENSingleVector& V);
void Log10Vector(TQENFloatVector& V);
void Log10Vector(TQENDoubleVector& V);
void Log10Vector(TQENSingleVector& V);
void Log2Vector(TQENFloatVector& V);
void Log2Vector(TQENDoubleVector& V);
void Log2Vector(TQENSingleVector& V);

// V[i] := M * V[i] + C. Raises rsVectorIsEmpty. The Int64 overload wraps in 64 bits.
void LinearTransformVector(TQENFloatVector& V, Extended M, Extended C);
void LinearTransformVector(TQENDoubleVector& V, Double M, Double C);
void LinearTransformVector(TQENSingleVector& V, Single M, Single C);
void LinearTransformVector(TQENInt64Vector& V, Int64 M, Int64 C);

// V[i] := Func(V[i]) in index order. Raises rsVectorIsEmpty, then rsInvalidValue for an empty
// Func (V untouched). What Func returns is stored as
// it is; an exception from Func passes through, the elements before it already transformed.
void TransformVector(TQENFloatVector& V, const TQENFloatTransformFunc& Func);
void TransformVector(TQENDoubleVector& V, const TQENDoubleTransformFunc& Func);
void TransformVector(TQENSingleVector& V, const TQENSingleTransformFunc& Func);

// Every element := Value, or 0; the length is kept (ClearVector does not empty V).
void FillVector(TQENFloatVector& V, Extended Value);
void FillVector(TQENDoubleVector& V, Double Value);
void FillVector(TQENSingleVector& V, Single Value);
void FillVector(TQENInt64Vector& V, Int64 Value);
void FillVector(TQENLWordVector& V, LongWord Value);
void FillVector(TQENLIntVector& V, LongInt Value);
void FillVector(TQENWordVector& V, Word Value);
void FillVector(TQENSmallIntVector& V, SmallInt Value);
void FillVector(TQENByteVector& V, Byte Value);
void FillVector(TQENSIntVector& V, ShortInt Value);
void ClearVector(TQENFloatVector& V);
void ClearVector(TQENDoubleVector& V);
void ClearVector(TQENSingleVector& V);
void ClearVector(TQENInt64Vector& V);
void ClearVector(TQENLWordVector& V);
void ClearVector(TQENLIntVector& V);
void ClearVector(TQENWordVector& V);
void ClearVector(TQENSmallIntVector& V);
void ClearVector(TQENByteVector& V);
void ClearVector(TQENSIntVector& V);

// ============================================================================================
// Producers
// ============================================================================================

// A vector of V's length holding averages of Window consecutive elements: the average of
// V[i], ..., V[i + Window - 1] (each window summed afresh, in Extended) is written at
// i + Offset, Offset being cut to Window - 1; every other position holds 0. Raises
// rsVectorIsEmpty, then rsValueNotZero for Window 0, then rsInvalidValue for a Window longer
// than V.
TQENFloatVector MovingAverage(const TQENFloatVector& V, LongWord Window, LongWord Offset);
TQENDoubleVector MovingAverage(const TQENDoubleVector& V, LongWord Window, LongWord Offset);
TQENSingleVector MovingAverage(const TQENSingleVector& V, LongWord Window, LongWord Offset);

// The elements of V in reverse order, and an independent copy of V.
TQENFloatVector ReverseVector(const TQENFloatVector& V);
TQENDoubleVector ReverseVector(const TQENDoubleVector& V);
TQENSingleVector ReverseVector(const TQENSingleVector& V);
TQENInt64Vector ReverseVector(const TQENInt64Vector& V);
TQENLWordVector ReverseVector(const TQENLWordVector& V);
TQENLIntVector ReverseVector(const TQENLIntVector& V);
TQENWordVector ReverseVector(const TQENWordVector& V);
TQENSmallIntVector ReverseVector(const TQENSmallIntVector& V);
TQENByteVector ReverseVector(const TQENByteVector& V);
TQENSIntVector ReverseVector(const TQENSIntVector& V);
TQENFloatVector CopyVector(const TQENFloatVector& V);
TQENDoubleVector CopyVector(const TQENDoubleVector& V);
TQENSingleVector CopyVector(const TQENSingleVector& V);
TQENInt64Vector CopyVector(const TQENInt64Vector& V);
TQENLWordVector CopyVector(const TQENLWordVector& V);
TQENLIntVector CopyVector(const TQENLIntVector& V);
TQENWordVector CopyVector(const TQENWordVector& V);
TQENSmallIntVector CopyVector(const TQENSmallIntVector& V);
TQENByteVector CopyVector(const TQENByteVector& V);
TQENSIntVector CopyVector(const TQENSIntVector& V);

// ============================================================================================
// Two vectors: each raises rsSameDimensions when the lengths differ
// ============================================================================================

// V1 + V2 and V1 - V2 element by element, as a new vector or into V1. Two empty vectors give
// an empty result. LongInt sums wrap in 32 bits, Int64 sums in 64 bits.
TQENFloatVector AddVectors(const TQENFloatVector& V1, const TQENFloatVector& V2);
TQENDoubleVector AddVectors(const TQENDoubleVector& V1, const TQENDoubleVector& V2);
TQENSingleVector AddVectors(const TQENSingleVector& V1, const TQENSingleVector& V2);
TQENInt64Vector AddVectors(const TQENInt64Vector& V1, const TQENInt64Vector& V2);
TQENLIntVector AddVectors(const TQENLIntVector& V1, const TQENLIntVector& V2);
TQENFloatVector SubtractVectors(const TQENFloatVector& V1, const TQENFloatVector& V2);
TQENDoubleVector SubtractVectors(const TQENDoubleVector& V1, const TQENDoubleVector& V2);
TQENSingleVector SubtractVectors(const TQENSingleVector& V1, const TQENSingleVector& V2);
TQENInt64Vector SubtractVectors(const TQENInt64Vector& V1, const TQENInt64Vector& V2);
TQENLIntVector SubtractVectors(const TQENLIntVector& V1, const TQENLIntVector& V2);
void AddToVector(TQENFloatVector& V1, const TQENFloatVector& V2);
void AddToVector(TQENDoubleVector& V1, const TQENDoubleVector& V2);
void AddToVector(TQENSingleVector& V1, const TQENSingleVector& V2);
void AddToVector(TQENInt64Vector& V1, const TQENInt64Vector& V2);
void AddToVector(TQENLIntVector& V1, const TQENLIntVector& V2);
void SubtractFromVector(TQENFloatVector& V1, const TQENFloatVector& V2);
void SubtractFromVector(TQENDoubleVector& V1, const TQENDoubleVector& V2);
void SubtractFromVector(TQENSingleVector& V1, const TQENSingleVector& V2);
void SubtractFromVector(TQENInt64Vector& V1, const TQENInt64Vector& V2);
void SubtractFromVector(TQENLIntVector& V1, const TQENLIntVector& V2);

// The sum of V1[i] * V2[i], from 0 in index order. Raises rsSameDimensions, then
// rsVectorIsEmpty. Int64 products wrap in 64 bits; LongInt products are the low 32 bits
// taken signed, LongWord products the low 32 bits taken unsigned; summed in a wrapping Int64.
Extended DotProdVectors(const TQENFloatVector& V1, const TQENFloatVector& V2);
Extended DotProdVectors(const TQENDoubleVector& V1, const TQENDoubleVector& V2);
Extended DotProdVectors(const TQENSingleVector& V1, const TQENSingleVector& V2);
Int64 DotProdVectors(const TQENInt64Vector& V1, const TQENInt64Vector& V2);
Int64 DotProdVectors(const TQENLWordVector& V1, const TQENLWordVector& V2);
Int64 DotProdVectors(const TQENLIntVector& V1, const TQENLIntVector& V2);

// The sum of (V1[i] - V2[i])^2, from 0 in index order. Raises rsSameDimensions, then
// rsVectorIsEmpty. The integer elements are widened to 64 bits first (unlike SumSqDiffVector)
// and the differences and squares wrap in 64 bits.
Extended SumSqDiffVectors(const TQENFloatVector& V1, const TQENFloatVector& V2);
Extended SumSqDiffVectors(const TQENDoubleVector& V1, const TQENDoubleVector& V2);
Extended SumSqDiffVectors(const TQENSingleVector& V1, const TQENSingleVector& V2);
Int64 SumSqDiffVectors(const TQENInt64Vector& V1, const TQENInt64Vector& V2);
Int64 SumSqDiffVectors(const TQENLWordVector& V1, const TQENLWordVector& V2);
Int64 SumSqDiffVectors(const TQENLIntVector& V1, const TQENLIntVector& V2);

// The Euclidean length, squares summed in Extended (integers converted first, nothing
// wraps). An empty vector has magnitude 0.
Extended VectorMagnitude(const TQENFloatVector& V);
Extended VectorMagnitude(const TQENDoubleVector& V);
Extended VectorMagnitude(const TQENSingleVector& V);
Extended VectorMagnitude(const TQENInt64Vector& V);
Extended VectorMagnitude(const TQENLWordVector& V);
Extended VectorMagnitude(const TQENLIntVector& V);
Extended VectorMagnitude(const TQENWordVector& V);
Extended VectorMagnitude(const TQENSmallIntVector& V);
Extended VectorMagnitude(const TQENByteVector& V);
Extended VectorMagnitude(const TQENSIntVector& V);

// The angle between V1 and V2 in radians, 0 to pi. Raises rsMagZero when either magnitude is
// exactly 0 (two empty vectors included), and only then rsSameDimensions for unequal lengths.
Extended AngleBetweenVectors(const TQENFloatVector& V1, const TQENFloatVector& V2);
Extended AngleBetweenVectors(const TQENDoubleVector& V1, const TQENDoubleVector& V2);
Extended AngleBetweenVectors(const TQENSingleVector& V1, const TQENSingleVector& V2);
Extended AngleBetweenVectors(const TQENInt64Vector& V1, const TQENInt64Vector& V2);
Extended AngleBetweenVectors(const TQENLWordVector& V1, const TQENLWordVector& V2);
Extended AngleBetweenVectors(const TQENLIntVector& V1, const TQENLIntVector& V2);

// ============================================================================================
// Conversions: a vector of the source's length, every element converted exactly
// ============================================================================================

// Array2...: from an open array (a span); Vector2...: from a vector. Signed sources are
// sign-extended, unsigned ones zero-extended; only widening conversions are offered.
TQENFloatVector Array2FloatVector(std::span<const Extended> A);
TQENFloatVector Array2FloatVector(std::span<const Double> A);
TQENFloatVector Array2FloatVector(std::span<const Single> A);
TQENFloatVector Array2FloatVector(std::span<const Int64> A);
TQENFloatVector Array2FloatVector(std::span<const LongWord> A);
TQENFloatVector Array2FloatVector(std::span<const LongInt> A);
TQENFloatVector Array2FloatVector(std::span<const Word> A);
TQENFloatVector Array2FloatVector(std::span<const SmallInt> A);
TQENFloatVector Array2FloatVector(std::span<const Byte> A);
TQENFloatVector Array2FloatVector(std::span<const ShortInt> A);
TQENFloatVector Vector2FloatVector(const TQENFloatVector& V);
TQENFloatVector Vector2FloatVector(const TQENDoubleVector& V);
TQENFloatVector Vector2FloatVector(const TQENSingleVector& V);
TQENFloatVector Vector2FloatVector(const TQENInt64Vector& V);
TQENFloatVector Vector2FloatVector(const TQENLWordVector& V);
TQENFloatVector Vector2FloatVector(const TQENLIntVector& V);
TQENFloatVector Vector2FloatVector(const TQENWordVector& V);
TQENFloatVector Vector2FloatVector(const TQENSmallIntVector& V);
TQENFloatVector Vector2FloatVector(const TQENByteVector& V);
TQENFloatVector Vector2FloatVector(const TQENSIntVector& V);
TQENInt64Vector Array2Int64Vector(std::span<const Int64> A);
TQENInt64Vector Array2Int64Vector(std::span<const LongWord> A);
TQENInt64Vector Array2Int64Vector(std::span<const LongInt> A);
TQENInt64Vector Array2Int64Vector(std::span<const Word> A);
TQENInt64Vector Array2Int64Vector(std::span<const SmallInt> A);
TQENInt64Vector Array2Int64Vector(std::span<const Byte> A);
TQENInt64Vector Array2Int64Vector(std::span<const ShortInt> A);
TQENInt64Vector Vector2Int64Vector(const TQENInt64Vector& V);
TQENInt64Vector Vector2Int64Vector(const TQENLWordVector& V);
TQENInt64Vector Vector2Int64Vector(const TQENLIntVector& V);
TQENInt64Vector Vector2Int64Vector(const TQENWordVector& V);
TQENInt64Vector Vector2Int64Vector(const TQENSmallIntVector& V);
TQENInt64Vector Vector2Int64Vector(const TQENByteVector& V);
TQENInt64Vector Vector2Int64Vector(const TQENSIntVector& V);
TQENLIntVector Array2LIntVector(std::span<const LongInt> A);
TQENLIntVector Array2LIntVector(std::span<const Word> A);
TQENLIntVector Array2LIntVector(std::span<const SmallInt> A);
TQENLIntVector Array2LIntVector(std::span<const Byte> A);
TQENLIntVector Array2LIntVector(std::span<const ShortInt> A);
TQENLIntVector Vector2LIntVector(const TQENLIntVector& V);
TQENLIntVector Vector2LIntVector(const TQENWordVector& V);
TQENLIntVector Vector2LIntVector(const TQENSmallIntVector& V);
TQENLIntVector Vector2LIntVector(const TQENByteVector& V);
TQENLIntVector Vector2LIntVector(const TQENSIntVector& V);

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
void QSortVector(TQENFloatVector& V, bool Ascending);
void QSortVector(TQENDoubleVector& V, bool Ascending);
void QSortVector(TQENSingleVector& V, bool Ascending);
void QSortVector(TQENInt64Vector& V, bool Ascending);
void QSortVector(TQENLWordVector& V, bool Ascending);
void QSortVector(TQENLIntVector& V, bool Ascending);
void QSortVector(TQENWordVector& V, bool Ascending);
void QSortVector(TQENSmallIntVector& V, bool Ascending);
void QSortVector(TQENByteVector& V, bool Ascending);
void QSortVector(TQENSIntVector& V, bool Ascending);

// Ranks: the 0-based first position, in a copy of V sorted in the chosen order, of a value
// equal to the one ranked. Equality is SameFloat at the element's own precision for floats,
// exact for integers; ties share the lowest rank of their group, and the rank after a group
// skips its size ([5, 3, 5] ascending ranks as [1, 0, 1]). Computed with one sort and a search
// of the sorted copy (O(N log N)). Nothing is raised.
//
// Vector2RankVector: the rank of every element (an empty V gives an empty result).
// Vector2Rank: the rank of V[Index], or -1 when Index is not a position of V.
// Vector2RankValue: the rank Value would share with its equals in V, or -1 when none is equal.
TQENLIntVector Vector2RankVector(const TQENFloatVector& V, bool Ascending);
TQENLIntVector Vector2RankVector(const TQENDoubleVector& V, bool Ascending);
TQENLIntVector Vector2RankVector(const TQENSingleVector& V, bool Ascending);
TQENLIntVector Vector2RankVector(const TQENInt64Vector& V, bool Ascending);
TQENLIntVector Vector2RankVector(const TQENLWordVector& V, bool Ascending);
TQENLIntVector Vector2RankVector(const TQENLIntVector& V, bool Ascending);
TQENLIntVector Vector2RankVector(const TQENWordVector& V, bool Ascending);
TQENLIntVector Vector2RankVector(const TQENSmallIntVector& V, bool Ascending);
TQENLIntVector Vector2RankVector(const TQENByteVector& V, bool Ascending);
TQENLIntVector Vector2RankVector(const TQENSIntVector& V, bool Ascending);
LongInt Vector2Rank(const TQENFloatVector& V, LongWord Index, bool Ascending);
LongInt Vector2Rank(const TQENDoubleVector& V, LongWord Index, bool Ascending);
LongInt Vector2Rank(const TQENSingleVector& V, LongWord Index, bool Ascending);
LongInt Vector2Rank(const TQENInt64Vector& V, LongWord Index, bool Ascending);
LongInt Vector2Rank(const TQENLWordVector& V, LongWord Index, bool Ascending);
LongInt Vector2Rank(const TQENLIntVector& V, LongWord Index, bool Ascending);
LongInt Vector2Rank(const TQENWordVector& V, LongWord Index, bool Ascending);
LongInt Vector2Rank(const TQENSmallIntVector& V, LongWord Index, bool Ascending);
LongInt Vector2Rank(const TQENByteVector& V, LongWord Index, bool Ascending);
LongInt Vector2Rank(const TQENSIntVector& V, LongWord Index, bool Ascending);
LongInt Vector2RankValue(const TQENFloatVector& V, Extended Value, bool Ascending);
LongInt Vector2RankValue(const TQENDoubleVector& V, Double Value, bool Ascending);
LongInt Vector2RankValue(const TQENSingleVector& V, Single Value, bool Ascending);
LongInt Vector2RankValue(const TQENInt64Vector& V, Int64 Value, bool Ascending);
LongInt Vector2RankValue(const TQENLWordVector& V, LongWord Value, bool Ascending);
LongInt Vector2RankValue(const TQENLIntVector& V, LongInt Value, bool Ascending);
LongInt Vector2RankValue(const TQENWordVector& V, Word Value, bool Ascending);
LongInt Vector2RankValue(const TQENSmallIntVector& V, SmallInt Value, bool Ascending);
LongInt Vector2RankValue(const TQENByteVector& V, Byte Value, bool Ascending);
LongInt Vector2RankValue(const TQENSIntVector& V, ShortInt Value, bool Ascending);

}  // namespace tovrin
