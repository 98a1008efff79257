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

// --- Shape queries ---

template <typename T>
void DimensionsOf(const MatrixOf<T>& M, LongWord& Rows, LongWord& Cols, bool& Rectangular) {
  const detail::MatrixShape s = detail::ShapeOf(M);
  Rows = s.Rows;
  Cols = s.Cols;
  Rectangular = s.Rectangular;
}

template <typename T>
LongInt RowsOf(const MatrixOf<T>& M) {
  return static_cast<LongInt>(M.size());
}

template <typename T>
LongInt ColsOf(const MatrixOf<T>& M) {
  return M.empty() ? 0 : static_cast<LongInt>(M[0].size());
}

template <typename T>
TQENFloatMatrix ToFloatMatrix(const MatrixOf<T>& M) {
  return detail::ConvertMatrixOf<PackedExtended>(
      M, [](T x) { return PackedExtended(static_cast<Extended>(detail::ValueOf<T>(x))); });
}

// --- Arithmetic ---

template <typename T>
MatrixOf<T> AddOf(const MatrixOf<T>& M1, const MatrixOf<T>& M2) {
  return detail::CombineMatrices(M1, M2, [](T a, T b) { return Rules<T>::Add(a, b); });
}

template <typename T>
MatrixOf<T> SubtractOf(const MatrixOf<T>& M1, const MatrixOf<T>& M2) {
  return detail::CombineMatrices(M1, M2, [](T a, T b) { return Rules<T>::Sub(a, b); });
}

template <typename T>
void AddToOf(MatrixOf<T>& M1, const MatrixOf<T>& M2) {
  detail::CombineIntoMatrix(M1, M2, [](T a, T b) { return Rules<T>::Add(a, b); });
}

template <typename T>
void SubtractFromOf(MatrixOf<T>& M1, const MatrixOf<T>& M2) {
  detail::CombineIntoMatrix(M1, M2, [](T a, T b) { return Rules<T>::Sub(a, b); });
}

template <typename T, typename K>
MatrixOf<T> MultiplyByConstOf(const MatrixOf<T>& M, K k) {
  return detail::MapMatrix(M, [k](T x) { return Rules<T>::Mul(k, x); });
}

template <typename T, typename K>
void MultiplyByConstInPlaceOf(MatrixOf<T>& M, K k) {
  detail::MapMatrixInPlace(M, [k](T x) { return Rules<T>::Mul(k, x); });
}

template <typename T, typename K>
void LinearTransformOf(MatrixOf<T>& M, K a, K b) {
  detail::MapMatrixInPlace(M, [a, b](T x) { return Rules<T>::Linear(x, a, b); });
}

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

template <typename T>
void SquareOf(MatrixOf<T>& M) {
  ElementWiseOf(M, rsMatrixIsEmpty, kAnyValue, [](Extended x) { return x * x; });
}

template <typename T>
void SqrtOf(MatrixOf<T>& M) {
  ElementWiseOf(
      M, rsMatrixNeg, [](Extended x) { return !(x < 0); }, [](Extended x) { return std::sqrt(x); });
}

template <typename T>
void InvOf(MatrixOf<T>& M) {
  ElementWiseOf(
      M, rsMatrixZero, [](Extended x) { return x != 0; }, [](Extended x) { return 1 / x; });
}

template <typename T>
void LnOf(MatrixOf<T>& M) {
  ElementWiseOf(
      M, rsMatrixNotPos, [](Extended x) { return !(x <= 0); },
      [](Extended x) { return std::log(x); });
}

template <typename T>
void Log10Of(MatrixOf<T>& M) {
  ElementWiseOf(
      M, rsMatrixNotPos, [](Extended x) { return !(x <= 0); },
      [](Extended x) { return QENLog10(x); });
}

template <typename T>
Extended GrandMeanOf(const MatrixOf<T>& M, LongWord& N) {
  const Extended sum = detail::GrandSumOf(M, N, Extended{0}, [](Extended s, T x) {
    return s + static_cast<Extended>(detail::ValueOf<T>(x));
  });
  return sum / static_cast<Extended>(N);
}

}  // namespace

// --- Creation ---
// The creation functions carry the type in their names: one pair per element type, the name
// beside the stored element type in the order of the type list.
#define TOVRIN_DEFINE_CREATION(T, Name)                                   \
  TQEN##Name##Matrix Create##Name##Matrix(LongWord Rows, LongWord Cols) { \
    return detail::CreateMatrixOf<T>(Rows, Cols);                         \
  }                                                                       \
  TQEN##Name##Matrix Create##Name##IdentityMatrix(LongWord N) {           \
    return detail::CreateIdentityOf<T>(N, T(1));                          \
  }
