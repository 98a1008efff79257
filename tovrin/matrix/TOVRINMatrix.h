// Matrix creation, shape queries, arithmetic, row and column operations, row reduction.
//
// A matrix is a vector of rows (element [i][j] is row i, column j); rows may differ in length.
// Shape checks follow QENMatrixRectangularCheck: with it on (the default) operations that need
// a rectangular matrix walk every row; with it off they take the shape from row 0, and a row
// that is too short for the columns an operation would touch raises rsMatrixRect instead of
// being read past its end. Failed checks raise EMathError before anything is changed (the
// element-wise functions stop where an element fails, keeping what they already wrote).
// Floating-point work is done in Extended and rounded to the element type on store. The shape
// queries (all but MatrixRows and MatrixCols) and the row and column moves, copies and
// transposition also take the three money matrices of TOVRINFinMatrix.h, whose stored integers they
// compare exactly.
#pragma once

#include <atomic>
#include <vector>

#include "tovrin/foundation/TOVRINElementTypes.h"
#include "tovrin/foundation/TOVRINFoundation.h"

namespace tovrin {

// Whether shape checks walk every row of a matrix (true, the start-up value) or trust row 0
// (false). Process-wide; the library reads it and never writes it.
extern std::atomic<bool> QENMatrixRectangularCheck;

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
template <detail::AnyElement T>
LongInt MatrixRows(const detail::MatrixOf<T>& M);

// The length of row 0 (0 for a matrix with no rows); other rows are not looked at.
template <detail::AnyElement T>
LongInt MatrixCols(const detail::MatrixOf<T>& M);

// True when there is at least one row and every row has the length of row 0. Ignores
// QENMatrixRectangularCheck.
template <detail::AnyOrMoneyElement T>
bool MatrixIsRectangular(const detail::MatrixOf<T>& M);

// Rows is the row count and Cols the length of row 0 (0 without rows). With
// QENMatrixRectangularCheck off, Rectangular is always True and the shape is row 0's. With it on,
// an empty matrix or an empty row 0 gives Rectangular False; a row of another length gives
// Cols 0 and Rectangular False.
template <detail::AnyOrMoneyElement T>
void MatrixDimensions(const detail::MatrixOf<T>& M, LongWord& Rows, LongWord& Cols,
                      bool& Rectangular);

// Rectangular (as MatrixDimensions reports it) with Rows = Cols.
template <detail::AnyOrMoneyElement T>
bool MatrixIsSquare(const detail::MatrixOf<T>& M);

// Both rectangular (as MatrixDimensions reports it) with equal row and column counts.
template <detail::AnyOrMoneyElement T>
bool MatricesSameDimensions(const detail::MatrixOf<T>& M1, const detail::MatrixOf<T>& M2);

// === Conversion =============================================================================

// A TQENFloatMatrix of the same (possibly ragged) shape holding every element exactly.
template <detail::AnyElement T>
TQENFloatMatrix Matrix2FloatMatrix(const detail::MatrixOf<T>& M);

// === Two-matrix arithmetic ==================================================================

// Element-by-element sums and differences over M1's Rows x Cols. Checks, in order: an M1
// with no rows raises EAccessViolation (its row 0 is read before anything else); an empty row 0
// of M1 raises rsMatrixIsEmpty; shapes that differ, or an operand that is not rectangular under
// QENMatrixRectangularCheck, raise rsSameDimensions; with the switch off, a row of either
// operand shorter than the column count raises rsMatrixRect. Integer elements wrap. The Double
// and Single members compute in Extended and round once on store.
template <detail::ArithmeticElement T>
detail::MatrixOf<T> AddMatrices(const detail::MatrixOf<T>& M1, const detail::MatrixOf<T>& M2);
template <detail::ArithmeticElement T>
detail::MatrixOf<T> SubtractMatrices(const detail::MatrixOf<T>& M1, const detail::MatrixOf<T>& M2);

// In place into M1, with the same checks.
template <detail::ArithmeticElement T>
void AddToMatrix(detail::MatrixOf<T>& M1, const detail::MatrixOf<T>& M2);
template <detail::ArithmeticElement T>
void SubtractFromMatrix(detail::MatrixOf<T>& M1, const detail::MatrixOf<T>& M2);

// === Scalar arithmetic ======================================================================

// K x element for every element of every row, each row at its own length (ragged matrices
// are fine). rsMatrixIsEmpty for a matrix with no rows. Float members compute in Extended; the
// Int64 member multiplies in 64 bits and the LInt member in 32 bits, wrapping.
template <detail::ArithmeticElement T>
detail::MatrixOf<T> MultiplyMatrixByConst(const detail::MatrixOf<T>& M, detail::ScalarOf<T> K);

// The same, in place.
template <detail::ArithmeticElement T>
void MultiplyMatrixByConst2(detail::MatrixOf<T>& M, detail::ScalarOf<T> K);

// Element := element x A + B in place, with the same rules.
template <detail::ArithmeticElement T>
void LinearTransformMatrix(detail::MatrixOf<T>& M, detail::ScalarOf<T> A, detail::ScalarOf<T> B);

// === Element-wise functions =================================================================

// In place, rows in order and each row left to right at its own length, computed in Extended.
// rsMatrixIsEmpty for a matrix with no rows. The domain of each element is tested just before it
// is replaced (exact comparisons): SqrtMatrix raises rsMatrixNeg for an element < 0, InvMatrix
// rsMatrixZero for an element = 0, LnMatrix and Log10Matrix rsMatrixNotPos for an element <= 0.
// There is no roll-back: elements visited before the failing one keep their new values.
template <detail::FloatElement T>
void SquareMatrix(detail::MatrixOf<T>& M);
template <detail::FloatElement T>
void SqrtMatrix(detail::MatrixOf<T>& M);
template <detail::FloatElement T>
void InvMatrix(detail::MatrixOf<T>& M);
template <detail::FloatElement T>
void LnMatrix(detail::MatrixOf<T>& M);
template <detail::FloatElement T>
void Log10Matrix(detail::MatrixOf<T>& M);

// === Aggregate ==============================================================================

// The mean of every element of every row, summed in Extended; N receives the element count.
// rsMatrixIsEmpty for a matrix with no rows or with only empty rows.
template <detail::ArithmeticElement T>
Extended GrandMean(const detail::MatrixOf<T>& M, LongWord& N);

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
template <detail::AnyOrMoneyElement T>
void SwapMatrixRows(detail::MatrixOf<T>& M, LongWord Row1, LongWord Row2);
template <detail::AnyOrMoneyElement T>
void SwapMatrixCols(detail::MatrixOf<T>& M, LongWord Col1, LongWord Col2);

// Element := K x element along a row or a column. K exactly 1 returns at once, without any
// check. Int64 multiplies in 64 bits and LInt in 32 bits, wrapping.
template <detail::ArithmeticElement T>
void ScaleMatrixRow(detail::MatrixOf<T>& M, LongWord Row, detail::ScalarOf<T> K);
template <detail::ArithmeticElement T>
void ScaleMatrixCol(detail::MatrixOf<T>& M, LongWord Col, detail::ScalarOf<T> K);

// M[Row1][j] := M[Row1][j] + K x M[Row2][j] for every column (AddMatrixCols likewise down the
// columns). No shortcut: K = 0 still checks and rewrites.
template <detail::ArithmeticElement T>
void AddMatrixRows(detail::MatrixOf<T>& M, LongWord Row1, LongWord Row2, detail::ScalarOf<T> K);
template <detail::ArithmeticElement T>
void AddMatrixCols(detail::MatrixOf<T>& M, LongWord Col1, LongWord Col2, detail::ScalarOf<T> K);

// Whole rows ordered by their element in column Col (QSortMatrixColsOnRow: whole columns by
// their element in row Row), by the explicit-stack quick sort, exact comparisons, not stable.
// Unless there are at least two rows and two columns (as MatrixDimensions reports them: under
// the switch a ragged matrix has none) nothing is checked or changed. Then rsMatrixRect, then
// rsInvalidCol (rsInvalidRow); with the switch off a row shorter than the column count raises
// rsMatrixRect.
template <detail::AnyOrMoneyElement T>
void QSortMatrixRowsOnCol(detail::MatrixOf<T>& M, LongWord Col, bool Ascending);
template <detail::AnyOrMoneyElement T>
void QSortMatrixColsOnRow(detail::MatrixOf<T>& M, LongWord Row, bool Ascending);

// A copy of row Row (Cols elements) or column Col (Rows elements). An empty matrix, or one
// with no columns, gives an empty vector without error; otherwise rsInvalidRow / rsInvalidCol.
// The rectangular flag is not tested (under the switch a ragged matrix reports no columns).
template <detail::AnyOrMoneyElement T>
std::vector<T> ExtractMatrixRow(const detail::MatrixOf<T>& M, LongWord Row);
template <detail::AnyOrMoneyElement T>
std::vector<T> ExtractMatrixCol(const detail::MatrixOf<T>& M, LongWord Col);

// Row Row (column Col) becomes V, cut to the column (row) count or padded with Fill. Nothing
// happens for a matrix with no rows or no columns; otherwise rsInvalidRow / rsInvalidCol.
template <detail::AnyOrMoneyElement T>
void OverwriteMatrixRow(detail::MatrixOf<T>& M, LongWord Row, const std::vector<T>& V,
                        detail::ValueOf<T> Fill);
template <detail::AnyOrMoneyElement T>
void OverwriteMatrixCol(detail::MatrixOf<T>& M, LongWord Col, const std::vector<T>& V,
                        detail::ValueOf<T> Fill);

// A deep copy keeping every row's length; never raises.
template <detail::AnyOrMoneyElement T>
detail::MatrixOf<T> CopyMatrix(const detail::MatrixOf<T>& M);

// Cols x Rows with r[j][i] = M[i][j]. rsMatrixRect when M is not rectangular (under the switch
// an empty matrix is not); an empty matrix gives an empty result when the switch is off.
template <detail::AnyOrMoneyElement T>
detail::MatrixOf<T> TransposeMatrix(const detail::MatrixOf<T>& M);

// The matrix product. Checks, in order: either operand not rectangular (rsMatrixRect); either
// with no rows (rsMatrixIsEmpty); M1's column count differs from M2's row count (rsMatrixMult).
// Each element is accumulated over k ascending as r := r + M2[k][j] x M1[i][k] in Extended; the
// Double and Single members round every partial sum to the element type, so their results are
// bit for bit those of that order.
template <detail::FloatElement T>
detail::MatrixOf<T> MultiplyMatrices(const detail::MatrixOf<T>& M1, const detail::MatrixOf<T>& M2);

// The sum of the Cols elements of a row (of the Rows elements of a column), from index 0 up,
// in Extended for the float types and in a wrapping 64-bit accumulator for the integer types.
// Checks as the in-place operations. There is deliberately no LInt overload.
template <detail::RowSumElement T>
detail::SumOf<T> SumMatrixRow(const detail::MatrixOf<T>& M, LongWord Row);
template <detail::RowSumElement T>
detail::SumOf<T> SumMatrixCol(const detail::MatrixOf<T>& M, LongWord Col);

// === Row reduction ==========================================================================

// Gaussian elimination in place with partial pivoting on the largest magnitude in the leftmost
// column that has a non-zero entry (FloatIsNotZero; of equal magnitudes the upper row wins).
// Pivot rows are scaled to a leading 1 unless the pivot is within tolerance of 1; entries within
// tolerance of zero below a pivot are left alone; entries above pivots are not cleared.
// Checks: rsMatrixIsEmpty (no rows or no columns as MatrixDimensions reports them, so also a
// ragged matrix under QENMatrixRectangularCheck), then rsMatrixRect (not rectangular). With the
// switch off, a row shorter than the column count raises rsMatrixRect. The switch itself is
// never written, so other threads never see it change.
template <detail::FloatElement T>
void RowEchelonForm(detail::MatrixOf<T>& M);

// The same; Rank receives Rows - MatrixZeroRows of the reduced matrix.
template <detail::FloatElement T>
void RowEchelonFormRank(detail::MatrixOf<T>& M, LongWord& Rank);

// Gauss-Jordan inversion: Inverse starts as the identity and follows every row operation of
// the elimination; then the entries above the pivots are cleared. Returns False for a singular
// matrix (a zero row after the elimination), leaving M and Inverse partly reduced. Checks:
// rsMatrixIsEmpty, then rsMatrixSqr (not rectangular or not square). M is overwritten.
template <detail::FloatElement T>
bool MatrixInverse(detail::MatrixOf<T>& M, detail::MatrixOf<T>& Inverse);

// The determinant by elimination (sign flips for swaps, pivot products for scalings, then the
// diagonal). A singular matrix gives 0 or a value of the order of the tolerance. Checks as
// MatrixInverse. M is overwritten by its row echelon form.
template <detail::FloatElement T>
Extended MatrixDeterminant(detail::MatrixOf<T>& M);

// The number of rows whose elements are all zero (VectorZero, each row at its own length).
// Checks: rsMatrixIsEmpty, then rsMatrixRect; with the switch off an empty row makes VectorZero
// raise rsVectorIsEmpty.
template <detail::FloatElement T>
LongWord MatrixZeroRows(const detail::MatrixOf<T>& M);

// True unless a diagonal element is not within tolerance of 1 or an off-diagonal element not
// within tolerance of 0. Checks: rsMatrixIsEmpty, then rsMatrixSqr.
template <detail::FloatElement T>
bool MatrixIsIdentity(const detail::MatrixOf<T>& M);

}  // namespace tovrin
