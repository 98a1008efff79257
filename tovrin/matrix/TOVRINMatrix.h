// Matrix creation, shape queries, arithmetic, row and column operations, row reduction.
//
// A matrix is a vector of rows (element [i][j] is row i, column j); rows may differ in length.
// Shape checks follow QENMatrixRectangularCheck: with it on (the default) operations that need
// a rectangular matrix walk every row; with it off they take the shape from row 0, and a row
// that is too short for the columns an operation would touch raises rsMatrixRect instead of
// being read past its end. Failed checks raise EMathError before anything is changed (the
// element-wise functions stop where an element fails, keeping what they already wrote).
// Floating-point work is done in Extended and rounded to the element type on store.
#pragma once

#include "tovrin/foundation/TOVRINFoundation.h"

namespace tovrin {

// === Creation ===============================================================================

// Rows x Cols zeros. Nothing is checked: Rows = 0 gives an empty matrix, Cols = 0 gives Rows
// empty rows.
TQENFloatMatrix CreateFloatMatrix(LongWord Rows, LongWord Cols);
TQENDoubleMatrix CreateDoubleMatrix(LongWord Rows, LongWord Cols);
TQENSingleMatrix CreateSingleMatrix(LongWord Rows, LongWord Cols);
TQENInt64Matrix CreateInt64Matrix(LongWord Rows, LongWord Cols);
TQENLWordMatrix CreateLWordMatrix(LongWord Rows, LongWord Cols);
TQENLIntMatrix CreateLIntMatrix(LongWord Rows, LongWord Cols);
TQENWordMatrix CreateWordMatrix(LongWord Rows, LongWord Cols);
TQENSmallIntMatrix CreateSmallIntMatrix(LongWord Rows, LongWord Cols);
TQENByteMatrix CreateByteMatrix(LongWord Rows, LongWord Cols);
TQENSIntMatrix CreateSIntMatrix(LongWord Rows, LongWord Cols);

// N x N zeros with 1 on the diagonal; N = 0 gives an empty matrix.
TQENFloatMatrix CreateFloatIdentityMatrix(LongWord N);
TQENDoubleMatrix CreateDoubleIdentityMatrix(LongWord N);
TQENSingleMatrix CreateSingleIdentityMatrix(LongWord N);
TQENInt64Matrix CreateInt64IdentityMatrix(LongWord N);
TQENLWordMatrix CreateLWordIdentityMatrix(LongWord N);
TQENLIntMatrix CreateLIntIdentityMatrix(LongWord N);
TQENWordMatrix CreateWordIdentityMatrix(LongWord N);
TQENSmallIntMatrix CreateSmallIntIdentityMatrix(LongWord N);
TQENByteMatrix CreateByteIdentityMatrix(LongWord N);
TQENSIntMatrix CreateSIntIdentityMatrix(LongWord N);

// === Shape queries ==========================================================================

// The number of rows.
LongInt MatrixRows(const TQENFloatMatrix& M);
LongInt MatrixRows(const TQENDoubleMatrix& M);
LongInt MatrixRows(const TQENSingleMatrix& M);
LongInt MatrixRows(const TQENInt64Matrix& M);
LongInt MatrixRows(const TQENLWordMatrix& M);
LongInt MatrixRows(const TQENLIntMatrix& M);
LongInt MatrixRows(const TQENWordMatrix& M);
LongInt MatrixRows(const TQENSmallIntMatrix& M);
LongInt MatrixRows(const TQENByteMatrix& M);
LongInt MatrixRows(const TQENSIntMatrix& M);

// The length of row 0 (0 for a matrix with no rows); other rows are not looked at.
LongInt MatrixCols(const TQENFloatMatrix& M);
LongInt MatrixCols(const TQENDoubleMatrix& M);
LongInt MatrixCols(const TQENSingleMatrix& M);
LongInt MatrixCols(const TQENInt64Matrix& M);
LongInt MatrixCols(const TQENLWordMatrix& M);
LongInt MatrixCols(const TQENLIntMatrix& M);
LongInt MatrixCols(const TQENWordMatrix& M);
LongInt MatrixCols(const TQENSmallIntMatrix& M);
LongInt MatrixCols(const TQENByteMatrix& M);
LongInt MatrixCols(const TQENSIntMatrix& M);

// True when there is at least one row and every row has the length of row 0. Ignores
// QENMatrixRectangularCheck.
bool MatrixIsRectangular(const TQENFloatMatrix& M);
bool MatrixIsRectangular(const TQENDoubleMatrix& M);
bool MatrixIsRectangular(const TQENSingleMatrix& M);
bool MatrixIsRectangular(const TQENInt64Matrix& M);
bool MatrixIsRectangular(const TQENLWordMatrix& M);
bool MatrixIsRectangular(const TQENLIntMatrix& M);
bool MatrixIsRectangular(const TQENWordMatrix& M);
bool MatrixIsRectangular(const TQENSmallIntMatrix& M);
bool MatrixIsRectangular(const TQENByteMatrix& M);
bool MatrixIsRectangular(const TQENSIntMatrix& M);

// Rows is the row count and Cols the length of row 0 (0 without rows). With
// QENMatrixRectangularCheck off, Rectangular is always True and the shape is row 0's. With it on,
// an empty matrix or an empty row 0 gives Rectangular False; a row of another length gives
// Cols 0 and Rectangular False.
void MatrixDimensions(const TQENFloatMatrix& M, LongWord& Rows, LongWord& Cols, bool& Rectangular);
void MatrixDimensions(const TQENDoubleMatrix& M, LongWord& Rows, LongWord& Cols, bool& Rectangular);
void MatrixDimensions(const TQENSingleMatrix& M, LongWord& Rows, LongWord& Cols, bool& Rectangular);
void MatrixDimensions(const TQENInt64Matrix& M, LongWord& Rows, LongWord& Cols, bool& Rectangular);
void MatrixDimensions(const TQENLWordMatrix& M, LongWord& Rows, LongWord& Cols, bool& Rectangular);
void MatrixDimensions(const TQENLIntMatrix& M, LongWord& Rows, LongWord& Cols, bool& Rectangular);
void MatrixDimensions(const TQENWordMatrix& M, LongWord& Rows, LongWord& Cols, bool& Rectangular);
void MatrixDimensions(const TQENSmallIntMatrix& M, LongWord& Rows, LongWord& Cols,
                      bool& Rectangular);
void MatrixDimensions(const TQENByteMatrix& M, LongWord& Rows, LongWord& Cols, bool& Rectangular);
void MatrixDimensions(const TQENSIntMatrix& M, LongWord& Rows, LongWord& Cols, bool& Rectangular);

// Rectangular (as MatrixDimensions reports it) with Rows = Cols.
bool MatrixIsSquare(const TQENFloatMatrix& M);
bool MatrixIsSquare(const TQENDoubleMatrix& M);
bool MatrixIsSquare(const TQENSingleMatrix& M);
bool MatrixIsSquare(const TQENInt64Matrix& M);
bool MatrixIsSquare(const TQENLWordMatrix& M);
bool MatrixIsSquare(const TQENLIntMatrix& M);
bool MatrixIsSquare(const TQENWordMatrix& M);
bool MatrixIsSquare(const TQENSmallIntMatrix& M);
bool MatrixIsSquare(const TQENByteMatrix& M);
bool MatrixIsSquare(const TQENSIntMatrix& M);

// Both rectangular (as MatrixDimensions reports it) with equal row and column counts.
bool MatricesSameDimensions(const TQENFloatMatrix& M1, const TQENFloatMatrix& M2);
bool MatricesSameDimensions(const TQENDoubleMatrix& M1, const TQENDoubleMatrix& M2);
bool MatricesSameDimensions(const TQENSingleMatrix& M1, const TQENSingleMatrix& M2);
bool MatricesSameDimensions(const TQENInt64Matrix& M1, const TQENInt64Matrix& M2);
bool MatricesSameDimensions(const TQENLWordMatrix& M1, const TQENLWordMatrix& M2);
bool MatricesSameDimensions(const TQENLIntMatrix& M1, const TQENLIntMatrix& M2);
bool MatricesSameDimensions(const TQENWordMatrix& M1, const TQENWordMatrix& M2);
bool MatricesSameDimensions(const TQENSmallIntMatrix& M1, const TQENSmallIntMatrix& M2);
bool MatricesSameDimensions(const TQENByteMatrix& M1, const TQENByteMatrix& M2);
bool MatricesSameDimensions(const TQENSIntMatrix& M1, const TQENSIntMatrix& M2);

// === Conversion =============================================================================

// A TQENFloatMatrix of the same (possibly ragged) shape holding every element exactly.
TQENFloatMatrix Matrix2FloatMatrix(const TQENFloatMatrix& M);
TQENFloatMatrix Matrix2FloatMatrix(const TQENDoubleMatrix& M);
TQENFloatMatrix Matrix2FloatMatrix(const TQENSingleMatrix& M);
TQENFloatMatrix Matrix2FloatMatrix(const TQENInt64Matrix& M);
TQENFloatMatrix Matrix2FloatMatrix(const TQENLWordMatrix& M);
TQENFloatMatrix Matrix2FloatMatrix(const TQENLIntMatrix& M);
TQENFloatMatrix Matrix2FloatMatrix(const TQENWordMatrix& M);
TQENFloatMatrix Matrix2FloatMatrix(const TQENSmallIntMatrix& M);
TQENFloatMatrix Matrix2FloatMatrix(const TQENByteMatrix& M);
TQENFloatMatrix Matrix2FloatMatrix(const TQENSIntMatrix& M);

// === Two-matrix arithmetic ==================================================================

// Element-by-element sums and differences over M1's Rows x Cols. Checks, in order: an M1
// with no rows raises EAccessViolation (its row 0 is read before anything else); an empty row 0
// of M1 raises rsMatrixIsEmpty; shapes that differ, or an operand that is not rectangular under
// QENMatrixRectangularCheck, raise rsSameDimensions; with the switch off, a row of either
// operand shorter than the column count raises rsMatrixRect. Integer elements wrap. The Double
// and Single members compute in Extended and round once on store.
TQENFloatMatrix AddMatrices(const TQENFloatMatrix& M1, const TQENFloatMatrix& M2);
TQENDoubleMatrix AddMatrices(const TQENDoubleMatrix& M1, const TQENDoubleMatrix& M2);
TQENSingleMatrix AddMatrices(const TQENSingleMatrix& M1, const TQENSingleMatrix& M2);
TQENInt64Matrix AddMatrices(const TQENInt64Matrix& M1, const TQENInt64Matrix& M2);
TQENLIntMatrix AddMatrices(const TQENLIntMatrix& M1, const TQENLIntMatrix& M2);

//
TQENFloatMatrix SubtractMatrices(const TQENFloatMatrix& M1, const TQENFloatMatrix& M2);
TQENDoubleMatrix SubtractMatrices(const TQENDoubleMatrix& M1, const TQENDoubleMatrix& M2);
TQENSingleMatrix SubtractMatrices(const TQENSingleMatrix& M1, const TQENSingleMatrix& M2);
TQENInt64Matrix SubtractMatrices(const TQENInt64Matrix& M1, const TQENInt64Matrix& M2);
TQENLIntMatrix SubtractMatrices(const TQENLIntMatrix& M1, const TQENLIntMatrix& M2);

// In place into M1, with the same checks.
void AddToMatrix(TQENFloatMatrix& M1, const TQENFloatMatrix& M2);
void AddToMatrix(TQENDoubleMatrix& M1, const TQENDoubleMatrix& M2);
void AddToMatrix(TQENSingleMatrix& M1, const TQENSingleMatrix& M2);
void AddToMatrix(TQENInt64Matrix& M1, const TQENInt64Matrix& M2);
void AddToMatrix(TQENLIntMatrix& M1, const TQENLIntMatrix& M2);

//
void SubtractFromMatrix(TQENFloatMatrix& M1, const TQENFloatMatrix& M2);
void SubtractFromMatrix(TQENDoubleMatrix& M1, const TQENDoubleMatrix& M2);
void SubtractFromMatrix(TQENSingleMatrix& M1, const TQENSingleMatrix& M2);
void SubtractFromMatrix(TQENInt64Matrix& M1, const TQENInt64Matrix& M2);
void SubtractFromMatrix(TQENLIntMatrix& M1, const TQENLIntMatrix& M2);

// === Scalar arithmetic ======================================================================

// K x element for every element of every row, each row at its own length (ragged matrices
// are fine). rsMatrixIsEmpty for a matrix with no rows. Float members compute in Extended; the
// Int64 member multiplies in 64 bits and the LInt member in 32 bits, wrapping.
TQENFloatMatrix MultiplyMatrixByConst(const TQENFloatMatrix& M, Extended K);
TQENDoubleMatrix MultiplyMatrixByConst(const TQENDoubleMatrix& M, Extended K);
TQENSingleMatrix MultiplyMatrixByConst(const TQENSingleMatrix& M, Extended K);
TQENInt64Matrix MultiplyMatrixByConst(const TQENInt64Matrix& M, Int64 K);
TQENLIntMatrix MultiplyMatrixByConst(const TQENLIntMatrix& M, LongInt K);

// The same, in place.
void MultiplyMatrixByConst2(TQENFloatMatrix& M, Extended K);
void MultiplyMatrixByConst2(TQENDoubleMatrix& M, Extended K);
void MultiplyMatrixByConst2(TQENSingleMatrix& M, Extended K);
void MultiplyMatrixByConst2(TQENInt64Matrix& M, Int64 K);
void MultiplyMatrixByConst2(TQENLIntMatrix& M, LongInt K);

// Element := element x A + B in place, with the same rules.
void LinearTransformMatrix(TQENFloatMatrix& M, Extended A, Extended B);
void LinearTransformMatrix(TQENDoubleMatrix& M, Extended A, Extended B);
void LinearTransformMatrix(TQENSingleMatrix& M, Extended A, Extended B);
void LinearTransformMatrix(TQENInt64Matrix& M, Int64 A, Int64 B);
void LinearTransformMatrix(TQENLIntMatrix& M, LongInt A, LongInt B);

// === Element-wise functions =================================================================

// In place, rows in order and each row left to right at its own length, computed in Extended.
// rsMatrixIsEmpty for a matrix with no rows. The domain of each element is tested just before it
// is replaced (exact comparisons): SqrtMatrix raises rsMatrixNeg for an element < 0, InvMatrix
// rsMatrixZero for an element = 0, LnMatrix and Log10Matrix rsMatrixNotPos for an element <= 0.
// There is no roll-back: elements visited before the failing one keep their new values.
void SquareMatrix(TQENFloatMatrix& M);
void SquareMatrix(TQENDoubleMatrix& M);
void SquareMatrix(TQENSingleMatrix& M);

//
void SqrtMatrix(TQENFloatMatrix& M);
void SqrtMatrix(TQENDoubleMatrix& M);
void SqrtMatrix(TQENSingleMatrix& M);

//
void InvMatrix(TQENFloatMatrix& M);
void InvMatrix(TQENDoubleMatrix& M);
void InvMatrix(TQENSingleMatrix& M);

//
void LnMatrix(TQENFloatMatrix& M);
void LnMatrix(TQENDoubleMatrix& M);
void LnMatrix(TQENSingleMatrix& M);

//
void Log10Matrix(TQENFloatMatrix& M);
void Log10Matrix(TQENDoubleMatrix& M);
void Log10Matrix(TQENSingleMatrix& M);

// === Aggregate ==============================================================================

// The mean of every element of every row, summed in Extended; N receives the element count.
// rsMatrixIsEmpty for a matrix with no rows or with only empty rows.
Extended GrandMean(const TQENFloatMatrix& M, LongWord& N);
Extended GrandMean(const TQENDoubleMatrix& M, LongWord& N);
Extended GrandMean(const TQENSingleMatrix& M, LongWord& N);
Extended GrandMean(const TQENInt64Matrix& M, LongWord& N);
Extended GrandMean(const TQENLIntMatrix& M, LongWord& N);

// === Row and column operations ==============================================================

// The in-place row and column operations and the sums check, in order: no rows or no columns
// (rsMatrixIsEmpty); not rectangular (rsMatrixRect); an index past the last row (rsInvalidRow)
// or column (rsInvalidCol). Rows, columns and shape are those MatrixDimensions reports, so under
// QENMatrixRectangularCheck a ragged matrix has no columns and fails the first check; with the
// switch off, a row too short for the columns the operation touches raises rsMatrixRect. A
// failed check changes nothing.
//
// Swaps: equal indices return at once, without any check. Rows are exchanged element by element
// over the column count (the row storage stays where it is).
void SwapMatrixRows(TQENFloatMatrix& M, LongWord Row1, LongWord Row2);
void SwapMatrixRows(TQENDoubleMatrix& M, LongWord Row1, LongWord Row2);
void SwapMatrixRows(TQENSingleMatrix& M, LongWord Row1, LongWord Row2);
void SwapMatrixRows(TQENInt64Matrix& M, LongWord Row1, LongWord Row2);
void SwapMatrixRows(TQENLWordMatrix& M, LongWord Row1, LongWord Row2);
void SwapMatrixRows(TQENLIntMatrix& M, LongWord Row1, LongWord Row2);
void SwapMatrixRows(TQENWordMatrix& M, LongWord Row1, LongWord Row2);
void SwapMatrixRows(TQENSmallIntMatrix& M, LongWord Row1, LongWord Row2);
void SwapMatrixRows(TQENByteMatrix& M, LongWord Row1, LongWord Row2);
void SwapMatrixRows(TQENSIntMatrix& M, LongWord Row1, LongWord Row2);

//
void SwapMatrixCols(TQENFloatMatrix& M, LongWord Col1, LongWord Col2);
void SwapMatrixCols(TQENDoubleMatrix& M, LongWord Col1, LongWord Col2);
void SwapMatrixCols(TQENSingleMatrix& M, LongWord Col1, LongWord Col2);
void SwapMatrixCols(TQENInt64Matrix& M, LongWord Col1, LongWord Col2);
void SwapMatrixCols(TQENLWordMatrix& M, LongWord Col1, LongWord Col2);
void SwapMatrixCols(TQENLIntMatrix& M, LongWord Col1, LongWord Col2);
void SwapMatrixCols(TQENWordMatrix& M, LongWord Col1, LongWord Col2);
void SwapMatrixCols(TQENSmallIntMatrix& M, LongWord Col1, LongWord Col2);
void SwapMatrixCols(TQENByteMatrix& M, LongWord Col1, LongWord Col2);
void SwapMatrixCols(TQENSIntMatrix& M, LongWord Col1, LongWord Col2);

// Element := K x element along a row or a column. K exactly 1 returns at once, without any
// check. Int64 multiplies in 64 bits and LInt in 32 bits, wrapping.
void ScaleMatrixRow(TQENFloatMatrix& M, LongWord Row, Extended K);
void ScaleMatrixRow(TQENDoubleMatrix& M, LongWord Row, Extended K);
void ScaleMatrixRow(TQENSingleMatrix& M, LongWord Row, Extended K);
void ScaleMatrixRow(TQENInt64Matrix& M, LongWord Row, Int64 K);
void ScaleMatrixRow(TQENLIntMatrix& M, LongWord Row, LongInt K);

//
void ScaleMatrixCol(TQENFloatMatrix& M, LongWord Col, Extended K);
void ScaleMatrixCol(TQENDoubleMatrix& M, LongWord Col, Extended K);
void ScaleMatrixCol(TQENSingleMatrix& M, LongWord Col, Extended K);
void ScaleMatrixCol(TQENInt64Matrix& M, LongWord Col, Int64 K);
void ScaleMatrixCol(TQENLIntMatrix& M, LongWord Col, LongInt K);

// M[Row1][j] := M[Row1][j] + K x M[Row2][j] for every column (AddMatrixCols likewise down the
// columns). No shortcut: K = 0 still checks and rewrites.
void AddMatrixRows(TQENFloatMatrix& M, LongWord Row1, LongWord Row2, Extended K);
void AddMatrixRows(TQENDoubleMatrix& M, LongWord Row1, LongWord Row2, Extended K);
void AddMatrixRows(TQENSingleMatrix& M, LongWord Row1, LongWord Row2, Extended K);
void AddMatrixRows(TQENInt64Matrix& M, LongWord Row1, LongWord Row2, Int64 K);
void AddMatrixRows(TQENLIntMatrix& M, LongWord Row1, LongWord Row2, LongInt K);

//
void AddMatrixCols(TQENFloatMatrix& M, LongWord Col1, LongWord Col2, Extended K);
void AddMatrixCols(TQENDoubleMatrix& M, LongWord Col1, LongWord Col2, Extended K);
void AddMatrixCols(TQENSingleMatrix& M, LongWord Col1, LongWord Col2, Extended K);
void AddMatrixCols(TQENInt64Matrix& M, LongWord Col1, LongWord Col2, Int64 K);
void AddMatrixCols(TQENLIntMatrix& M, LongWord Col1, LongWord Col2, LongInt K);

// Whole rows ordered by their element in column Col (QSortMatrixColsOnRow: whole columns by
// their element in row Row), by the explicit-stack quick sort, exact comparisons, not stable.
// Unless there are at least two rows and two columns (as MatrixDimensions reports them: under
// the switch a ragged matrix has none) nothing is checked or changed. Then rsMatrixRect, then
// rsInvalidCol (rsInvalidRow); with the switch off a row shorter than the column count raises
// rsMatrixRect.
void QSortMatrixRowsOnCol(TQENFloatMatrix& M, LongWord Col, bool Ascending);
void QSortMatrixRowsOnCol(TQENDoubleMatrix& M, LongWord Col, bool Ascending);
void QSortMatrixRowsOnCol(TQENSingleMatrix& M, LongWord Col, bool Ascending);
void QSortMatrixRowsOnCol(TQENInt64Matrix& M, LongWord Col, bool Ascending);
void QSortMatrixRowsOnCol(TQENLWordMatrix& M, LongWord Col, bool Ascending);
void QSortMatrixRowsOnCol(TQENLIntMatrix& M, LongWord Col, bool Ascending);
void QSortMatrixRowsOnCol(TQENWordMatrix& M, LongWord Col, bool Ascending);
void QSortMatrixRowsOnCol(TQENSmallIntMatrix& M, LongWord Col, bool Ascending);
void QSortMatrixRowsOnCol(TQENByteMatrix& M, LongWord Col, bool Ascending);
void QSortMatrixRowsOnCol(TQENSIntMatrix& M, LongWord Col, bool Ascending);

//
void QSortMatrixColsOnRow(TQENFloatMatrix& M, LongWord Row, bool Ascending);
void QSortMatrixColsOnRow(TQENDoubleMatrix& M, LongWord Row, bool Ascending);
void QSortMatrixColsOnRow(TQENSingleMatrix& M, LongWord Row, bool Ascending);
void QSortMatrixColsOnRow(TQENInt64Matrix& M, LongWord Row, bool Ascending);
void QSortMatrixColsOnRow(TQENLWordMatrix& M, LongWord Row, bool Ascending);
void QSortMatrixColsOnRow(TQENLIntMatrix& M, LongWord Row, bool Ascending);
void QSortMatrixColsOnRow(TQENWordMatrix& M, LongWord Row, bool Ascending);
void QSortMatrixColsOnRow(TQENSmallIntMatrix& M, LongWord Row, bool Ascending);
void QSortMatrixColsOnRow(TQENByteMatrix& M, LongWord Row, bool Ascending);
void QSortMatrixColsOnRow(TQENSIntMatrix& M, LongWord Row, bool Ascending);

// A copy of row Row (Cols elements) or column Col (Rows elements). An empty matrix, or one
// with no columns, gives an empty vector without error; otherwise rsInvalidRow / rsInvalidCol.
// The rectangular flag is not tested (under the switch a ragged matrix reports no columns).
TQENFloatVector ExtractMatrixRow(const TQENFloatMatrix& M, LongWord Row);
TQENDoubleVector ExtractMatrixRow(const TQENDoubleMatrix& M, LongWord Row);
TQENSingleVector ExtractMatrixRow(const TQENSingleMatrix& M, LongWord Row);
TQENInt64Vector ExtractMatrixRow(const TQENInt64Matrix& M, LongWord Row);
TQENLWordVector ExtractMatrixRow(const TQENLWordMatrix& M, LongWord Row);
TQENLIntVector ExtractMatrixRow(const TQENLIntMatrix& M, LongWord Row);
TQENWordVector ExtractMatrixRow(const TQENWordMatrix& M, LongWord Row);
TQENSmallIntVector ExtractMatrixRow(const TQENSmallIntMatrix& M, LongWord Row);
TQENByteVector ExtractMatrixRow(const TQENByteMatrix& M, LongWord Row);
TQENSIntVector ExtractMatrixRow(const TQENSIntMatrix& M, LongWord Row);

//
TQENFloatVector ExtractMatrixCol(const TQENFloatMatrix& M, LongWord Col);
TQENDoubleVector ExtractMatrixCol(const TQENDoubleMatrix& M, LongWord Col);
TQENSingleVector ExtractMatrixCol(const TQENSingleMatrix& M, LongWord Col);
TQENInt64Vector ExtractMatrixCol(const TQENInt64Matrix& M, LongWord Col);
TQENLWordVector ExtractMatrixCol(const TQENLWordMatrix& M, LongWord Col);
TQENLIntVector ExtractMatrixCol(const TQENLIntMatrix& M, LongWord Col);
TQENWordVector ExtractMatrixCol(const TQENWordMatrix& M, LongWord Col);
TQENSmallIntVector ExtractMatrixCol(const TQENSmallIntMatrix& M, LongWord Col);
TQENByteVector ExtractMatrixCol(const TQENByteMatrix& M, LongWord Col);
TQENSIntVector ExtractMatrixCol(const TQENSIntMatrix& M, LongWord Col);

// Row Row (column Col) becomes V, cut to the column (row) count or padded with Fill. Nothing
// happens for a matrix with no rows or no columns; otherwise rsInvalidRow / rsInvalidCol.
void OverwriteMatrixRow(TQENFloatMatrix& M, LongWord Row, const TQENFloatVector& V, Extended Fill);
void OverwriteMatrixRow(TQENDoubleMatrix& M, LongWord Row, const TQENDoubleVector& V, Double Fill);
void OverwriteMatrixRow(TQENSingleMatrix& M, LongWord Row, const TQENSingleVector& V, Single Fill);
void OverwriteMatrixRow(TQENInt64Matrix& M, LongWord Row, const TQENInt64Vector& V, Int64 Fill);
void OverwriteMatrixRow(TQENLWordMatrix& M, LongWord Row, const TQENLWordVector& V, LongWord Fill);
void OverwriteMatrixRow(TQENLIntMatrix& M, LongWord Row, const TQENLIntVector& V, LongInt Fill);
void OverwriteMatrixRow(TQENWordMatrix& M, LongWord Row, const TQENWordVector& V, Word Fill);
void OverwriteMatrixRow(TQENSmallIntMatrix& M, LongWord Row, const TQENSmallIntVector& V,
                        SmallInt Fill);
void OverwriteMatrixRow(TQENByteMatrix& M, LongWord Row, const TQENByteVector& V, Byte Fill);
void OverwriteMatrixRow(TQENSIntMatrix& M, LongWord Row, const TQENSIntVector& V, ShortInt Fill);

//
void OverwriteMatrixCol(TQENFloatMatrix& M, LongWord Col, const TQENFloatVector& V, Extended Fill);
void OverwriteMatrixCol(TQENDoubleMatrix& M, LongWord Col, const TQENDoubleVector& V, Double Fill);
void OverwriteMatrixCol(TQENSingleMatrix& M, LongWord Col, const TQENSingleVector& V, Single Fill);
void OverwriteMatrixCol(TQENInt64Matrix& M, LongWord Col, const TQENInt64Vector& V, Int64 Fill);
void OverwriteMatrixCol(TQENLWordMatrix& M, LongWord Col, const TQENLWordVector& V, LongWord Fill);
void OverwriteMatrixCol(TQENLIntMatrix& M, LongWord Col, const TQENLIntVector& V, LongInt Fill);
void OverwriteMatrixCol(TQENWordMatrix& M, LongWord Col, const TQENWordVector& V, Word Fill);
void OverwriteMatrixCol(TQENSmallIntMatrix& M, LongWord Col, const TQENSmallIntVector& V,
                        SmallInt Fill);
void OverwriteMatrixCol(TQENByteMatrix& M, LongWord Col, const TQENByteVector& V, Byte Fill);
void OverwriteMatrixCol(TQENSIntMatrix& M, LongWord Col, const TQENSIntVector& V, ShortInt Fill);

// A deep copy keeping every row's length; never raises.
TQENFloatMatrix CopyMatrix(const TQENFloatMatrix& M);
TQENDoubleMatrix CopyMatrix(const TQENDoubleMatrix& M);
TQENSingleMatrix CopyMatrix(const TQENSingleMatrix& M);
TQENInt64Matrix CopyMatrix(const TQENInt64Matrix& M);
TQENLWordMatrix CopyMatrix(const TQENLWordMatrix& M);
TQENLIntMatrix CopyMatrix(const TQENLIntMatrix& M);
TQENWordMatrix CopyMatrix(const TQENWordMatrix& M);
TQENSmallIntMatrix CopyMatrix(const TQENSmallIntMatrix& M);
TQENByteMatrix CopyMatrix(const TQENByteMatrix& M);
TQENSIntMatrix CopyMatrix(const TQENSIntMatrix& M);

// Cols x Rows with r[j][i] = M[i][j]. rsMatrixRect when M is not rectangular (under the switch
// an empty matrix is not); an empty matrix gives an empty result when the switch is off.
TQENFloatMatrix TransposeMatrix(const TQENFloatMatrix& M);
TQENDoubleMatrix TransposeMatrix(const TQENDoubleMatrix& M);
TQENSingleMatrix TransposeMatrix(const TQENSingleMatrix& M);
TQENInt64Matrix TransposeMatrix(const TQENInt64Matrix& M);
TQENLWordMatrix TransposeMatrix(const TQENLWordMatrix& M);
TQENLIntMatrix TransposeMatrix(const TQENLIntMatrix& M);
TQENWordMatrix TransposeMatrix(const TQENWordMatrix& M);
TQENSmallIntMatrix TransposeMatrix(const TQENSmallIntMatrix& M);
TQENByteMatrix TransposeMatrix(const TQENByteMatrix& M);
TQENSIntMatrix TransposeMatrix(const TQENSIntMatrix& M);

// The matrix product. Checks, in order: either operand not rectangular (rsMatrixRect); either
// with no rows (rsMatrixIsEmpty); M1's column count differs from M2's row count (rsMatrixMult).
// Each element is accumulated over k ascending as r := r + M2[k][j] x M1[i][k] in Extended; the
// Double and Single members round every partial sum to the element type, so their results are
// bit for bit those of that order.
TQENFloatMatrix MultiplyMatrices(const TQENFloatMatrix& M1, const TQENFloatMatrix& M2);
TQENDoubleMatrix MultiplyMatrices(const TQENDoubleMatrix& M1, const TQENDoubleMatrix& M2);
TQENSingleMatrix MultiplyMatrices(const TQENSingleMatrix& M1, const TQENSingleMatrix& M2);

// The sum of the Cols elements of a row (of the Rows elements of a column), from index 0 up,
// in Extended for the float types and in a wrapping 64-bit accumulator for the integer types.
// Checks as the in-place operations. There is deliberately no LInt overload.
Extended SumMatrixRow(const TQENFloatMatrix& M, LongWord Row);
Extended SumMatrixRow(const TQENDoubleMatrix& M, LongWord Row);
Extended SumMatrixRow(const TQENSingleMatrix& M, LongWord Row);
Int64 SumMatrixRow(const TQENInt64Matrix& M, LongWord Row);
Int64 SumMatrixRow(const TQENLWordMatrix& M, LongWord Row);
Int64 SumMatrixRow(const TQENSmallIntMatrix& M, LongWord Row);
Int64 SumMatrixRow(const TQENWordMatrix& M, LongWord Row);
Int64 SumMatrixRow(const TQENSIntMatrix& M, LongWord Row);
Int64 SumMatrixRow(const TQENByteMatrix& M, LongWord Row);

//
Extended SumMatrixCol(const TQENFloatMatrix& M, LongWord Col);
Extended SumMatrixCol(const TQENDoubleMatrix& M, LongWord Col);
Extended SumMatrixCol(const TQENSingleMatrix& M, LongWord Col);
Int64 SumMatrixCol(const TQENInt64Matrix& M, LongWord Col);
Int64 SumMatrixCol(const TQENLWordMatrix& M, LongWord Col);
Int64 SumMatrixCol(const TQENSmallIntMatrix& M, LongWord Col);
Int64 SumMatrixCol(const TQENWordMatrix& M, LongWord Col);
Int64 SumMatrixCol(const TQENSIntMatrix& M, LongWord Col);
Int64 SumMatrixCol(const TQENByteMatrix& M, LongWord Col);

// === Row reduction ==========================================================================

// Gaussian elimination in place with partial pivoting on the largest magnitude in the leftmost
// column that has a non-zero entry (FloatIsNotZero; of equal magnitudes the upper row wins).
// Pivot rows are scaled to a leading 1 unless the pivot is within tolerance of 1; entries within
// tolerance of zero below a pivot are left alone; entries above pivots are not cleared.
// Checks: rsMatrixIsEmpty (no rows or no columns as MatrixDimensions reports them, so also a
// ragged matrix under QENMatrixRectangularCheck), then rsMatrixRect (not rectangular). With the
// switch off, a row shorter than the column count raises rsMatrixRect. The switch itself is
// never written, so other threads never see it change.
void RowEchelonForm(TQENFloatMatrix& M);
void RowEchelonForm(TQENDoubleMatrix& M);
void RowEchelonForm(TQENSingleMatrix& M);

// The same; Rank receives Rows - MatrixZeroRows of the reduced matrix.
void RowEchelonFormRank(TQENFloatMatrix& M, LongWord& Rank);
void RowEchelonFormRank(TQENDoubleMatrix& M, LongWord& Rank);
void RowEchelonFormRank(TQENSingleMatrix& M, LongWord& Rank);

// Gauss-Jordan inversion: Inverse starts as the identity and follows every row operation of
// the elimination; then the entries above the pivots are cleared. Returns False for a singular
// matrix (a zero row after the elimination), leaving M and Inverse partly reduced. Checks:
// rsMatrixIsEmpty, then rsMatrixSqr (not rectangular or not square). M is overwritten.
bool MatrixInverse(TQENFloatMatrix& M, TQENFloatMatrix& Inverse);
bool MatrixInverse(TQENDoubleMatrix& M, TQENDoubleMatrix& Inverse);
bool MatrixInverse(TQENSingleMatrix& M, TQENSingleMatrix& Inverse);

// The determinant by elimination (sign flips for swaps, pivot products for scalings, then the
// diagonal). A singular matrix gives 0 or a value of the order of the tolerance. Checks as
// MatrixInverse. M is overwritten by its row echelon form.
Extended MatrixDeterminant(TQENFloatMatrix& M);
Extended MatrixDeterminant(TQENDoubleMatrix& M);
Extended MatrixDeterminant(TQENSingleMatrix& M);

// The number of rows whose elements are all zero (VectorZero, each row at its own length).
// Checks: rsMatrixIsEmpty, then rsMatrixRect; with the switch off an empty row makes VectorZero
// raise rsVectorIsEmpty.
LongWord MatrixZeroRows(const TQENFloatMatrix& M);
LongWord MatrixZeroRows(const TQENDoubleMatrix& M);
LongWord MatrixZeroRows(const TQENSingleMatrix& M);

// True unless a diagonal element is not within tolerance of 1 or an off-diagonal element not
// within tolerance of 0. Checks: rsMatrixIsEmpty, then rsMatrixSqr.
bool MatrixIsIdentity(const TQENFloatMatrix& M);
bool MatrixIsIdentity(const TQENDoubleMatrix& M);
bool MatrixIsIdentity(const TQENSingleMatrix& M);

}  // namespace tovrin
