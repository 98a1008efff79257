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
#include "tovrin/foundation/TOVRINFoundation.h"
#include "tovrin/matrix/TOVRINMatrix.h"  // QENMatrixRectangularCheck

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

// --- Shape queries ------------------------------------------------------------------------------
// As the numeric matrices: MatrixIsRectangular ignores the switch; MatrixDimensions, and so
// MatrixIsSquare and MatricesSameDimensions, follow QENMatrixRectangularCheck.
bool MatrixIsRectangular(const TQENCurrMatrix& M);
bool MatrixIsRectangular(const TQENLongCurrMatrix& M);
bool MatrixIsRectangular(const TQENCurrencyMatrix& M);
void MatrixDimensions(const TQENCurrMatrix& M, LongWord& Rows, LongWord& Cols, bool& Rectangular);
void MatrixDimensions(const TQENLongCurrMatrix& M, LongWord& Rows, LongWord& Cols,
                      bool& Rectangular);
void MatrixDimensions(const TQENCurrencyMatrix& M, LongWord& Rows, LongWord& Cols,
                      bool& Rectangular);
bool MatrixIsSquare(const TQENCurrMatrix& M);
bool MatrixIsSquare(const TQENLongCurrMatrix& M);
bool MatrixIsSquare(const TQENCurrencyMatrix& M);
bool MatricesSameDimensions(const TQENCurrMatrix& M1, const TQENCurrMatrix& M2);
bool MatricesSameDimensions(const TQENLongCurrMatrix& M1, const TQENLongCurrMatrix& M2);
bool MatricesSameDimensions(const TQENCurrencyMatrix& M1, const TQENCurrencyMatrix& M2);

// --- Conversion -------------------------------------------------------------------------------
// The amounts (Currency2Float of each element), keeping ragged shapes. Never raises.
TQENFloatMatrix Matrix2FloatMatrix(const TQENCurrMatrix& M);
TQENFloatMatrix Matrix2FloatMatrix(const TQENLongCurrMatrix& M);
TQENFloatMatrix Matrix2FloatMatrix(const TQENCurrencyMatrix& M);

// --- Two-matrix arithmetic --------------------------------------------------------------------
// Sums and differences of the stored integers, wrapping at the stored width. Checks, in order:
// M1 with no rows raises EAccessViolation (its row 0 is read first); an empty row 0 of M1
// raises rsMatrixIsEmpty; unequal shapes, or an operand not rectangular under the switch,
// raise rsSameDimensions.
TQENCurrMatrix AddMatrices(const TQENCurrMatrix& M1, const TQENCurrMatrix& M2);
TQENLongCurrMatrix AddMatrices(const TQENLongCurrMatrix& M1, const TQENLongCurrMatrix& M2);
TQENCurrencyMatrix AddMatrices(const TQENCurrencyMatrix& M1, const TQENCurrencyMatrix& M2);
void AddToMatrix(TQENCurrMatrix& M1, const TQENCurrMatrix& M2);
void AddToMatrix(TQENLongCurrMatrix& M1, const TQENLongCurrMatrix& M2);
void AddToMatrix(TQENCurrencyMatrix& M1, const TQENCurrencyMatrix& M2);
TQENCurrMatrix SubtractMatrices(const TQENCurrMatrix& M1, const TQENCurrMatrix& M2);
TQENLongCurrMatrix SubtractMatrices(const TQENLongCurrMatrix& M1, const TQENLongCurrMatrix& M2);
TQENCurrencyMatrix SubtractMatrices(const TQENCurrencyMatrix& M1, const TQENCurrencyMatrix& M2);
void SubtractFromMatrix(TQENCurrMatrix& M1, const TQENCurrMatrix& M2);
void SubtractFromMatrix(TQENLongCurrMatrix& M1, const TQENLongCurrMatrix& M2);
void SubtractFromMatrix(TQENCurrencyMatrix& M1, const TQENCurrencyMatrix& M2);

// --- Scalar arithmetic ------------------------------------------------------------------------
// Every element (each row at its own length) becomes Round(K x stored integer), halves to
// even; overflow is not reported (the rounded value wraps to the stored width). A matrix with
// no rows raises rsMatrixIsEmpty.
TQENCurrMatrix MultiplyMatrixByConst(const TQENCurrMatrix& M, Extended K);
TQENLongCurrMatrix MultiplyMatrixByConst(const TQENLongCurrMatrix& M, Extended K);
TQENCurrencyMatrix MultiplyMatrixByConst(const TQENCurrencyMatrix& M, Extended K);
void MultiplyMatrixByConst2(TQENCurrMatrix& M, Extended K);
void MultiplyMatrixByConst2(TQENLongCurrMatrix& M, Extended K);
void MultiplyMatrixByConst2(TQENCurrencyMatrix& M, Extended K);
// Element := element x A + B in money terms, each row at its own length; rsMatrixIsEmpty for
// no rows. TQENCurrency and TQENLongCurrency: Float2QEN...(Currency2Float(element) x A + B).
// Currency: the stored integer x A + B x 10000 (B is an amount). Each rounded half to even,
// overflow unreported.
void LinearTransformMatrix(TQENCurrMatrix& M, Extended A, Extended B);
void LinearTransformMatrix(TQENLongCurrMatrix& M, Extended A, Extended B);
void LinearTransformMatrix(TQENCurrencyMatrix& M, Extended A, Extended B);
// The mean of every element as a value of the element type; N receives the element count.
// The stored integers are summed with wrap-around (32 bits for TQENCurrency, 64 for the
// others) and the sum divided by N rounded to the nearest unit, halves to even. No rows, or
// only empty rows, raise rsMatrixIsEmpty.
TQENCurrency GrandMean(const TQENCurrMatrix& M, LongWord& N);
TQENLongCurrency GrandMean(const TQENLongCurrMatrix& M, LongWord& N);
Currency GrandMean(const TQENCurrencyMatrix& M, LongWord& N);

