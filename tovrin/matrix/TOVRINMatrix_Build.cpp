// Creation, shape queries, conversion, two-matrix and scalar arithmetic, element-wise
// functions and the grand mean.
#include <atomic>
#include <cmath>

#include "tovrin/detail/ElementRules.h"
#include "tovrin/detail/MatrixArithmetic.h"
#include "tovrin/detail/MatrixShape.h"
#include "tovrin/matrix/TOVRINMatrix.h"

namespace tovrin {

std::atomic<bool> QENMatrixRectangularCheck{true};

namespace {

using detail::MatrixOf;

template <typename T>
using Rules = detail::ElementRules<T>;

// --- Element-wise functions ---

// Visits every element in row-major order; an element outside the domain raises Ident at
// once, leaving the elements already replaced as they are.
template <typename T, typename DomainFn, typename ValueFn>
void ElementWiseOf(MatrixOf<T>& M, TResStringId Ident, DomainFn InDomain, ValueFn Value) {
  if (M.empty()) detail::RaiseMathError(rsMatrixIsEmpty);
  for (auto& row : M) {
    for (auto& element : row) {
      const Extended x = element;
      if (!InDomain(x)) detail::RaiseMathError(Ident);
      element = T(Value(x));
    }
  }
}

constexpr auto kAnyValue = [](Extended) { return true; };

}  // namespace

// --- Creation ---
// One pair per element type, the name beside the stored element type in the order of the type
// list.
TOVRIN_DEFINE_MATRIX_CREATION(PackedExtended, Float, 1)
TOVRIN_DEFINE_MATRIX_CREATION(Double, Double, 1)
TOVRIN_DEFINE_MATRIX_CREATION(Single, Single, 1)
TOVRIN_DEFINE_MATRIX_CREATION(Int64, Int64, 1)
TOVRIN_DEFINE_MATRIX_CREATION(LongWord, LWord, 1)
TOVRIN_DEFINE_MATRIX_CREATION(LongInt, LInt, 1)
TOVRIN_DEFINE_MATRIX_CREATION(Word, Word, 1)
TOVRIN_DEFINE_MATRIX_CREATION(SmallInt, SmallInt, 1)
TOVRIN_DEFINE_MATRIX_CREATION(Byte, Byte, 1)
TOVRIN_DEFINE_MATRIX_CREATION(ShortInt, SInt, 1)

// --- Shape queries ---
template <detail::AnyElement T>
LongInt MatrixRows(const detail::MatrixOf<T>& M) {
  return static_cast<LongInt>(M.size());
}
template <detail::AnyElement T>
LongInt MatrixCols(const detail::MatrixOf<T>& M) {
  return M.empty() ? 0 : static_cast<LongInt>(M[0].size());
}
template <detail::AnyOrMoneyElement T>
bool MatrixIsRectangular(const detail::MatrixOf<T>& M) {
  if (M.empty()) return false;
  const std::size_t cols = M[0].size();
  for (std::size_t i = 1; i < M.size(); ++i) {
    if (M[i].size() != cols) return false;
  }
  return true;
}
template <detail::AnyOrMoneyElement T>
void MatrixDimensions(const detail::MatrixOf<T>& M, LongWord& Rows, LongWord& Cols,
                      bool& Rectangular) {
  const detail::MatrixShape s = detail::ShapeOf(M);
  Rows = s.Rows;
  Cols = s.Cols;
  Rectangular = s.Rectangular;
}
template <detail::AnyOrMoneyElement T>
bool MatrixIsSquare(const detail::MatrixOf<T>& M) {
  const detail::MatrixShape s = detail::ShapeOf(M);
  return s.Rectangular && s.Rows == s.Cols;
}
template <detail::AnyOrMoneyElement T>
bool MatricesSameDimensions(const detail::MatrixOf<T>& M1, const detail::MatrixOf<T>& M2) {
  return detail::SameDimensionsOf(M1, M2);
}

// --- Conversion ---
template <detail::AnyElement T>
TQENFloatMatrix Matrix2FloatMatrix(const detail::MatrixOf<T>& M) {
  return detail::ConvertMatrixOf<PackedExtended>(
      M, [](T x) { return PackedExtended(static_cast<Extended>(detail::ValueOf<T>(x))); });
}

// --- Two-matrix arithmetic ---
TOVRIN_DEFINE_MATRIX_COMBINATIONS(detail::ArithmeticElement, detail::ElementRules)

// --- Scalar arithmetic ---
template <detail::ArithmeticElement T>
detail::MatrixOf<T> MultiplyMatrixByConst(const detail::MatrixOf<T>& M, detail::ScalarOf<T> K) {
  return detail::MapMatrix(M, [K](T x) { return Rules<T>::Mul(K, x); });
}
template <detail::ArithmeticElement T>
void MultiplyMatrixByConst2(detail::MatrixOf<T>& M, detail::ScalarOf<T> K) {
  detail::MapMatrixInPlace(M, [K](T x) { return Rules<T>::Mul(K, x); });
}
template <detail::ArithmeticElement T>
void LinearTransformMatrix(detail::MatrixOf<T>& M, detail::ScalarOf<T> A, detail::ScalarOf<T> B) {
  detail::MapMatrixInPlace(M, [A, B](T x) { return Rules<T>::Linear(x, A, B); });
}

// --- Element-wise functions ---
template <detail::FloatElement T>
void SquareMatrix(detail::MatrixOf<T>& M) {
  ElementWiseOf(M, rsMatrixIsEmpty, kAnyValue, [](Extended x) { return x * x; });
}
template <detail::FloatElement T>
void SqrtMatrix(detail::MatrixOf<T>& M) {
  ElementWiseOf(
      M, rsMatrixNeg, [](Extended x) { return !(x < 0); }, [](Extended x) { return std::sqrt(x); });
}
template <detail::FloatElement T>
void InvMatrix(detail::MatrixOf<T>& M) {
  ElementWiseOf(
      M, rsMatrixZero, [](Extended x) { return x != 0; }, [](Extended x) { return 1 / x; });
}
template <detail::FloatElement T>
void LnMatrix(detail::MatrixOf<T>& M) {
  ElementWiseOf(
      M, rsMatrixNotPos, [](Extended x) { return !(x <= 0); },
      [](Extended x) { return std::log(x); });
}
template <detail::FloatElement T>
void Log10Matrix(detail::MatrixOf<T>& M) {
  ElementWiseOf(
      M, rsMatrixNotPos, [](Extended x) { return !(x <= 0); },
      [](Extended x) { return QENLog10(x); });
}

// --- Aggregate ---
template <detail::ArithmeticElement T>
Extended GrandMean(const detail::MatrixOf<T>& M, LongWord& N) {
  const Extended sum = detail::GrandSumOf(M, N, Extended{0}, [](Extended s, T x) {
    return s + static_cast<Extended>(detail::ValueOf<T>(x));
  });
  return sum / static_cast<Extended>(N);
}

using detail::MatrixOf;
using detail::ScalarOf;
using detail::SumOf;
using detail::ValueOf;

#define TOVRIN_INSTANTIATE(T)                                                      \
  template bool MatrixIsRectangular(const MatrixOf<T>&);                           \
  template void MatrixDimensions(const MatrixOf<T>&, LongWord&, LongWord&, bool&); \
  template bool MatrixIsSquare(const MatrixOf<T>&);                                \
  template bool MatricesSameDimensions(const MatrixOf<T>&, const MatrixOf<T>&);
TOVRIN_ALL_AND_MONEY_ELEMENTS(TOVRIN_INSTANTIATE)
#undef TOVRIN_INSTANTIATE

#define TOVRIN_INSTANTIATE(T)                      \
  template LongInt MatrixRows(const MatrixOf<T>&); \
  template LongInt MatrixCols(const MatrixOf<T>&); \
  template TQENFloatMatrix Matrix2FloatMatrix(const MatrixOf<T>&);
TOVRIN_ALL_ELEMENTS(TOVRIN_INSTANTIATE)
#undef TOVRIN_INSTANTIATE

#define TOVRIN_INSTANTIATE(T)                                                  \
  TOVRIN_INSTANTIATE_MATRIX_COMBINATIONS(T)                                    \
  template MatrixOf<T> MultiplyMatrixByConst(const MatrixOf<T>&, ScalarOf<T>); \
  template void MultiplyMatrixByConst2(MatrixOf<T>&, ScalarOf<T>);             \
  template void LinearTransformMatrix(MatrixOf<T>&, ScalarOf<T>, ScalarOf<T>); \
  template Extended GrandMean(const MatrixOf<T>&, LongWord&);
TOVRIN_ARITHMETIC_ELEMENTS(TOVRIN_INSTANTIATE)
#undef TOVRIN_INSTANTIATE

#define TOVRIN_INSTANTIATE(T)               \
  template void SquareMatrix(MatrixOf<T>&); \
  template void SqrtMatrix(MatrixOf<T>&);   \
  template void InvMatrix(MatrixOf<T>&);    \
  template void LnMatrix(MatrixOf<T>&);     \
  template void Log10Matrix(MatrixOf<T>&);
TOVRIN_FLOAT_ELEMENTS(TOVRIN_INSTANTIATE)
#undef TOVRIN_INSTANTIATE

}  // namespace tovrin
