// Row and column operations: swaps, scaling, adding multiples, the two sorts, extraction,
// overwriting, copying, transposition, the matrix product and row and column sums.
#include <algorithm>
#include <cstddef>
#include <type_traits>
#include <vector>

#include "tovrin/detail/ElementRules.h"
#include "tovrin/detail/MatrixRowCol.h"
#include "tovrin/detail/MatrixShape.h"
#include "tovrin/matrix/TOVRINMatrix.h"

namespace tovrin {
namespace {

using detail::MatrixOf;

template <typename T>
using Rules = detail::ElementRules<T>;

// Exactly 1: for Int64 both 32-bit halves are compared with those of 1, which is the same.
template <typename K>
bool IsExactlyOne(K k) {
  return k == K(1);
}

template <typename T, typename K>
void ScaleRowOf(MatrixOf<T>& M, LongWord Row, K k) {
  if (IsExactlyOne(k)) return;
  const detail::MatrixShape s = detail::CheckRowOperation(M, Row, Row);
  T* row = M[Row].data();
  for (std::size_t j = 0; j < s.Cols; ++j) row[j] = Rules<T>::Mul(k, row[j]);
}

template <typename T, typename K>
void ScaleColOf(MatrixOf<T>& M, LongWord Col, K k) {
  if (IsExactlyOne(k)) return;
  detail::CheckColOperation(M, Col, Col);
  for (auto& row : M) row[Col] = Rules<T>::Mul(k, row[Col]);
}

template <typename T, typename K>
void AddRowsOf(MatrixOf<T>& M, LongWord Row1, LongWord Row2, K k) {
  const detail::MatrixShape s = detail::CheckRowOperation(M, Row1, Row2);
  T* changed = M[Row1].data();
  const T* added = M[Row2].data();
  for (std::size_t j = 0; j < s.Cols; ++j) {
    changed[j] = Rules<T>::AddScaled(changed[j], k, added[j]);
  }
}

template <typename T, typename K>
void AddColsOf(MatrixOf<T>& M, LongWord Col1, LongWord Col2, K k) {
  detail::CheckColOperation(M, Col1, Col2);
  for (auto& row : M) row[Col1] = Rules<T>::AddScaled(row[Col1], k, row[Col2]);
}

// The sum type of an element: Extended for floats, Int64 (sign- or zero-extended, wrapping)
// for integers.
template <typename T>
using SumType = std::conditional_t<detail::kIsFloatElement<T>, Extended, Int64>;

template <typename T>
SumType<T> Accumulate(SumType<T> sum, T x) {
  if constexpr (detail::kIsFloatElement<T>) {
    return sum + static_cast<Extended>(x);
  } else {
    return detail::WrappingAdd64(sum, static_cast<Int64>(x));
  }
}

template <typename T>
SumType<T> SumRowOf(const MatrixOf<T>& M, LongWord Row) {
  const detail::MatrixShape s = detail::CheckRowOperation(M, Row, Row);
  SumType<T> sum = 0;
  const T* row = M[Row].data();
  for (std::size_t j = 0; j < s.Cols; ++j) sum = Accumulate<T>(sum, row[j]);
  return sum;
}

template <typename T>
SumType<T> SumColOf(const MatrixOf<T>& M, LongWord Col) {
  detail::CheckColOperation(M, Col, Col);
  SumType<T> sum = 0;
  for (const auto& row : M) sum = Accumulate<T>(sum, row[Col]);
  return sum;
}

// --- Matrix product ---

// Each element is r := r + M2[k][j] x M1[i][k] for k ascending, evaluated in Extended and, for
// Double and Single, rounded to the element type after every step. The loops run i, k, j so
// that rows of M2 and of the result are read in memory order; the sequence of operations on
// any one element is unchanged, so every bit of the result is that of the i, j, k order.
template <typename T>
void MultiplyRoundingEachStep(const MatrixOf<T>& M1, const MatrixOf<T>& M2, MatrixOf<T>& r,
                              std::size_t Inner, std::size_t Cols) {
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

// The Extended member: no rounding between steps, so an element can be accumulated in a
// register from start to end. M1's rows and M2's columns are first unpacked into native
// Extended arrays (M2 transposed, so that a column is contiguous), then 2 x 2 blocks of the
// result are formed together, which loads each operand value once for two products.
void MultiplyExtended(const TQENFloatMatrix& M1, const TQENFloatMatrix& M2, TQENFloatMatrix& r,
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
  if constexpr (std::is_same_v<T, PackedExtended>) {
    MultiplyExtended(M1, M2, r, s1.Cols, s2.Cols);
  } else {
    MultiplyRoundingEachStep(M1, M2, r, s1.Cols, s2.Cols);
  }
  return r;
}

}  // namespace

// --- Swaps ---
void SwapMatrixRows(TQENFloatMatrix& M, LongWord Row1, LongWord Row2) {
  detail::SwapRowsOf(M, Row1, Row2);
}
void SwapMatrixRows(TQENDoubleMatrix& M, LongWord Row1, LongWord Row2) {
  detail::SwapRowsOf(M, Row1, Row2);
}
void SwapMatrixRows(TQENSingleMatrix& M, LongWord Row1, LongWord Row2) {
  detail::SwapRowsOf(M, Row1, Row2);
}
void SwapMatrixRows(TQENInt64Matrix& M, LongWord Row1, LongWord Row2) {
  detail::SwapRowsOf(M, Row1, Row2);
}
void SwapMatrixRows(TQENLWordMatrix& M, LongWord Row1, LongWord Row2) {
  detail::SwapRowsOf(M, Row1, Row2);
}
void SwapMatrixRows(TQENLIntMatrix& M, LongWord Row1, LongWord Row2) {
  detail::SwapRowsOf(M, Row1, Row2);
}
void SwapMatrixRows(TQENWordMatrix& M, LongWord Row1, LongWord Row2) {
  detail::SwapRowsOf(M, Row1, Row2);
}
void SwapMatrixRows(TQENSmallIntMatrix& M, LongWord Row1, LongWord Row2) {
  detail::SwapRowsOf(M, Row1, Row2);
}
void SwapMatrixRows(TQENByteMatrix& M, LongWord Row1, LongWord Row2) {
  detail::SwapRowsOf(M, Row1, Row2);
}
void SwapMatrixRows(TQENSIntMatrix& M, LongWord Row1, LongWord Row2) {
  detail::SwapRowsOf(M, Row1, Row2);
}
void SwapMatrixCols(TQENFloatMatrix& M, LongWord Col1, LongWord Col2) {
  detail::SwapColsOf(M, Col1, Col2);
}
void SwapMatrixCols(TQENDoubleMatrix& M, LongWord Col1, LongWord Col2) {
  detail::SwapColsOf(M, Col1, Col2);
}
void SwapMatrixCols(TQENSingleMatrix& M, LongWord Col1, LongWord Col2) {
  detail::SwapColsOf(M, Col1, Col2);
}
void SwapMatrixCols(TQENInt64Matrix& M, LongWord Col1, LongWord Col2) {
  detail::SwapColsOf(M, Col1, Col2);
}
void SwapMatrixCols(TQENLWordMatrix& M, LongWord Col1, LongWord Col2) {
  detail::SwapColsOf(M, Col1, Col2);
}
void SwapMatrixCols(TQENLIntMatrix& M, LongWord Col1, LongWord Col2) {
  detail::SwapColsOf(M, Col1, Col2);
}
void SwapMatrixCols(TQENWordMatrix& M, LongWord Col1, LongWord Col2) {
  detail::SwapColsOf(M, Col1, Col2);
}
void SwapMatrixCols(TQENSmallIntMatrix& M, LongWord Col1, LongWord Col2) {
  detail::SwapColsOf(M, Col1, Col2);
}
void SwapMatrixCols(TQENByteMatrix& M, LongWord Col1, LongWord Col2) {
  detail::SwapColsOf(M, Col1, Col2);
}
void SwapMatrixCols(TQENSIntMatrix& M, LongWord Col1, LongWord Col2) {
  detail::SwapColsOf(M, Col1, Col2);
}

// --- Scaling and adding multiples ---
void ScaleMatrixRow(TQENFloatMatrix& M, LongWord Row, Extended K) { ScaleRowOf(M, Row, K); }
void ScaleMatrixRow(TQENDoubleMatrix& M, LongWord Row, Extended K) { ScaleRowOf(M, Row, K); }
void ScaleMatrixRow(TQENSingleMatrix& M, LongWord Row, Extended K) { ScaleRowOf(M, Row, K); }
void ScaleMatrixRow(TQENInt64Matrix& M, LongWord Row, Int64 K) { ScaleRowOf(M, Row, K); }
void ScaleMatrixRow(TQENLIntMatrix& M, LongWord Row, LongInt K) { ScaleRowOf(M, Row, K); }
void ScaleMatrixCol(TQENFloatMatrix& M, LongWord Col, Extended K) { ScaleColOf(M, Col, K); }
void ScaleMatrixCol(TQENDoubleMatrix& M, LongWord Col, Extended K) { ScaleColOf(M, Col, K); }
void ScaleMatrixCol(TQENSingleMatrix& M, LongWord Col, Extended K) { ScaleColOf(M, Col, K); }
void ScaleMatrixCol(TQENInt64Matrix& M, LongWord Col, Int64 K) { ScaleColOf(M, Col, K); }
void ScaleMatrixCol(TQENLIntMatrix& M, LongWord Col, LongInt K) { ScaleColOf(M, Col, K); }
void AddMatrixRows(TQENFloatMatrix& M, LongWord Row1, LongWord Row2, Extended K) {
  AddRowsOf(M, Row1, Row2, K);
}
void AddMatrixRows(TQENDoubleMatrix& M, LongWord Row1, LongWord Row2, Extended K) {
  AddRowsOf(M, Row1, Row2, K);
}
void AddMatrixRows(TQENSingleMatrix& M, LongWord Row1, LongWord Row2, Extended K) {
  AddRowsOf(M, Row1, Row2, K);
}
void AddMatrixRows(TQENInt64Matrix& M, LongWord Row1, LongWord Row2, Int64 K) {
  AddRowsOf(M, Row1, Row2, K);
}
void AddMatrixRows(TQENLIntMatrix& M, LongWord Row1, LongWord Row2, LongInt K) {
  AddRowsOf(M, Row1, Row2, K);
}
void AddMatrixCols(TQENFloatMatrix& M, LongWord Col1, LongWord Col2, Extended K) {
  AddColsOf(M, Col1, Col2, K);
}
void AddMatrixCols(TQENDoubleMatrix& M, LongWord Col1, LongWord Col2, Extended K) {
  AddColsOf(M, Col1, Col2, K);
}
void AddMatrixCols(TQENSingleMatrix& M, LongWord Col1, LongWord Col2, Extended K) {
  AddColsOf(M, Col1, Col2, K);
}
void AddMatrixCols(TQENInt64Matrix& M, LongWord Col1, LongWord Col2, Int64 K) {
  AddColsOf(M, Col1, Col2, K);
}
void AddMatrixCols(TQENLIntMatrix& M, LongWord Col1, LongWord Col2, LongInt K) {
  AddColsOf(M, Col1, Col2, K);
}

// --- Sorts ---
void QSortMatrixRowsOnCol(TQENFloatMatrix& M, LongWord Col, bool Ascending) {
  detail::QSortRowsOnColOf(M, Col, Ascending);
}
void QSortMatrixRowsOnCol(TQENDoubleMatrix& M, LongWord Col, bool Ascending) {
  detail::QSortRowsOnColOf(M, Col, Ascending);
}
void QSortMatrixRowsOnCol(TQENSingleMatrix& M, LongWord Col, bool Ascending) {
  detail::QSortRowsOnColOf(M, Col, Ascending);
}
void QSortMatrixRowsOnCol(TQENInt64Matrix& M, LongWord Col, bool Ascending) {
  detail::QSortRowsOnColOf(M, Col, Ascending);
}
void QSortMatrixRowsOnCol(TQENLWordMatrix& M, LongWord Col, bool Ascending) {
  detail::QSortRowsOnColOf(M, Col, Ascending);
}
void QSortMatrixRowsOnCol(TQENLIntMatrix& M, LongWord Col, bool Ascending) {
  detail::QSortRowsOnColOf(M, Col, Ascending);
}
void QSortMatrixRowsOnCol(TQENWordMatrix& M, LongWord Col, bool Ascending) {
  detail::QSortRowsOnColOf(M, Col, Ascending);
}
void QSortMatrixRowsOnCol(TQENSmallIntMatrix& M, LongWord Col, bool Ascending) {
  detail::QSortRowsOnColOf(M, Col, Ascending);
}
void QSortMatrixRowsOnCol(TQENByteMatrix& M, LongWord Col, bool Ascending) {
  detail::QSortRowsOnColOf(M, Col, Ascending);
}
void QSortMatrixRowsOnCol(TQENSIntMatrix& M, LongWord Col, bool Ascending) {
  detail::QSortRowsOnColOf(M, Col, Ascending);
}
void QSortMatrixColsOnRow(TQENFloatMatrix& M, LongWord Row, bool Ascending) {
  detail::QSortColsOnRowOf(M, Row, Ascending);
}
void QSortMatrixColsOnRow(TQENDoubleMatrix& M, LongWord Row, bool Ascending) {
  detail::QSortColsOnRowOf(M, Row, Ascending);
}
void QSortMatrixColsOnRow(TQENSingleMatrix& M, LongWord Row, bool Ascending) {
  detail::QSortColsOnRowOf(M, Row, Ascending);
}
void QSortMatrixColsOnRow(TQENInt64Matrix& M, LongWord Row, bool Ascending) {
  detail::QSortColsOnRowOf(M, Row, Ascending);
}
void QSortMatrixColsOnRow(TQENLWordMatrix& M, LongWord Row, bool Ascending) {
  detail::QSortColsOnRowOf(M, Row, Ascending);
}
void QSortMatrixColsOnRow(TQENLIntMatrix& M, LongWord Row, bool Ascending) {
  detail::QSortColsOnRowOf(M, Row, Ascending);
}
void QSortMatrixColsOnRow(TQENWordMatrix& M, LongWord Row, bool Ascending) {
  detail::QSortColsOnRowOf(M, Row, Ascending);
}
void QSortMatrixColsOnRow(TQENSmallIntMatrix& M, LongWord Row, bool Ascending) {
  detail::QSortColsOnRowOf(M, Row, Ascending);
}
void QSortMatrixColsOnRow(TQENByteMatrix& M, LongWord Row, bool Ascending) {
  detail::QSortColsOnRowOf(M, Row, Ascending);
}
void QSortMatrixColsOnRow(TQENSIntMatrix& M, LongWord Row, bool Ascending) {
  detail::QSortColsOnRowOf(M, Row, Ascending);
}

// --- Extraction and overwriting ---
TQENFloatVector ExtractMatrixRow(const TQENFloatMatrix& M, LongWord Row) {
  return detail::ExtractRowOf(M, Row);
}
TQENDoubleVector ExtractMatrixRow(const TQENDoubleMatrix& M, LongWord Row) {
  return detail::ExtractRowOf(M, Row);
}
TQENSingleVector ExtractMatrixRow(const TQENSingleMatrix& M, LongWord Row) {
  return detail::ExtractRowOf(M, Row);
}
TQENInt64Vector ExtractMatrixRow(const TQENInt64Matrix& M, LongWord Row) {
  return detail::ExtractRowOf(M, Row);
}
TQENLWordVector ExtractMatrixRow(const TQENLWordMatrix& M, LongWord Row) {
  return detail::ExtractRowOf(M, Row);
}
TQENLIntVector ExtractMatrixRow(const TQENLIntMatrix& M, LongWord Row) {
  return detail::ExtractRowOf(M, Row);
}
TQENWordVector ExtractMatrixRow(const TQENWordMatrix& M, LongWord Row) {
  return detail::ExtractRowOf(M, Row);
}
TQENSmallIntVector ExtractMatrixRow(const TQENSmallIntMatrix& M, LongWord Row) {
  return detail::ExtractRowOf(M, Row);
}
TQENByteVector ExtractMatrixRow(const TQENByteMatrix& M, LongWord Row) {
  return detail::ExtractRowOf(M, Row);
}
TQENSIntVector ExtractMatrixRow(const TQENSIntMatrix& M, LongWord Row) {
  return detail::ExtractRowOf(M, Row);
}
TQENFloatVector ExtractMatrixCol(const TQENFloatMatrix& M, LongWord Col) {
  return detail::ExtractColOf(M, Col);
}
TQENDoubleVector ExtractMatrixCol(const TQENDoubleMatrix& M, LongWord Col) {
  return detail::ExtractColOf(M, Col);
}
TQENSingleVector ExtractMatrixCol(const TQENSingleMatrix& M, LongWord Col) {
  return detail::ExtractColOf(M, Col);
}
TQENInt64Vector ExtractMatrixCol(const TQENInt64Matrix& M, LongWord Col) {
  return detail::ExtractColOf(M, Col);
}
TQENLWordVector ExtractMatrixCol(const TQENLWordMatrix& M, LongWord Col) {
  return detail::ExtractColOf(M, Col);
}
TQENLIntVector ExtractMatrixCol(const TQENLIntMatrix& M, LongWord Col) {
  return detail::ExtractColOf(M, Col);
}
TQENWordVector ExtractMatrixCol(const TQENWordMatrix& M, LongWord Col) {
  return detail::ExtractColOf(M, Col);
}
TQENSmallIntVector ExtractMatrixCol(const TQENSmallIntMatrix& M, LongWord Col) {
  return detail::ExtractColOf(M, Col);
}
TQENByteVector ExtractMatrixCol(const TQENByteMatrix& M, LongWord Col) {
  return detail::ExtractColOf(M, Col);
}
TQENSIntVector ExtractMatrixCol(const TQENSIntMatrix& M, LongWord Col) {
  return detail::ExtractColOf(M, Col);
}
void OverwriteMatrixRow(TQENFloatMatrix& M, LongWord Row, const TQENFloatVector& V, Extended Fill) {
  detail::OverwriteRowOf(M, Row, V, Fill);
}
void OverwriteMatrixRow(TQENDoubleMatrix& M, LongWord Row, const TQENDoubleVector& V, Double Fill) {
  detail::OverwriteRowOf(M, Row, V, Fill);
}
void OverwriteMatrixRow(TQENSingleMatrix& M, LongWord Row, const TQENSingleVector& V, Single Fill) {
  detail::OverwriteRowOf(M, Row, V, Fill);
}
void OverwriteMatrixRow(TQENInt64Matrix& M, LongWord Row, const TQENInt64Vector& V, Int64 Fill) {
  detail::OverwriteRowOf(M, Row, V, Fill);
}
void OverwriteMatrixRow(TQENLWordMatrix& M, LongWord Row, const TQENLWordVector& V, LongWord Fill) {
  detail::OverwriteRowOf(M, Row, V, Fill);
}
void OverwriteMatrixRow(TQENLIntMatrix& M, LongWord Row, const TQENLIntVector& V, LongInt Fill) {
  detail::OverwriteRowOf(M, Row, V, Fill);
}
void OverwriteMatrixRow(TQENWordMatrix& M, LongWord Row, const TQENWordVector& V, Word Fill) {
  detail::OverwriteRowOf(M, Row, V, Fill);
}
void OverwriteMatrixRow(TQENSmallIntMatrix& M, LongWord Row, const TQENSmallIntVector& V,
                        SmallInt Fill) {
  detail::OverwriteRowOf(M, Row, V, Fill);
}
void OverwriteMatrixRow(TQENByteMatrix& M, LongWord Row, const TQENByteVector& V, Byte Fill) {
  detail::OverwriteRowOf(M, Row, V, Fill);
}
void OverwriteMatrixRow(TQENSIntMatrix& M, LongWord Row, const TQENSIntVector& V, ShortInt Fill) {
  detail::OverwriteRowOf(M, Row, V, Fill);
}
void OverwriteMatrixCol(TQENFloatMatrix& M, LongWord Col, const TQENFloatVector& V, Extended Fill) {
  detail::OverwriteColOf(M, Col, V, Fill);
}
void OverwriteMatrixCol(TQENDoubleMatrix& M, LongWord Col, const TQENDoubleVector& V, Double Fill) {
  detail::OverwriteColOf(M, Col, V, Fill);
}
void OverwriteMatrixCol(TQENSingleMatrix& M, LongWord Col, const TQENSingleVector& V, Single Fill) {
  detail::OverwriteColOf(M, Col, V, Fill);
}
void OverwriteMatrixCol(TQENInt64Matrix& M, LongWord Col, const TQENInt64Vector& V, Int64 Fill) {
  detail::OverwriteColOf(M, Col, V, Fill);
}
void OverwriteMatrixCol(TQENLWordMatrix& M, LongWord Col, const TQENLWordVector& V, LongWord Fill) {
  detail::OverwriteColOf(M, Col, V, Fill);
}
void OverwriteMatrixCol(TQENLIntMatrix& M, LongWord Col, const TQENLIntVector& V, LongInt Fill) {
  detail::OverwriteColOf(M, Col, V, Fill);
}
void OverwriteMatrixCol(TQENWordMatrix& M, LongWord Col, const TQENWordVector& V, Word Fill) {
  detail::OverwriteColOf(M, Col, V, Fill);
}
void OverwriteMatrixCol(TQENSmallIntMatrix& M, LongWord Col, const TQENSmallIntVector& V,
                        SmallInt Fill) {
  detail::OverwriteColOf(M, Col, V, Fill);
}
void OverwriteMatrixCol(TQENByteMatrix& M, LongWord Col, const TQENByteVector& V, Byte Fill) {
  detail::OverwriteColOf(M, Col, V, Fill);
}
void OverwriteMatrixCol(TQENSIntMatrix& M, LongWord Col, const TQENSIntVector& V, ShortInt Fill) {
  detail::OverwriteColOf(M, Col, V, Fill);
}

// --- Copy, transpose, product ---
TQENFloatMatrix CopyMatrix(const TQENFloatMatrix& M) { return detail::CopyMatrixOf(M); }
TQENDoubleMatrix CopyMatrix(const TQENDoubleMatrix& M) { return detail::CopyMatrixOf(M); }
TQENSingleMatrix CopyMatrix(const TQENSingleMatrix& M) { return detail::CopyMatrixOf(M); }
TQENInt64Matrix CopyMatrix(const TQENInt64Matrix& M) { return detail::CopyMatrixOf(M); }
TQENLWordMatrix CopyMatrix(const TQENLWordMatrix& M) { return detail::CopyMatrixOf(M); }
TQENLIntMatrix CopyMatrix(const TQENLIntMatrix& M) { return detail::CopyMatrixOf(M); }
TQENWordMatrix CopyMatrix(const TQENWordMatrix& M) { return detail::CopyMatrixOf(M); }
TQENSmallIntMatrix CopyMatrix(const TQENSmallIntMatrix& M) { return detail::CopyMatrixOf(M); }
TQENByteMatrix CopyMatrix(const TQENByteMatrix& M) { return detail::CopyMatrixOf(M); }
TQENSIntMatrix CopyMatrix(const TQENSIntMatrix& M) { return detail::CopyMatrixOf(M); }
TQENFloatMatrix TransposeMatrix(const TQENFloatMatrix& M) { return detail::TransposeOf(M); }
TQENDoubleMatrix TransposeMatrix(const TQENDoubleMatrix& M) { return detail::TransposeOf(M); }
TQENSingleMatrix TransposeMatrix(const TQENSingleMatrix& M) { return detail::TransposeOf(M); }
TQENInt64Matrix TransposeMatrix(const TQENInt64Matrix& M) { return detail::TransposeOf(M); }
TQENLWordMatrix TransposeMatrix(const TQENLWordMatrix& M) { return detail::TransposeOf(M); }
TQENLIntMatrix TransposeMatrix(const TQENLIntMatrix& M) { return detail::TransposeOf(M); }
TQENWordMatrix TransposeMatrix(const TQENWordMatrix& M) { return detail::TransposeOf(M); }
TQENSmallIntMatrix TransposeMatrix(const TQENSmallIntMatrix& M) { return detail::TransposeOf(M); }
TQENByteMatrix TransposeMatrix(const TQENByteMatrix& M) { return detail::TransposeOf(M); }
TQENSIntMatrix TransposeMatrix(const TQENSIntMatrix& M) { return detail::TransposeOf(M); }
TQENFloatMatrix MultiplyMatrices(const TQENFloatMatrix& M1, const TQENFloatMatrix& M2) {
  return MultiplyOf(M1, M2);
}
TQENDoubleMatrix MultiplyMatrices(const TQENDoubleMatrix& M1, const TQENDoubleMatrix& M2) {
  return MultiplyOf(M1, M2);
}
TQENSingleMatrix MultiplyMatrices(const TQENSingleMatrix& M1, const TQENSingleMatrix& M2) {
  return MultiplyOf(M1, M2);
}

// --- Sums ---
Extended SumMatrixRow(const TQENFloatMatrix& M, LongWord Row) { return SumRowOf(M, Row); }
Extended SumMatrixRow(const TQENDoubleMatrix& M, LongWord Row) { return SumRowOf(M, Row); }
Extended SumMatrixRow(const TQENSingleMatrix& M, LongWord Row) { return SumRowOf(M, Row); }
Int64 SumMatrixRow(const TQENInt64Matrix& M, LongWord Row) { return SumRowOf(M, Row); }
Int64 SumMatrixRow(const TQENLWordMatrix& M, LongWord Row) { return SumRowOf(M, Row); }
Int64 SumMatrixRow(const TQENSmallIntMatrix& M, LongWord Row) { return SumRowOf(M, Row); }
Int64 SumMatrixRow(const TQENWordMatrix& M, LongWord Row) { return SumRowOf(M, Row); }
Int64 SumMatrixRow(const TQENSIntMatrix& M, LongWord Row) { return SumRowOf(M, Row); }
Int64 SumMatrixRow(const TQENByteMatrix& M, LongWord Row) { return SumRowOf(M, Row); }
Extended SumMatrixCol(const TQENFloatMatrix& M, LongWord Col) { return SumColOf(M, Col); }
Extended SumMatrixCol(const TQENDoubleMatrix& M, LongWord Col) { return SumColOf(M, Col); }
Extended SumMatrixCol(const TQENSingleMatrix& M, LongWord Col) { return SumColOf(M, Col); }
Int64 SumMatrixCol(const TQENInt64Matrix& M, LongWord Col) { return SumColOf(M, Col); }
Int64 SumMatrixCol(const TQENLWordMatrix& M, LongWord Col) { return SumColOf(M, Col); }
Int64 SumMatrixCol(const TQENSmallIntMatrix& M, LongWord Col) { return SumColOf(M, Col); }
Int64 SumMatrixCol(const TQENWordMatrix& M, LongWord Col) { return SumColOf(M, Col); }
Int64 SumMatrixCol(const TQENSIntMatrix& M, LongWord Col) { return SumColOf(M, Col); }
Int64 SumMatrixCol(const TQENByteMatrix& M, LongWord Col) { return SumColOf(M, Col); }

}  // namespace tovrin