TOVRIN_DEFINE_CREATION(PackedExtended, Float)
TOVRIN_DEFINE_CREATION(Double, Double)
TOVRIN_DEFINE_CREATION(Single, Single)
TOVRIN_DEFINE_CREATION(Int64, Int64)
TOVRIN_DEFINE_CREATION(LongWord, LWord)
TOVRIN_DEFINE_CREATION(LongInt, LInt)
TOVRIN_DEFINE_CREATION(Word, Word)
TOVRIN_DEFINE_CREATION(SmallInt, SmallInt)
TOVRIN_DEFINE_CREATION(Byte, Byte)
TOVRIN_DEFINE_CREATION(ShortInt, SInt)
#undef TOVRIN_DEFINE_CREATION

// --- Shape queries ---
template <detail::AnyElement T>
LongInt MatrixRows(const detail::MatrixOf<T>& M) {
  return RowsOf(M);
}
template <detail::AnyElement T>
LongInt MatrixCols(const detail::MatrixOf<T>& M) {
  return ColsOf(M);
}
template <detail::AnyOrMoneyElement T>
bool MatrixIsRectangular(const detail::MatrixOf<T>& M) {
  return detail::IsRectangularOf(M);
}
template <detail::AnyOrMoneyElement T>
void MatrixDimensions(const detail::MatrixOf<T>& M, LongWord& Rows, LongWord& Cols,
                      bool& Rectangular) {
  DimensionsOf(M, Rows, Cols, Rectangular);
}
template <detail::AnyOrMoneyElement T>
bool MatrixIsSquare(const detail::MatrixOf<T>& M) {
  return detail::IsSquareOf(M);
}
template <detail::AnyOrMoneyElement T>
bool MatricesSameDimensions(const detail::MatrixOf<T>& M1, const detail::MatrixOf<T>& M2) {
  return detail::SameDimensionsOf(M1, M2);
}

// --- Conversion ---
template <detail::AnyElement T>
TQENFloatMatrix Matrix2FloatMatrix(const detail::MatrixOf<T>& M) {
  return ToFloatMatrix(M);
}

// --- Two-matrix arithmetic ---
template <detail::ArithmeticElement T>
detail::MatrixOf<T> AddMatrices(const detail::MatrixOf<T>& M1, const detail::MatrixOf<T>& M2) {
  return AddOf(M1, M2);
}
template <detail::ArithmeticElement T>
detail::MatrixOf<T> SubtractMatrices(const detail::MatrixOf<T>& M1, const detail::MatrixOf<T>& M2) {
  return SubtractOf(M1, M2);
}
template <detail::ArithmeticElement T>
void AddToMatrix(detail::MatrixOf<T>& M1, const detail::MatrixOf<T>& M2) {
  AddToOf(M1, M2);
}
template <detail::ArithmeticElement T>
void SubtractFromMatrix(detail::MatrixOf<T>& M1, const detail::MatrixOf<T>& M2) {
  SubtractFromOf(M1, M2);
}

// --- Scalar arithmetic ---
template <detail::ArithmeticElement T>
detail::MatrixOf<T> MultiplyMatrixByConst(const detail::MatrixOf<T>& M, detail::ScalarOf<T> K) {
  return MultiplyByConstOf(M, K);
}
template <detail::ArithmeticElement T>
void MultiplyMatrixByConst2(detail::MatrixOf<T>& M, detail::ScalarOf<T> K) {
  MultiplyByConstInPlaceOf(M, K);
}
template <detail::ArithmeticElement T>
void LinearTransformMatrix(detail::MatrixOf<T>& M, detail::ScalarOf<T> A, detail::ScalarOf<T> B) {
  LinearTransformOf(M, A, B);
}

// --- Element-wise functions ---
template <detail::FloatElement T>
void SquareMatrix(detail::MatrixOf<T>& M) {
  SquareOf(M);
}
template <detail::FloatElement T>
void SqrtMatrix(detail::MatrixOf<T>& M) {
  SqrtOf(M);
}
template <detail::FloatElement T>
void InvMatrix(detail::MatrixOf<T>& M) {
  InvOf(M);
}
template <detail::FloatElement T>
void LnMatrix(detail::MatrixOf<T>& M) {
  LnOf(M);
}
template <detail::FloatElement T>
void Log10Matrix(detail::MatrixOf<T>& M) {
  Log10Of(M);
}

// --- Aggregate ---
template <detail::ArithmeticElement T>
Extended GrandMean(const detail::MatrixOf<T>& M, LongWord& N) {
  return GrandMeanOf(M, N);
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

#define TOVRIN_INSTANTIATE(T)                                                    \
  template MatrixOf<T> AddMatrices(const MatrixOf<T>&, const MatrixOf<T>&);      \
  template MatrixOf<T> SubtractMatrices(const MatrixOf<T>&, const MatrixOf<T>&); \
  template void AddToMatrix(MatrixOf<T>&, const MatrixOf<T>&);                   \
  template void SubtractFromMatrix(MatrixOf<T>&, const MatrixOf<T>&);            \
  template MatrixOf<T> MultiplyMatrixByConst(const MatrixOf<T>&, ScalarOf<T>);   \
  template void MultiplyMatrixByConst2(MatrixOf<T>&, ScalarOf<T>);               \
  template void LinearTransformMatrix(MatrixOf<T>&, ScalarOf<T>, ScalarOf<T>);   \
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