// --- Row and column operations ----------------------------------------------------------------
// Checks: rsMatrixIsEmpty, rsMatrixRect, then rsInvalidRow / rsInvalidCol; equal indices
// return at once without any check.
void SwapMatrixRows(TQENCurrMatrix& M, LongWord Row1, LongWord Row2);
void SwapMatrixRows(TQENLongCurrMatrix& M, LongWord Row1, LongWord Row2);
void SwapMatrixRows(TQENCurrencyMatrix& M, LongWord Row1, LongWord Row2);
void SwapMatrixCols(TQENCurrMatrix& M, LongWord Col1, LongWord Col2);
void SwapMatrixCols(TQENLongCurrMatrix& M, LongWord Col1, LongWord Col2);
void SwapMatrixCols(TQENCurrencyMatrix& M, LongWord Col1, LongWord Col2);
// Whole rows ordered by their element in column Col (columns by their element in row Row) by
// the explicit-stack quick sort, comparing stored integers exactly. Nothing is checked or done
// unless there are two rows and two columns; then rsMatrixRect, rsInvalidCol / rsInvalidRow.
void QSortMatrixRowsOnCol(TQENCurrMatrix& M, LongWord Col, bool Ascending);
void QSortMatrixRowsOnCol(TQENLongCurrMatrix& M, LongWord Col, bool Ascending);
void QSortMatrixRowsOnCol(TQENCurrencyMatrix& M, LongWord Col, bool Ascending);
void QSortMatrixColsOnRow(TQENCurrMatrix& M, LongWord Row, bool Ascending);
void QSortMatrixColsOnRow(TQENLongCurrMatrix& M, LongWord Row, bool Ascending);
void QSortMatrixColsOnRow(TQENCurrencyMatrix& M, LongWord Row, bool Ascending);
// A copy of one row (column); empty for a matrix with no rows or columns; rsInvalidRow
// (rsInvalidCol) past the end.
TQENCurrVector ExtractMatrixRow(const TQENCurrMatrix& M, LongWord Row);
TQENLongCurrVector ExtractMatrixRow(const TQENLongCurrMatrix& M, LongWord Row);
TQENCurrencyVector ExtractMatrixRow(const TQENCurrencyMatrix& M, LongWord Row);
TQENCurrVector ExtractMatrixCol(const TQENCurrMatrix& M, LongWord Col);
TQENLongCurrVector ExtractMatrixCol(const TQENLongCurrMatrix& M, LongWord Col);
TQENCurrencyVector ExtractMatrixCol(const TQENCurrencyMatrix& M, LongWord Col);
// Row Row (column Col) becomes V, cut or padded with Fill to the matrix's width (height);
// nothing happens for a matrix with no rows or columns; rsInvalidRow (rsInvalidCol) past the
// end.
void OverwriteMatrixRow(TQENCurrMatrix& M, LongWord Row, const TQENCurrVector& V,
                        TQENCurrency Fill);
void OverwriteMatrixRow(TQENLongCurrMatrix& M, LongWord Row, const TQENLongCurrVector& V,
                        TQENLongCurrency Fill);
void OverwriteMatrixRow(TQENCurrencyMatrix& M, LongWord Row, const TQENCurrencyVector& V,
                        Currency Fill);
void OverwriteMatrixCol(TQENCurrMatrix& M, LongWord Col, const TQENCurrVector& V,
                        TQENCurrency Fill);
void OverwriteMatrixCol(TQENLongCurrMatrix& M, LongWord Col, const TQENLongCurrVector& V,
                        TQENLongCurrency Fill);
void OverwriteMatrixCol(TQENCurrencyMatrix& M, LongWord Col, const TQENCurrencyVector& V,
                        Currency Fill);
// A deep copy keeping every row's own length; never raises.
TQENCurrMatrix CopyMatrix(const TQENCurrMatrix& M);
TQENLongCurrMatrix CopyMatrix(const TQENLongCurrMatrix& M);
TQENCurrencyMatrix CopyMatrix(const TQENCurrencyMatrix& M);
// Cols x Rows; rsMatrixRect for a matrix that is not rectangular (under the switch also an
// empty one); an empty result for no rows or columns.
TQENCurrMatrix TransposeMatrix(const TQENCurrMatrix& M);
TQENLongCurrMatrix TransposeMatrix(const TQENLongCurrMatrix& M);
TQENCurrencyMatrix TransposeMatrix(const TQENCurrencyMatrix& M);

}  // namespace tovrin
