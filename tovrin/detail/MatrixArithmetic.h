// Element-by-element arithmetic shared by the numeric and the money matrix units: two-matrix
// combination with its check order, scalar mapping that keeps ragged shapes, and the grand
// sum behind GrandMean. The element rule is passed in as a function object.
#pragma once

#include <cstddef>
#include <utility>

#include "tovrin/detail/MatrixShape.h"
#include "tovrin/detail/VectorAlgorithms.h"
#include "tovrin/foundation/TOVRINErrors.h"

namespace tovrin::detail {

// Checks of the two-matrix arithmetic, in order: M1's row count and the length of its row 0
// are read first (a matrix with no rows has no row 0: that read is reported as
// EAccessViolation, without touching memory); either being 0 raises rsMatrixIsEmpty; unequal
// shapes (or a non-rectangular operand under the switch) raise rsSameDimensions. With the
// switch off, a row of either operand shorter than the column count raises rsMatrixRect.
// Returns the column count.
template <typename T>
std::size_t CheckTwoMatrixOperands(const MatrixOf<T>& M1, const MatrixOf<T>& M2) {
  const std::size_t rows = M1.size();
  if (rows == 0) {
    throw EAccessViolation("Access violation: row 0 read from a matrix that has no rows");
  }
  const std::size_t cols = M1[0].size();
  if (cols == 0) RaiseMathError(rsMatrixIsEmpty);
  if (!SameDimensionsOf(M1, M2)) RaiseMathError(rsSameDimensions);
  RequireRowsReach(M1, cols);
  RequireRowsReach(M2, cols);
  return cols;
}

// r[i][j] = Op(M1[i][j], M2[i][j]) over M1's Rows x Cols.
template <typename T, typename OpFn>
MatrixOf<T> Combined(const MatrixOf<T>& M1, const MatrixOf<T>& M2, OpFn Op) {
  const std::size_t cols = CheckTwoMatrixOperands(M1, M2);
  MatrixOf<T> r(M1.size(), std::vector<T>(cols));
  for (std::size_t i = 0; i < M1.size(); ++i) {
    const T* a = M1[i].data();
    const T* b = M2[i].data();
    T* out = r[i].data();
    for (std::size_t j = 0; j < cols; ++j) out[j] = Op(a[j], b[j]);
  }
  return r;
}

// M1[i][j] := Op(M1[i][j], M2[i][j]) over M1's Rows x Cols (elements of a longer row of M1
// beyond Cols are left alone).
template <typename T, typename OpFn>
void CombineInto(MatrixOf<T>& M1, const MatrixOf<T>& M2, OpFn Op) {
  const std::size_t cols = CheckTwoMatrixOperands(M1, M2);
  for (std::size_t i = 0; i < M1.size(); ++i) {
    T* a = M1[i].data();
    const T* b = M2[i].data();
    for (std::size_t j = 0; j < cols; ++j) a[j] = Op(a[j], b[j]);
  }
}

// r[i][j] = Op(M[i][j]) with every row at its own length; rsMatrixIsEmpty for no rows.
template <typename T, typename OpFn>
MatrixOf<T> MapMatrix(const MatrixOf<T>& M, OpFn Op) {
  if (M.empty()) RaiseMathError(rsMatrixIsEmpty);
  return ConvertMatrixOf<T>(M, Op);
}

// M[i][j] := Op(M[i][j]) in place, every row at its own length; rsMatrixIsEmpty for no rows.
template <typename T, typename OpFn>
void MapMatrixInPlace(MatrixOf<T>& M, OpFn Op) {
  if (M.empty()) RaiseMathError(rsMatrixIsEmpty);
  for (auto& row : M) {
    for (auto& x : row) x = Op(x);
  }
}

// The sum behind GrandMean: rsMatrixIsEmpty for no rows; N receives the element count (set to
// 0 first); Add(Sum, element) accumulates row by row, column by column; rsMatrixIsEmpty again
// when every row is empty.
template <typename T, typename Acc, typename AddFn>
Acc GrandSumOf(const MatrixOf<T>& M, LongWord& N, Acc Sum, AddFn Add) {
  if (M.empty()) RaiseMathError(rsMatrixIsEmpty);
  N = 0;
  for (const auto& row : M) {
    N += static_cast<LongWord>(row.size());
    for (const auto& x : row) Sum = Add(Sum, x);
  }
  if (N == 0) RaiseMathError(rsMatrixIsEmpty);
  return Sum;
}

}  // namespace tovrin::detail

// The two-matrix sums and differences, written once for the numeric and the money matrices
// by the entry of the vector combinations (VectorAlgorithms.h):
// TOVRIN_DEFINE_MATRIX_COMBINATIONS(Concept, Rules) defines AddMatrices, AddToMatrix,
// SubtractMatrices and SubtractFromMatrix for the element types of Concept with the element
// rules Rules<T>; TOVRIN_INSTANTIATE_MATRIX_COMBINATIONS(T) instantiates them for T.
#define TOVRIN_MATRIX_COMBINATIONS(X, A, B)                \
  X(A, B, detail::MatrixOf, AddMatrices, AddToMatrix, Add) \
  X(A, B, detail::MatrixOf, SubtractMatrices, SubtractFromMatrix, Sub)
#define TOVRIN_DEFINE_MATRIX_COMBINATIONS(Concept, Rules) \
  TOVRIN_MATRIX_COMBINATIONS(TOVRIN_DETAIL_COMBINATION, Concept, Rules)
#define TOVRIN_INSTANTIATE_MATRIX_COMBINATIONS(T) \
  TOVRIN_MATRIX_COMBINATIONS(TOVRIN_DETAIL_COMBINATION_OF, T, )
