// Shape rules shared by every matrix unit (the numeric matrices and the money matrices).
//
// A matrix is a std::vector of rows that may differ in length. These templates answer shape
// questions, guard memory against ragged rows and build fresh matrices; they know nothing of
// the element type beyond copying it.
#pragma once

#include <atomic>
#include <cstddef>
#include <vector>

#include "tovrin/foundation/TOVRINElementTypes.h"
#include "tovrin/foundation/TOVRINErrors.h"
#include "tovrin/foundation/TOVRINGlobals.h"

namespace tovrin {
// The matrix unit's shape switch (TOVRINMatrix.h), defined with the matrix unit.
extern std::atomic<bool> QENMatrixRectangularCheck;
}  // namespace tovrin

namespace tovrin::detail {

// Rows, Cols and the rectangular flag as MatrixDimensions reports them. With the shape switch
// off, the shape is taken from row 0 alone and every matrix counts as rectangular. With it on,
// an empty matrix or one whose row 0 is empty is not rectangular, and a ragged one reports
// Cols 0.
struct MatrixShape {
  LongWord Rows = 0;
  LongWord Cols = 0;
  bool Rectangular = false;
};

template <typename T>
MatrixShape ShapeOf(const MatrixOf<T>& M) {
  MatrixShape s;
  s.Rows = static_cast<LongWord>(M.size());
  s.Cols = s.Rows > 0 ? static_cast<LongWord>(M[0].size()) : 0;
  if (!QENMatrixRectangularCheck.load(std::memory_order_relaxed)) {
    s.Rectangular = true;
    return s;
  }
  if (s.Rows == 0 || s.Cols == 0) return s;
  for (const auto& row : M) {
    if (row.size() != s.Cols) {
      s.Cols = 0;
      return s;
    }
  }
  s.Rectangular = true;
  return s;
}

template <typename T, typename U>
bool SameDimensionsOf(const MatrixOf<T>& M1, const MatrixOf<U>& M2) {
  const MatrixShape s1 = ShapeOf(M1);
  const MatrixShape s2 = ShapeOf(M2);
  return s1.Rectangular && s2.Rectangular && s1.Rows == s2.Rows && s1.Cols == s2.Cols;
}

// Memory guard for the shape switch being off: an operation that will touch Cols elements of
// every row raises rsMatrixRect (before any work) when some row is shorter than that.
template <typename T>
void RequireRowsReach(const MatrixOf<T>& M, std::size_t Cols) {
  for (const auto& row : M) {
    if (row.size() < Cols) RaiseMathError(rsMatrixRect);
  }
}

// The same guard for a single row.
template <typename T>
void RequireRowReaches(const std::vector<T>& Row, std::size_t Cols) {
  if (Row.size() < Cols) RaiseMathError(rsMatrixRect);
}

// Rows x Cols zeros (value-initialised elements).
template <typename T>
MatrixOf<T> CreateMatrixOf(LongWord Rows, LongWord Cols) {
  return MatrixOf<T>(Rows, std::vector<T>(Cols));
}

// N x N zeros with One on the diagonal.
template <typename T>
MatrixOf<T> CreateIdentityOf(LongWord N, T One) {
  MatrixOf<T> r = CreateMatrixOf<T>(N, N);
  for (LongWord i = 0; i < N; ++i) r[i][i] = One;
  return r;
}

// The creators of one matrix type, which carry the type in their names: CreateNameMatrix
// (Rows x Cols zeros) and CreateNameIdentityMatrix (One, the stored form of 1, on the
// diagonal of N x N zeros) returning TQENNameMatrix, of element type T.
#define TOVRIN_DEFINE_MATRIX_CREATION(T, Name, One)                       \
  TQEN##Name##Matrix Create##Name##Matrix(LongWord Rows, LongWord Cols) { \
    return detail::CreateMatrixOf<T>(Rows, Cols);                         \
  }                                                                       \
  TQEN##Name##Matrix Create##Name##IdentityMatrix(LongWord N) {           \
    return detail::CreateIdentityOf<T>(N, T(One));                        \
  }

// A matrix of the same ragged shape whose elements are Convert(element).
template <typename R, typename T, typename ConvertFn>
MatrixOf<R> ConvertMatrixOf(const MatrixOf<T>& M, ConvertFn Convert) {
  MatrixOf<R> r(M.size());
  for (std::size_t i = 0; i < M.size(); ++i) {
    const auto& src = M[i];
    auto& dst = r[i];
    dst.resize(src.size());
    for (std::size_t j = 0; j < src.size(); ++j) dst[j] = Convert(src[j]);
  }
  return r;
}

}  // namespace tovrin::detail
