// Row and column operations: swaps, scaling, adding multiples, the two sorts, extraction,
// overwriting, copying, transposition, the matrix product and row and column sums.
#include <algorithm>
#include <cstddef>
#include <vector>

#include "tovrin/detail/ElementRules.h"
#include "tovrin/detail/MatrixRowCol.h"
#include "tovrin/detail/MatrixShape.h"
#include "tovrin/detail/QuickSort.h"
#include "tovrin/matrix/TOVRINMatrix.h"

namespace tovrin {
namespace {

using detail::MatrixOf;

template <typename T>
using Rules = detail::ElementRules<T>;

enum class Line { kRow, kCol };

// The index checks of the operations on rows (columns): rsInvalidRow (rsInvalidCol) unless both
// indices are below the row (column) count of s; then, with the shape switch off, a row too
// short for the columns touched raises rsMatrixRect (memory guard).
template <typename T>
void CheckIndices(const MatrixOf<T>& M, const detail::MatrixShape& s, Line On, LongWord Index1,
                  LongWord Index2) {
  if (On == Line::kRow) {
    if (Index1 >= s.Rows || Index2 >= s.Rows) detail::RaiseMathError(rsInvalidRow);
    detail::RequireRowReaches(M[Index1], s.Cols);
    detail::RequireRowReaches(M[Index2], s.Cols);
  } else {
    if (Index1 >= s.Cols || Index2 >= s.Cols) detail::RaiseMathError(rsInvalidCol);
    detail::RequireRowsReach(M, std::size_t{std::max(Index1, Index2)} + 1);
  }
}

// The checks of the in-place row and column operations and the sums, in order:
// rsMatrixIsEmpty, rsMatrixRect, then the index checks.
template <typename T>
detail::MatrixShape CheckOperation(const MatrixOf<T>& M, Line On, LongWord Index1,
                                   LongWord Index2) {
  const detail::MatrixShape s = detail::ShapeOf(M);
  if (s.Rows == 0 || s.Cols == 0) detail::RaiseMathError(rsMatrixIsEmpty);
  if (!s.Rectangular) detail::RaiseMathError(rsMatrixRect);
  CheckIndices(M, s, On, Index1, Index2);
  return s;
}

// The shape extraction and overwriting work on: none (Cols 0, nothing checked) for a matrix
// with no rows or columns, else the shape after the index checks.
template <typename T>
detail::MatrixShape LineShape(const MatrixOf<T>& M, Line On, LongWord Index) {
  const detail::MatrixShape s = detail::ShapeOf(M);
  if (s.Rows == 0 || s.Cols == 0) return detail::MatrixShape{};
  CheckIndices(M, s, On, Index, Index);
  return s;
}

// Exactly 1: for Int64 both 32-bit halves are compared with those of 1, which is the same.
template <typename K>
bool IsExactlyOne(K k) {
  return k == K(1);
}

// Elements summed as SumVector sums them: in Extended for floats, in a wrapping Int64 (each
// element sign- or zero-extended) for integers.
template <typename T>
detail::SumOf<T> Accumulate(detail::SumOf<T> sum, T x) {
  return Rules<T>::SumAdd(sum, Rules<T>::SumTerm(x));
}

// --- Sorts ---

// The two matrix sorts: whole rows ordered by their element in column Index, or whole
// columns by their element in row Index, by the explicit-stack quick sort. Nothing is
// checked or done unless there are at least two rows and two columns; then rsMatrixRect, then
// rsInvalidCol (rsInvalidRow).
template <typename T>
void QSortLinesOf(MatrixOf<T>& M, Line Sorted, LongWord Index, bool Ascending) {
  using Value = detail::ValueOf<T>;
  const detail::MatrixShape s = detail::ShapeOf(M);
  if (!(s.Rows > 1 && s.Cols > 1)) return;
  if (!s.Rectangular) detail::RaiseMathError(rsMatrixRect);
  const bool sortRows = Sorted == Line::kRow;
  if (Index >= (sortRows ? s.Cols : s.Rows))
    detail::RaiseMathError(sortRows ? rsInvalidCol : rsInvalidRow);
  detail::RequireRowsReach(M, s.Cols);
  auto less = [](const Value& a, const Value& b) { return a < b; };
  if (sortRows) {
    const std::size_t cols = s.Cols;
    auto key = [&M, Index](LongInt p) { return static_cast<Value>(M[p - 1][Index]); };
    auto swap = [&M, cols](LongInt p, LongInt q) {
      if (p != q) detail::SwapRowElements(M, p - 1, q - 1, cols);
    };
    detail::QuickSortPositions(static_cast<LongInt>(s.Rows), Ascending, key, less, swap);
  } else {
    const T* keys = M[Index].data();  // the key row's storage never moves during the sort
    auto key = [keys](LongInt p) { return static_cast<Value>(keys[p - 1]); };
    auto swap = [&M](LongInt p, LongInt q) {
      if (p != q) detail::SwapColElements(M, p - 1, q - 1);
    };
    detail::QuickSortPositions(static_cast<LongInt>(s.Cols), Ascending, key, less, swap);
  }
}

// --- Matrix product ---

// Each element is r := r + M2[k][j] x M1[i][k] for k ascending, evaluated in Extended and, for
// Double and Single, rounded to the element type after every step. The loops run i, k, j so
// that rows of M2 and of the result are read in memory order; the sequence of operations on
// any one element is unchanged, so every bit of the result is that of the i, j, k order.
template <typename T>
void MultiplyInto(const MatrixOf<T>& M1, const MatrixOf<T>& M2, MatrixOf<T>& r, std::size_t Inner,
                  std::size_t Cols) {
  for (std::size_t i = 0; i < r.size(); ++i) {
    T* out = r[i].data();
    const T* a = M1[i].data();
    for (std::size_t k = 0; k < Inner; ++k) {
      const Extended aik = a[k];
      const T* b = M2[k].data();
      for (std::size_t j = 0; j < Cols; ++j) {
        out[j] = T(static_cast<Extended>(out[j]) + static_cast<Extended>(b[j]) * aik);
      }
    }
  }
}

// k-ascending sum of B[k] x A[k] in Extended, starting from 0.
Extended DotInOrder(const Extended* A, const Extended* B, std::size_t Inner) {
  Extended c = 0;
  for (std::size_t k = 0; k < Inner; ++k) c = c + B[k] * A[k];
  return c;
}

// The Extended member (chosen over the template by overload resolution): no rounding between steps,
// so an element can be accumulated in a register from start to end. M1's rows and M2's columns are
// first unpacked into native Extended arrays (M2 transposed, so that a column is contiguous), then
// 2 x 2 blocks of the result are formed together, which loads each operand value once for two
// products.
void MultiplyInto(const TQENFloatMatrix& M1, const TQENFloatMatrix& M2, TQENFloatMatrix& r,
                  std::size_t Inner, std::size_t Cols) {
  const std::size_t rows = r.size();
  std::vector<Extended> columns(Cols * Inner);  // column j of M2 at [j * Inner]
  for (std::size_t k = 0; k < Inner; ++k) {
    const PackedExtended* b = M2[k].data();
    for (std::size_t j = 0; j < Cols; ++j) columns[j * Inner + k] = b[j];
  }
  std::vector<Extended> pair(2 * Inner);  // two rows of M1
  std::size_t i = 0;
  for (; i + 2 <= rows; i += 2) {
    const PackedExtended* s0 = M1[i].data();
    const PackedExtended* s1 = M1[i + 1].data();
    for (std::size_t k = 0; k < Inner; ++k) {
      pair[k] = s0[k];
      pair[Inner + k] = s1[k];
    }
    const Extended* a0 = pair.data();
    const Extended* a1 = a0 + Inner;
    PackedExtended* out0 = r[i].data();
    PackedExtended* out1 = r[i + 1].data();
    std::size_t j = 0;
    for (; j + 2 <= Cols; j += 2) {
      const Extended* b0 = &columns[j * Inner];
      const Extended* b1 = b0 + Inner;
      Extended c00 = 0, c01 = 0, c10 = 0, c11 = 0;
      for (std::size_t k = 0; k < Inner; ++k) {
        const Extended x0 = a0[k], x1 = a1[k], y0 = b0[k], y1 = b1[k];
        c00 = c00 + y0 * x0;
        c01 = c01 + y1 * x0;
        c10 = c10 + y0 * x1;
        c11 = c11 + y1 * x1;
      }
      out0[j] = c00;
      out0[j + 1] = c01;
      out1[j] = c10;
      out1[j + 1] = c11;
    }
    for (; j < Cols; ++j) {
      out0[j] = DotInOrder(a0, &columns[j * Inner], Inner);
      out1[j] = DotInOrder(a1, &columns[j * Inner], Inner);
    }
  }
  for (; i < rows; ++i) {
    const PackedExtended* s0 = M1[i].data();
    for (std::size_t k = 0; k < Inner; ++k) pair[k] = s0[k];
    for (std::size_t j = 0; j < Cols; ++j) {
      r[i][j] = DotInOrder(pair.data(), &columns[j * Inner], Inner);
    }
  }
}

template <typename T>
MatrixOf<T> MultiplyOf(const MatrixOf<T>& M1, const MatrixOf<T>& M2) {
  const detail::MatrixShape s1 = detail::ShapeOf(M1);
  const detail::MatrixShape s2 = detail::ShapeOf(M2);
  if (!s1.Rectangular || !s2.Rectangular) detail::RaiseMathError(rsMatrixRect);
  if (s1.Rows == 0 || s2.Rows == 0) detail::RaiseMathError(rsMatrixIsEmpty);
  if (s1.Cols != s2.Rows) detail::RaiseMathError(rsMatrixMult);
  detail::RequireRowsReach(M1, s1.Cols);
  detail::RequireRowsReach(M2, s2.Cols);
  MatrixOf<T> r(s1.Rows, std::vector<T>(s2.Cols));
  MultiplyInto(M1, M2, r, s1.Cols, s2.Cols);
  return r;
}

}  // namespace

// --- Swaps ---
template <detail::AnyOrMoneyElement T>
void SwapMatrixRows(detail::MatrixOf<T>& M, LongWord Row1, LongWord Row2) {
  if (Row1 == Row2) return;
  const detail::MatrixShape s = CheckOperation(M, Line::kRow, Row1, Row2);
  detail::SwapRowElements(M, Row1, Row2, s.Cols);
}
template <detail::AnyOrMoneyElement T>
void SwapMatrixCols(detail::MatrixOf<T>& M, LongWord Col1, LongWord Col2) {
  if (Col1 == Col2) return;
  CheckOperation(M, Line::kCol, Col1, Col2);
  detail::SwapColElements(M, Col1, Col2);
}

// --- Scaling and adding multiples ---
template <detail::ArithmeticElement T>
void ScaleMatrixRow(detail::MatrixOf<T>& M, LongWord Row, detail::ScalarOf<T> K) {
  if (IsExactlyOne(K)) return;
  const detail::MatrixShape s = CheckOperation(M, Line::kRow, Row, Row);
  T* row = M[Row].data();
  for (std::size_t j = 0; j < s.Cols; ++j) row[j] = Rules<T>::Mul(K, row[j]);
}
template <detail::ArithmeticElement T>
void ScaleMatrixCol(detail::MatrixOf<T>& M, LongWord Col, detail::ScalarOf<T> K) {
  if (IsExactlyOne(K)) return;
  CheckOperation(M, Line::kCol, Col, Col);
  for (auto& row : M) row[Col] = Rules<T>::Mul(K, row[Col]);
}
template <detail::ArithmeticElement T>
void AddMatrixRows(detail::MatrixOf<T>& M, LongWord Row1, LongWord Row2, detail::ScalarOf<T> K) {
  const detail::MatrixShape s = CheckOperation(M, Line::kRow, Row1, Row2);
  T* changed = M[Row1].data();
  const T* added = M[Row2].data();
  for (std::size_t j = 0; j < s.Cols; ++j) {
    changed[j] = Rules<T>::AddScaled(changed[j], K, added[j]);
  }
}
template <detail::ArithmeticElement T>
void AddMatrixCols(detail::MatrixOf<T>& M, LongWord Col1, LongWord Col2, detail::ScalarOf<T> K) {
  CheckOperation(M, Line::kCol, Col1, Col2);
  for (auto& row : M) row[Col1] = Rules<T>::AddScaled(row[Col1], K, row[Col2]);
}

// --- Sorts ---
template <detail::AnyOrMoneyElement T>
void QSortMatrixRowsOnCol(detail::MatrixOf<T>& M, LongWord Col, bool Ascending) {
  QSortLinesOf(M, Line::kRow, Col, Ascending);
}
template <detail::AnyOrMoneyElement T>
void QSortMatrixColsOnRow(detail::MatrixOf<T>& M, LongWord Row, bool Ascending) {
  QSortLinesOf(M, Line::kCol, Row, Ascending);
}

// --- Extraction and overwriting ---
// Empty for a matrix with no rows or columns (so also for a ragged matrix under the switch),
// else the first Cols elements of the row.
template <detail::AnyOrMoneyElement T>
std::vector<T> ExtractMatrixRow(const detail::MatrixOf<T>& M, LongWord Row) {
  const detail::MatrixShape s = LineShape(M, Line::kRow, Row);
  if (s.Cols == 0) return {};
  return std::vector<T>(M[Row].begin(), M[Row].begin() + s.Cols);
}
template <detail::AnyOrMoneyElement T>
std::vector<T> ExtractMatrixCol(const detail::MatrixOf<T>& M, LongWord Col) {
  const detail::MatrixShape s = LineShape(M, Line::kCol, Col);
  if (s.Cols == 0) return {};
  std::vector<T> r(s.Rows);
  for (std::size_t i = 0; i < s.Rows; ++i) r[i] = M[i][Col];
  return r;
}
template <detail::AnyOrMoneyElement T>
void OverwriteMatrixRow(detail::MatrixOf<T>& M, LongWord Row, const std::vector<T>& V,
                        detail::ValueOf<T> Fill) {
  const detail::MatrixShape s = LineShape(M, Line::kRow, Row);
  if (s.Cols == 0) return;
  const std::size_t kept = std::min<std::size_t>(V.size(), s.Cols);
  T* dst = M[Row].data();
  std::copy(V.begin(), V.begin() + kept, dst);
  const T fill = Fill;
  std::fill(dst + kept, dst + s.Cols, fill);
}
template <detail::AnyOrMoneyElement T>
void OverwriteMatrixCol(detail::MatrixOf<T>& M, LongWord Col, const std::vector<T>& V,
                        detail::ValueOf<T> Fill) {
  const detail::MatrixShape s = LineShape(M, Line::kCol, Col);
  if (s.Cols == 0) return;
  const T fill = Fill;
  for (std::size_t i = 0; i < s.Rows; ++i) M[i][Col] = i < V.size() ? V[i] : fill;
}

// --- Copy, transpose, product ---
template <detail::AnyOrMoneyElement T>
detail::MatrixOf<T> CopyMatrix(const detail::MatrixOf<T>& M) {
  return M;
}
template <detail::AnyOrMoneyElement T>
detail::MatrixOf<T> TransposeMatrix(const detail::MatrixOf<T>& M) {
  const detail::MatrixShape s = detail::ShapeOf(M);
  if (!s.Rectangular) detail::RaiseMathError(rsMatrixRect);
  if (s.Rows == 0 || s.Cols == 0) return {};
  detail::RequireRowsReach(M, s.Cols);
  MatrixOf<T> r(s.Cols, std::vector<T>(s.Rows));
  for (std::size_t i = 0; i < s.Rows; ++i) {
    const T* src = M[i].data();
    for (std::size_t j = 0; j < s.Cols; ++j) r[j][i] = src[j];
  }
  return r;
}
template <detail::FloatElement T>
detail::MatrixOf<T> MultiplyMatrices(const detail::MatrixOf<T>& M1, const detail::MatrixOf<T>& M2) {
  return MultiplyOf(M1, M2);
}

// --- Sums ---
template <detail::RowSumElement T>
detail::SumOf<T> SumMatrixRow(const detail::MatrixOf<T>& M, LongWord Row) {
  const detail::MatrixShape s = CheckOperation(M, Line::kRow, Row, Row);
  detail::SumOf<T> sum = 0;
  const T* row = M[Row].data();
  for (std::size_t j = 0; j < s.Cols; ++j) sum = Accumulate<T>(sum, row[j]);
  return sum;
}
template <detail::RowSumElement T>
detail::SumOf<T> SumMatrixCol(const detail::MatrixOf<T>& M, LongWord Col) {
  CheckOperation(M, Line::kCol, Col, Col);
  detail::SumOf<T> sum = 0;
  for (const auto& row : M) sum = Accumulate<T>(sum, row[Col]);
  return sum;
}

using detail::MatrixOf;
using detail::ScalarOf;
using detail::SumOf;
using detail::ValueOf;

#define TOVRIN_INSTANTIATE(T)                                                                  \
  template void SwapMatrixRows(MatrixOf<T>&, LongWord, LongWord);                              \
  template void SwapMatrixCols(MatrixOf<T>&, LongWord, LongWord);                              \
  template void QSortMatrixRowsOnCol(MatrixOf<T>&, LongWord, bool);                            \
  template void QSortMatrixColsOnRow(MatrixOf<T>&, LongWord, bool);                            \
  template std::vector<T> ExtractMatrixRow(const MatrixOf<T>&, LongWord);                      \
  template std::vector<T> ExtractMatrixCol(const MatrixOf<T>&, LongWord);                      \
  template void OverwriteMatrixRow(MatrixOf<T>&, LongWord, const std::vector<T>&, ValueOf<T>); \
  template void OverwriteMatrixCol(MatrixOf<T>&, LongWord, const std::vector<T>&, ValueOf<T>); \
  template MatrixOf<T> CopyMatrix(const MatrixOf<T>&);                                         \
  template MatrixOf<T> TransposeMatrix(const MatrixOf<T>&);
TOVRIN_ALL_AND_MONEY_ELEMENTS(TOVRIN_INSTANTIATE)
#undef TOVRIN_INSTANTIATE

#define TOVRIN_INSTANTIATE(T)                                                 \
  template void ScaleMatrixRow(MatrixOf<T>&, LongWord, ScalarOf<T>);          \
  template void ScaleMatrixCol(MatrixOf<T>&, LongWord, ScalarOf<T>);          \
  template void AddMatrixRows(MatrixOf<T>&, LongWord, LongWord, ScalarOf<T>); \
  template void AddMatrixCols(MatrixOf<T>&, LongWord, LongWord, ScalarOf<T>);
TOVRIN_ARITHMETIC_ELEMENTS(TOVRIN_INSTANTIATE)
#undef TOVRIN_INSTANTIATE

#define TOVRIN_INSTANTIATE(T) \
  template MatrixOf<T> MultiplyMatrices(const MatrixOf<T>&, const MatrixOf<T>&);
TOVRIN_FLOAT_ELEMENTS(TOVRIN_INSTANTIATE)
#undef TOVRIN_INSTANTIATE

#define TOVRIN_INSTANTIATE(T)                                   \
  template SumOf<T> SumMatrixRow(const MatrixOf<T>&, LongWord); \
  template SumOf<T> SumMatrixCol(const MatrixOf<T>&, LongWord);
TOVRIN_ROW_SUM_ELEMENTS(TOVRIN_INSTANTIATE)
#undef TOVRIN_INSTANTIATE

}  // namespace tovrin
