// Row reduction: row echelon form, rank, inverse, determinant, zero rows and the identity
// test of the three float matrix types.
//
// The elimination works through unchecked row operations once the operand has passed its
// checks, which gives the same results as the public operations with the shape switch off
// while never writing QENMatrixRectangularCheck (other threads keep seeing their own value).
#include <algorithm>
#include <cmath>
#include <cstddef>
#include <vector>

#include "tovrin/detail/ElementRules.h"
#include "tovrin/detail/MatrixRowCol.h"
#include "tovrin/detail/MatrixShape.h"
#include "tovrin/matrix/TOVRINMatrix.h"
#include "tovrin/vector/TOVRINVector.h"

namespace tovrin {
namespace {

using detail::MatrixOf;

// --- Unchecked row operations ---

// Row[j] := Row[j] x Factor for j = First .. Cols-1.
template <typename T>
void ScaleRowFrom(std::vector<T>& Row, std::size_t First, std::size_t Cols, Extended Factor) {
  T* x = Row.data();
  for (std::size_t j = First; j < Cols; ++j) x[j] = T(static_cast<Extended>(x[j]) * Factor);
}

// Changed[j] := Changed[j] + Factor x Added[j] for j = 0 .. Cols-1.
template <typename T>
void AddRowMultiple(std::vector<T>& Changed, const std::vector<T>& Added, std::size_t Cols,
                    Extended Factor) {
  T* a = Changed.data();
  const T* b = Added.data();
  for (std::size_t j = 0; j < Cols; ++j) {
    a[j] = T(static_cast<Extended>(a[j]) + Factor * static_cast<Extended>(b[j]));
  }
}

// The rows for which VectorZero holds (each row read at its own length).
template <typename T>
LongWord CountZeroRows(const MatrixOf<T>& M) {
  LongWord n = 0;
  for (const auto& row : M) {
    if (VectorZero(row)) ++n;
  }
  return n;
}

// --- Checks ---

// rsMatrixIsEmpty, then rsMatrixRect; with the switch off, a row shorter than the column
// count raises rsMatrixRect as well.
template <typename T>
detail::MatrixShape CheckReducible(const MatrixOf<T>& M) {
  const detail::MatrixShape s = detail::ShapeOf(M);
  if (s.Rows == 0 || s.Cols == 0) detail::RaiseMathError(rsMatrixIsEmpty);
  if (!s.Rectangular) detail::RaiseMathError(rsMatrixRect);
  detail::RequireRowsReach(M, s.Cols);
  return s;
}

// rsMatrixIsEmpty, then rsMatrixSqr; the same memory guard.
template <typename T>
detail::MatrixShape CheckSquare(const MatrixOf<T>& M) {
  const detail::MatrixShape s = detail::ShapeOf(M);
  if (s.Rows == 0 || s.Cols == 0) detail::RaiseMathError(rsMatrixIsEmpty);
  if (!s.Rectangular || s.Rows != s.Cols) detail::RaiseMathError(rsMatrixSqr);
  detail::RequireRowsReach(M, s.Cols);
  return s;
}

// --- Elimination ---

// What the elimination reports besides the reduced matrix: the rows of Inverse (when given)
// follow every swap, scaling and addition of M's rows; Determinant (when given) is
// multiplied by -1 for each swap and by the pivot for each scaling.
template <typename T>
struct Followers {
  MatrixOf<T>* Inverse = nullptr;
  Extended* Determinant = nullptr;
};

// The pivot for the stretch below row R from column C on: the entry of largest magnitude in
// the leftmost column that holds a non-zero entry (FloatIsNotZero); among equal magnitudes the
// first found, i.e. the upper row. Returns false when every entry there is within tolerance
// of zero.
template <typename T>
bool FindPivot(const MatrixOf<T>& M, std::size_t R, std::size_t C, std::size_t Rows,
               std::size_t Cols, std::size_t& P, std::size_t& Q) {
  Extended largest = 0;
  bool found = false;
  for (std::size_t j = C; j < Cols && !found; ++j) {
    for (std::size_t i = R; i < Rows; ++i) {
      const Extended x = static_cast<Extended>(M[i][j]);
      if (FloatIsNotZero(x) && std::fabs(x) > largest) {
        largest = std::fabs(x);
        P = i;
        Q = j;
        found = true;
      }
    }
  }
  return found;
}

template <typename T>
void Eliminate(MatrixOf<T>& M, std::size_t Rows, std::size_t Cols, Followers<T> f) {
  const std::size_t n = f.Inverse ? f.Inverse->size() : 0;
  std::size_t r = 0;
  std::size_t c = 0;
  for (;;) {
    std::size_t p = 0;
    std::size_t q = 0;
    if (!FindPivot(M, r, c, Rows, Cols, p, q)) return;
    if (p != r) {
      detail::SwapRowElements(M, r, p, Cols);
      if (f.Inverse) detail::SwapRowElements(*f.Inverse, r, p, n);
      if (f.Determinant) *f.Determinant = -*f.Determinant;
    }
    const Extended pivot = static_cast<Extended>(M[r][q]);
    if (FloatIsNotZero(pivot - 1)) {
      const Extended reciprocal = 1 / pivot;
      ScaleRowFrom(M[r], q, Cols, reciprocal);
      if (f.Inverse) ScaleRowFrom((*f.Inverse)[r], 0, n, reciprocal);
      if (f.Determinant) *f.Determinant *= pivot;
    }
    for (std::size_t i = r + 1; i < Rows; ++i) {
      const Extended below = static_cast<Extended>(M[i][q]);
      if (FloatIsNotZero(below)) {
        AddRowMultiple(M[i], M[r], Cols, -below);
        if (f.Inverse) AddRowMultiple((*f.Inverse)[i], (*f.Inverse)[r], n, -below);
      }
    }
    ++r;
    c = q + 1;
    if (r > Rows - 1 || c > Cols - 1) return;
  }
}

// --- Working rows ---

// The elimination runs on rows of a working type: Double and Single matrices in place,
// Extended matrices unpacked into native Extended rows (ten-byte elements are slow to load and
// store one by one) and packed back afterwards. Unpacking and packing are exact, so the
// results are the same bits either way. Only the first Cols elements of a row take part; any
// further elements of a longer row (shape switch off) stay as they are.
template <typename T>
class WorkingRows {
 public:
  using Element = T;
  WorkingRows(MatrixOf<T>& M, std::size_t) : rows_(M) {}
  MatrixOf<T>& Rows() { return rows_; }
  void WriteBack() {}

