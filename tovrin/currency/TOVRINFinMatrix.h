// Money matrices: the matrix operations over TQENCurrency, TQENLongCurrency and Currency.
//
// Each function has the name, argument order, checks and result shape of its namesake in
// TOVRINMatrix.h and runs the same algorithm; shape queries follow QENMatrixRectangularCheck
// exactly as there. What differs is the element arithmetic: stored integers add and subtract
// with wrap-around at their own width (32 bits for TQENCurrency, 64 for the others), products
// by an Extended constant and linear transforms are rounded half to even with an overflow that
// is not reported (the one rule of TOVRINFinancials.h). There is no row reduction, product, row or
// column scaling or sum, and no element-wise function for money.
#pragma once

#include "tovrin/currency/TOVRINFinancials.h"
#include "tovrin/foundation/TOVRINElementTypes.h"
#include "tovrin/foundation/TOVRINFoundation.h"
#include "tovrin/matrix/TOVRINMatrix.h"

namespace tovrin {

// --- Creation ---------------------------------------------------------------------------------
// Rows x Cols zeros; no argument is checked.
TQENCurrMatrix CreateCurrMatrix(LongWord Rows, LongWord Cols);
TQENLongCurrMatrix CreateLongCurrMatrix(LongWord Rows, LongWord Cols);
TQENCurrencyMatrix CreateCurrencyMatrix(LongWord Rows, LongWord Cols);
// N x N with the amount 1 on the diagonal, written as its stored integer: 100 for
// TQENCurrency, 1000000 for TQENLongCurrency, 10000 for Currency.
TQENCurrMatrix CreateCurrIdentityMatrix(LongWord N);
TQENLongCurrMatrix CreateLongCurrIdentityMatrix(LongWord N);
TQENCurrencyMatrix CreateCurrencyIdentityMatrix(LongWord N);

// --- Shape queries, row and column moves, copy and transpose -----------------------------------
// MatrixIsRectangular, MatrixDimensions, MatrixIsSquare, MatricesSameDimensions,
// SwapMatrixRows, SwapMatrixCols, QSortMatrixRowsOnCol, QSortMatrixColsOnRow, ExtractMatrixRow,
// ExtractMatrixCol, OverwriteMatrixRow, OverwriteMatrixCol, CopyMatrix and TransposeMatrix are
// the templates of TOVRINMatrix.h, which take the money matrices too: they only compare, move
// and copy elements, comparing stored integers exactly, with the checks and their order as
// stated there.

// --- Conversion -------------------------------------------------------------------------------
// The amounts (Currency2Float of each element), keeping ragged shapes. Never raises.
template <detail::MoneyElement T>
TQENFloatMatrix Matrix2FloatMatrix(const detail::MatrixOf<T>& M);

// --- Two-matrix arithmetic --------------------------------------------------------------------
// Sums and differences of the stored integers, wrapping at the stored width. Checks, in order:
// M1 with no rows raises EAccessViolation (its row 0 is read first); an empty row 0 of M1
// raises rsMatrixIsEmpty; unequal shapes, or an operand not rectangular under the switch,
// raise rsSameDimensions.
template <detail::MoneyElement T>
detail::MatrixOf<T> AddMatrices(const detail::MatrixOf<T>& M1, const detail::MatrixOf<T>& M2);
template <detail::MoneyElement T>
void AddToMatrix(detail::MatrixOf<T>& M1, const detail::MatrixOf<T>& M2);
template <detail::MoneyElement T>
detail::MatrixOf<T> SubtractMatrices(const detail::MatrixOf<T>& M1, const detail::MatrixOf<T>& M2);
template <detail::MoneyElement T>
void SubtractFromMatrix(detail::MatrixOf<T>& M1, const detail::MatrixOf<T>& M2);

// --- Scalar arithmetic ------------------------------------------------------------------------
// Every element (each row at its own length) becomes Round(K x stored integer), halves to
// even; overflow is not reported (the rounded value wraps to the stored width). A matrix with
// no rows raises rsMatrixIsEmpty.
template <detail::MoneyElement T>
detail::MatrixOf<T> MultiplyMatrixByConst(const detail::MatrixOf<T>& M, Extended K);
template <detail::MoneyElement T>
void MultiplyMatrixByConst2(detail::MatrixOf<T>& M, Extended K);
// Element := element x A + B in money terms, each row at its own length; rsMatrixIsEmpty for
// no rows. TQENCurrency and TQENLongCurrency: Float2QEN...(Currency2Float(element) x A + B).
// Currency: the stored integer x A + B x 10000 (B is an amount). Each rounded half to even,
// overflow unreported.
template <detail::MoneyElement T>
void LinearTransformMatrix(detail::MatrixOf<T>& M, Extended A, Extended B);
// The mean of every element as a value of the element type; N receives the element count.
// The stored integers are summed with wrap-around (32 bits for TQENCurrency, 64 for the
// others) and the sum divided by N rounded to the nearest unit, halves to even. No rows, or
// only empty rows, raise rsMatrixIsEmpty.
template <detail::MoneyElement T>
T GrandMean(const detail::MatrixOf<T>& M, LongWord& N);

}  // namespace tovrin
