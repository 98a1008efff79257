// Row and column operations shared by the numeric and the money matrix units: the common
// checks of the in-place row and column operations, swaps, the two matrix sorts, extraction,
// overwriting with padding and transposition. Element-type agnostic: elements are copied
// and exchanged whole (as SwapXY does, for the numeric and the money types alike); sort keys
// are compared with `<` on their value type.
#pragma once

#include <algorithm>
#include <cstddef>
#include <utility>
#include <vector>

#include "tovrin/detail/ElementRules.h"
#include "tovrin/detail/MatrixShape.h"
#include "tovrin/detail/QuickSort.h"
#include "tovrin/foundation/TOVRINErrors.h"

namespace tovrin::detail {

// Checks shared by the in-place row operations (swap, scale, add) and the row sums, in order:
// rsMatrixIsEmpty, rsMatrixRect, rsInvalidRow for any index past the last row. With the shape
// switch off, a named row shorter than the column count raises rsMatrixRect (memory guard).
template <typename T>
MatrixShape CheckRowOperation(const MatrixOf<T>& M, LongWord Row1, LongWord Row2) {
  const MatrixShape s = ShapeOf(M);
  if (s.Rows == 0 || s.Cols == 0) RaiseMathError(rsMatrixIsEmpty);
  if (!s.Rectangular) RaiseMathError(rsMatrixRect);
  if (Row1 >= s.Rows || Row2 >= s.Rows) RaiseMathError(rsInvalidRow);
  RequireRowReaches(M[Row1], s.Cols);
  RequireRowReaches(M[Row2], s.Cols);
  return s;
}

// The column counterpart: rsMatrixIsEmpty, rsMatrixRect, rsInvalidCol; with the switch off a
// row too short to hold both columns raises rsMatrixRect.
template <typename T>
MatrixShape CheckColOperation(const MatrixOf<T>& M, LongWord Col1, LongWord Col2) {
  const MatrixShape s = ShapeOf(M);
  if (s.Rows == 0 || s.Cols == 0) RaiseMathError(rsMatrixIsEmpty);
  if (!s.Rectangular) RaiseMathError(rsMatrixRect);
  if (Col1 >= s.Cols || Col2 >= s.Cols) RaiseMathError(rsInvalidCol);
  RequireRowsReach(M, std::size_t{std::max(Col1, Col2)} + 1);
  return s;
}

// Exchanges rows Row1 and Row2 element by element over the first Cols columns (the row
// storage stays where it is). No checks.
template <typename T>
void SwapRowElements(MatrixOf<T>& M, std::size_t Row1, std::size_t Row2, std::size_t Cols) {
  T* a = M[Row1].data();
  T* b = M[Row2].data();
  for (std::size_t j = 0; j < Cols; ++j) std::swap(a[j], b[j]);
}

// Exchanges columns Col1 and Col2 in every row. No checks.
template <typename T>
void SwapColElements(MatrixOf<T>& M, std::size_t Col1, std::size_t Col2) {
  for (auto& row : M) std::swap(row[Col1], row[Col2]);
}

// SwapMatrixRows: equal indices return at once, before any check.
template <typename T>
void SwapRowsOf(MatrixOf<T>& M, LongWord Row1, LongWord Row2) {
  if (Row1 == Row2) return;
  const MatrixShape s = CheckRowOperation(M, Row1, Row2);
  SwapRowElements(M, Row1, Row2, s.Cols);
}

// SwapMatrixCols: equal indices return at once, before any check.
template <typename T>
void SwapColsOf(MatrixOf<T>& M, LongWord Col1, LongWord Col2) {
  if (Col1 == Col2) return;
  CheckColOperation(M, Col1, Col2);
  SwapColElements(M, Col1, Col2);
}

// QSortMatrixRowsOnCol: whole rows ordered by their element in column Col, by the explicit
// stack quick sort (rows with equal keys end where that algorithm leaves them). Nothing is
// checked or done unless there are at least two rows and two columns.
template <typename T>
void QSortRowsOnColOf(MatrixOf<T>& M, LongWord Col, bool Ascending) {
  const MatrixShape s = ShapeOf(M);
  if (!(s.Rows > 1 && s.Cols > 1)) return;
  if (!s.Rectangular) RaiseMathError(rsMatrixRect);
  if (Col >= s.Cols) RaiseMathError(rsInvalidCol);
  RequireRowsReach(M, s.Cols);
  const std::size_t cols = s.Cols;
  auto key = [&M, Col](LongInt p) { return static_cast<ValueOf<T>>(M[p - 1][Col]); };
  auto less = [](const ValueOf<T>& a, const ValueOf<T>& b) { return a < b; };
  auto swap = [&M, cols](LongInt p, LongInt q) {
    if (p != q) SwapRowElements(M, p - 1, q - 1, cols);
  };
  QuickSortPositions(static_cast<LongInt>(s.Rows), Ascending, key, less, swap);
}

// QSortMatrixColsOnRow: whole columns ordered by their element in row Row.
template <typename T>
void QSortColsOnRowOf(MatrixOf<T>& M, LongWord Row, bool Ascending) {
  const MatrixShape s = ShapeOf(M);
  if (!(s.Rows > 1 && s.Cols > 1)) return;
  if (!s.Rectangular) RaiseMathError(rsMatrixRect);
  if (Row >= s.Rows) RaiseMathError(rsInvalidRow);
  RequireRowsReach(M, s.Cols);
  const T* keys = M[Row].data();  // the key row's storage never moves during the sort
  auto key = [keys](LongInt p) { return static_cast<ValueOf<T>>(keys[p - 1]); };
  auto less = [](const ValueOf<T>& a, const ValueOf<T>& b) { return a < b; };
  auto swap = [&M](LongInt p, LongInt q) {
    if (p != q) SwapColElements(M, p - 1, q - 1);
  };
  QuickSortPositions(static_cast<LongInt>(s.Cols), Ascending, key, less, swap);
}

// ExtractMatrixRow: empty for a matrix with no rows or columns (so also for a ragged matrix
// under the switch), rsInvalidRow past the last row, else the first Cols elements of the row.
template <typename T>
std::vector<T> ExtractRowOf(const MatrixOf<T>& M, LongWord Row) {
  const MatrixShape s = ShapeOf(M);
  if (s.Rows == 0 || s.Cols == 0) return {};
  if (Row >= s.Rows) RaiseMathError(rsInvalidRow);
  RequireRowReaches(M[Row], s.Cols);
  return std::vector<T>(M[Row].begin(), M[Row].begin() + s.Cols);
}

// ExtractMatrixCol: the column counterpart, Rows elements long.
template <typename T>
std::vector<T> ExtractColOf(const MatrixOf<T>& M, LongWord Col) {
  const MatrixShape s = ShapeOf(M);
  if (s.Rows == 0 || s.Cols == 0) return {};
  if (Col >= s.Cols) RaiseMathError(rsInvalidCol);
  RequireRowsReach(M, std::size_t{Col} + 1);
  std::vector<T> r(s.Rows);
  for (std::size_t i = 0; i < s.Rows; ++i) r[i] = M[i][Col];
  return r;
}

// OverwriteMatrixRow: row Row becomes V cut or padded with Fill to Cols elements. Nothing
// happens for a matrix with no rows or columns.
template <typename T, typename Value>
void OverwriteRowOf(MatrixOf<T>& M, LongWord Row, const std::vector<T>& V, Value Fill) {
  const MatrixShape s = ShapeOf(M);
  if (s.Rows == 0 || s.Cols == 0) return;
  if (Row >= s.Rows) RaiseMathError(rsInvalidRow);
  RequireRowReaches(M[Row], s.Cols);
  const std::size_t kept = std::min<std::size_t>(V.size(), s.Cols);
  T* dst = M[Row].data();
  std::copy(V.begin(), V.begin() + kept, dst);
  const T fill = Fill;
  std::fill(dst + kept, dst + s.Cols, fill);
}

// OverwriteMatrixCol: column Col becomes V cut or padded with Fill to Rows elements.
template <typename T, typename Value>
void OverwriteColOf(MatrixOf<T>& M, LongWord Col, const std::vector<T>& V, Value Fill) {
  const MatrixShape s = ShapeOf(M);
  if (s.Rows == 0 || s.Cols == 0) return;
  if (Col >= s.Cols) RaiseMathError(rsInvalidCol);
  RequireRowsReach(M, std::size_t{Col} + 1);
  const T fill = Fill;
  for (std::size_t i = 0; i < s.Rows; ++i) M[i][Col] = i < V.size() ? V[i] : fill;
}

// TransposeMatrix: rsMatrixRect for a non-rectangular matrix (under the switch also an empty
// one); an empty result for no rows or columns; else Cols x Rows.
template <typename T>
MatrixOf<T> TransposeOf(const MatrixOf<T>& M) {
  const MatrixShape s = ShapeOf(M);
  if (!s.Rectangular) RaiseMathError(rsMatrixRect);
  if (s.Rows == 0 || s.Cols == 0) return {};
  RequireRowsReach(M, s.Cols);
  MatrixOf<T> r(s.Cols, std::vector<T>(s.Rows));
  for (std::size_t i = 0; i < s.Rows; ++i) {
    const T* src = M[i].data();
    for (std::size_t j = 0; j < s.Cols; ++j) r[j][i] = src[j];
  }
  return r;
}

}  // namespace tovrin::detail