 private:
  MatrixOf<T>& rows_;
};

template <>
class WorkingRows<PackedExtended> {
 public:
  using Element = Extended;
  WorkingRows(TQENFloatMatrix& M, std::size_t Cols) : target_(M), cols_(Cols), rows_(M.size()) {
    for (std::size_t i = 0; i < M.size(); ++i) {
      rows_[i].assign(M[i].begin(), M[i].begin() + static_cast<std::ptrdiff_t>(Cols));
    }
  }
  MatrixOf<Extended>& Rows() { return rows_; }
  void WriteBack() {
    for (std::size_t i = 0; i < rows_.size(); ++i) {
      std::copy(rows_[i].begin(), rows_[i].begin() + static_cast<std::ptrdiff_t>(cols_),
                target_[i].begin());
    }
  }

 private:
  TQENFloatMatrix& target_;
  std::size_t cols_;
  MatrixOf<Extended> rows_;
};

// --- The public families ---

template <typename T>
void RowEchelonFormOf(MatrixOf<T>& M) {
  const detail::MatrixShape s = CheckReducible(M);
  WorkingRows<T> w(M, s.Cols);
  Eliminate(w.Rows(), s.Rows, s.Cols, Followers<typename WorkingRows<T>::Element>{});
  w.WriteBack();
}

template <typename T>
void RowEchelonFormRankOf(MatrixOf<T>& M, LongWord& Rank) {
  RowEchelonFormOf(M);
  Rank = static_cast<LongWord>(M.size()) - CountZeroRows(M);
}

template <typename T>
bool InverseOf(MatrixOf<T>& M, MatrixOf<T>& Inverse) {
  using W = typename WorkingRows<T>::Element;
  const detail::MatrixShape s = CheckSquare(M);
  const std::size_t n = s.Rows;
  Inverse = detail::CreateIdentityOf<T>(s.Rows, T(1));
  WorkingRows<T> wm(M, n);
  WorkingRows<T> wi(Inverse, n);
  MatrixOf<W>& m = wm.Rows();
  MatrixOf<W>& inv = wi.Rows();
  Eliminate(m, n, n, Followers<W>{&inv, nullptr});
  wm.WriteBack();
  if (CountZeroRows(M) != 0) {
    wi.WriteBack();
    return false;
  }
  for (std::size_t j = n - 1; j >= 1; --j) {
    for (std::size_t i = j; i-- > 0;) {
      const Extended above = static_cast<Extended>(m[i][j]);
      if (FloatIsNotZero(above)) {
        AddRowMultiple(m[i], m[j], n, -above);
        AddRowMultiple(inv[i], inv[j], n, -above);
      }
    }
  }
  wm.WriteBack();
  wi.WriteBack();
  return true;
}

template <typename T>
Extended DeterminantOf(MatrixOf<T>& M) {
  using W = typename WorkingRows<T>::Element;
  const detail::MatrixShape s = CheckSquare(M);
  Extended d = 1;
  WorkingRows<T> w(M, s.Cols);
  Eliminate(w.Rows(), s.Rows, s.Cols, Followers<W>{nullptr, &d});
  w.WriteBack();
  for (std::size_t i = 0; i < s.Rows; ++i) d *= static_cast<Extended>(M[i][i]);
  return d;
}

// Reads every row at its own length, so a ragged matrix needs no memory guard here (with the
// switch off an empty row makes VectorZero raise rsVectorIsEmpty).
template <typename T>
LongWord ZeroRowsOf(const MatrixOf<T>& M) {
  const detail::MatrixShape s = detail::ShapeOf(M);
  if (s.Rows == 0 || s.Cols == 0) detail::RaiseMathError(rsMatrixIsEmpty);
  if (!s.Rectangular) detail::RaiseMathError(rsMatrixRect);
  return CountZeroRows(M);
}

template <typename T>
bool IsIdentityOf(const MatrixOf<T>& M) {
  const detail::MatrixShape s = CheckSquare(M);
  for (std::size_t i = 0; i < s.Rows; ++i) {
    for (std::size_t j = 0; j < s.Cols; ++j) {
      const Extended x = static_cast<Extended>(M[i][j]);
      if (FloatIsNotZero(i == j ? x - 1 : x)) return false;
    }
  }
  return true;
}

}  // namespace

template <detail::FloatElement T>
void RowEchelonForm(detail::MatrixOf<T>& M) {
  RowEchelonFormOf(M);
}
template <detail::FloatElement T>
void RowEchelonFormRank(detail::MatrixOf<T>& M, LongWord& Rank) {
  RowEchelonFormRankOf(M, Rank);
}
template <detail::FloatElement T>
bool MatrixInverse(detail::MatrixOf<T>& M, detail::MatrixOf<T>& Inverse) {
  return InverseOf(M, Inverse);
}
template <detail::FloatElement T>
Extended MatrixDeterminant(detail::MatrixOf<T>& M) {
  return DeterminantOf(M);
}
template <detail::FloatElement T>
LongWord MatrixZeroRows(const detail::MatrixOf<T>& M) {
  return ZeroRowsOf(M);
}
template <detail::FloatElement T>
bool MatrixIsIdentity(const detail::MatrixOf<T>& M) {
  return IsIdentityOf(M);
}

using detail::MatrixOf;
using detail::ScalarOf;
using detail::SumOf;
using detail::ValueOf;

#define TOVRIN_INSTANTIATE(T)                                \
  template void RowEchelonForm(MatrixOf<T>&);                \
  template void RowEchelonFormRank(MatrixOf<T>&, LongWord&); \
  template bool MatrixInverse(MatrixOf<T>&, MatrixOf<T>&);   \
  template Extended MatrixDeterminant(MatrixOf<T>&);         \
  template LongWord MatrixZeroRows(const MatrixOf<T>&);      \
  template bool MatrixIsIdentity(const MatrixOf<T>&);
TOVRIN_FLOAT_ELEMENTS(TOVRIN_INSTANTIATE)
#undef TOVRIN_INSTANTIATE

}  // namespace tovrin
