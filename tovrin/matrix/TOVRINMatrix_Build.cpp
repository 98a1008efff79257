// Creation, shape queries, conversion, two-matrix and scalar arithmetic, element-wise
// functions and the grand mean.
#include <cmath>

#include "tovrin/detail/ElementRules.h"
#include "tovrin/detail/MatrixArithmetic.h"
#include "tovrin/detail/MatrixShape.h"
#include "tovrin/matrix/TOVRINMatrix.h"

namespace tovrin {
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
TQENFloatMatrix CreateFloatMatrix(LongWord Rows, LongWord Cols) {
  return detail::CreateMatrixOf<PackedExtended>(Rows, Cols);
}
TQENDoubleMatrix CreateDoubleMatrix(LongWord Rows, LongWord Cols) {
  return detail::CreateMatrixOf<Double>(Rows, Cols);
}
TQENSingleMatrix CreateSingleMatrix(LongWord Rows, LongWord Cols) {
  return detail::CreateMatrixOf<Single>(Rows, Cols);
}
TQENInt64Matrix CreateInt64Matrix(LongWord Rows, LongWord Cols) {
  return detail::CreateMatrixOf<Int64>(Rows, Cols);
}
TQENLWordMatrix CreateLWordMatrix(LongWord Rows, LongWord Cols) {
  return detail::CreateMatrixOf<LongWord>(Rows, Cols);
}
TQENLIntMatrix CreateLIntMatrix(LongWord Rows, LongWord Cols) {
  return detail::CreateMatrixOf<LongInt>(Rows, Cols);
}
TQENWordMatrix CreateWordMatrix(LongWord Rows, LongWord Cols) {
  return detail::CreateMatrixOf<Word>(Rows, Cols);
}
TQENSmallIntMatrix CreateSmallIntMatrix(LongWord Rows, LongWord Cols) {
  return detail::CreateMatrixOf<SmallInt>(Rows, Cols);
}
TQENByteMatrix CreateByteMatrix(LongWord Rows, LongWord Cols) {
  return detail::CreateMatrixOf<Byte>(Rows, Cols);
}
TQENSIntMatrix CreateSIntMatrix(LongWord Rows, LongWord Cols) {
  return detail::CreateMatrixOf<ShortInt>(Rows, Cols);
}
TQENFloatMatrix CreateFloatIdentityMatrix(LongWord N) {
  return detail::CreateIdentityOf<PackedExtended>(N, PackedExtended(1));
}
TQENDoubleMatrix CreateDoubleIdentityMatrix(LongWord N) {
  return detail::CreateIdentityOf<Double>(N, Double(1));
}
TQENSingleMatrix CreateSingleIdentityMatrix(LongWord N) {
  return detail::CreateIdentityOf<Single>(N, Single(1));
}
TQENInt64Matrix CreateInt64IdentityMatrix(LongWord N) {
  return detail::CreateIdentityOf<Int64>(N, Int64(1));
}
TQENLWordMatrix CreateLWordIdentityMatrix(LongWord N) {
  return detail::CreateIdentityOf<LongWord>(N, LongWord(1));
}
TQENLIntMatrix CreateLIntIdentityMatrix(LongWord N) {
  return detail::CreateIdentityOf<LongInt>(N, LongInt(1));
}
TQENWordMatrix CreateWordIdentityMatrix(LongWord N) {
  return detail::CreateIdentityOf<Word>(N, Word(1));
}
TQENSmallIntMatrix CreateSmallIntIdentityMatrix(LongWord N) {
  return detail::CreateIdentityOf<SmallInt>(N, SmallInt(1));
}
TQENByteMatrix CreateByteIdentityMatrix(LongWord N) {
  return detail::CreateIdentityOf<Byte>(N, Byte(1));
}
TQENSIntMatrix CreateSIntIdentityMatrix(LongWord N) {
  return detail::CreateIdentityOf<ShortInt>(N, ShortInt(1));
}

// --- Shape queries ---
LongInt MatrixRows(const TQENFloatMatrix& M) { return RowsOf(M); }
LongInt MatrixRows(const TQENDoubleMatrix& M) { return RowsOf(M); }
LongInt MatrixRows(const TQENSingleMatrix& M) { return RowsOf(M); }
LongInt MatrixRows(const TQENInt64Matrix& M) { return RowsOf(M); }
LongInt MatrixRows(const TQENLWordMatrix& M) { return RowsOf(M); }
LongInt MatrixRows(const TQENLIntMatrix& M) { return RowsOf(M); }
LongInt MatrixRows(const TQENWordMatrix& M) { return RowsOf(M); }
LongInt MatrixRows(const TQENSmallIntMatrix& M) { return RowsOf(M); }
LongInt MatrixRows(const TQENByteMatrix& M) { return RowsOf(M); }
LongInt MatrixRows(const TQENSIntMatrix& M) { return RowsOf(M); }
LongInt MatrixCols(const TQENFloatMatrix& M) { return ColsOf(M); }
LongInt MatrixCols(const TQENDoubleMatrix& M) { return ColsOf(M); }
LongInt MatrixCols(const TQENSingleMatrix& M) { return ColsOf(M); }
LongInt MatrixCols(const TQENInt64Matrix& M) { return ColsOf(M); }
LongInt MatrixCols(const TQENLWordMatrix& M) { return ColsOf(M); }
LongInt MatrixCols(const TQENLIntMatrix& M) { return ColsOf(M); }
LongInt MatrixCols(const TQENWordMatrix& M) { return ColsOf(M); }
LongInt MatrixCols(const TQENSmallIntMatrix& M) { return ColsOf(M); }
LongInt MatrixCols(const TQENByteMatrix& M) { return ColsOf(M); }
LongInt MatrixCols(const TQENSIntMatrix& M) { return ColsOf(M); }
bool MatrixIsRectangular(const TQENFloatMatrix& M) { return detail::IsRectangularOf(M); }
bool MatrixIsRectangular(const TQENDoubleMatrix& M) { return detail::IsRectangularOf(M); }
bool MatrixIsRectangular(const TQENSingleMatrix& M) { return detail::IsRectangularOf(M); }
bool MatrixIsRectangular(const TQENInt64Matrix& M) { return detail::IsRectangularOf(M); }
bool MatrixIsRectangular(const TQENLWordMatrix& M) { return detail::IsRectangularOf(M); }
bool MatrixIsRectangular(const TQENLIntMatrix& M) { return detail::IsRectangularOf(M); }
bool MatrixIsRectangular(const TQENWordMatrix& M) { return detail::IsRectangularOf(M); }
bool MatrixIsRectangular(const TQENSmallIntMatrix& M) { return detail::IsRectangularOf(M); }
bool MatrixIsRectangular(const TQENByteMatrix& M) { return detail::IsRectangularOf(M); }
bool MatrixIsRectangular(const TQENSIntMatrix& M) { return detail::IsRectangularOf(M); }
void MatrixDimensions(const TQENFloatMatrix& M, LongWord& Rows, LongWord& Cols, bool& Rectangular) {
  DimensionsOf(M, Rows, Cols, Rectangular);
}
void MatrixDimensions(const TQENDoubleMatrix& M, LongWord& Rows, LongWord& Cols,
                      bool& Rectangular) {
  DimensionsOf(M, Rows, Cols, Rectangular);
}
void MatrixDimensions(const TQENSingleMatrix& M, LongWord& Rows, LongWord& Cols,
                      bool& Rectangular) {
  DimensionsOf(M, Rows, Cols, Rectangular);
}
void MatrixDimensions(const TQENInt64Matrix& M, LongWord& Rows, LongWord& Cols, bool& Rectangular) {
  DimensionsOf(M, Rows, Cols, Rectangular);
}
void MatrixDimensions(const TQENLWordMatrix& M, LongWord& Rows, LongWord& Cols, bool& Rectangular) {
  DimensionsOf(M, Rows, Cols, Rectangular);
}
void MatrixDimensions(const TQENLIntMatrix& M, LongWord& Rows, LongWord& Cols, bool& Rectangular) {
  DimensionsOf(M, Rows, Cols, Rectangular);
}
void MatrixDimensions(const TQENWordMatrix& M, LongWord& Rows, LongWord& Cols, bool& Rectangular) {
  DimensionsOf(M, Rows, Cols, Rectangular);
}
void MatrixDimensions(const TQENSmallIntMatrix& M, LongWord& Rows, LongWord& Cols,
                      bool& Rectangular) {
  DimensionsOf(M, Rows, Cols, Rectangular);
}
void MatrixDimensions(const TQENByteMatrix& M, LongWord& Rows, LongWord& Cols, bool& Rectangular) {
  DimensionsOf(M, Rows, Cols, Rectangular);
}
void MatrixDimensions(const TQENSIntMatrix& M, LongWord& Rows, LongWord& Cols, bool& Rectangular) {
  DimensionsOf(M, Rows, Cols, Rectangular);
}
bool MatrixIsSquare(const TQENFloatMatrix& M) { return detail::IsSquareOf(M); }
bool MatrixIsSquare(const TQENDoubleMatrix& M) { return detail::IsSquareOf(M); }
bool MatrixIsSquare(const TQENSingleMatrix& M) { return detail::IsSquareOf(M); }
bool MatrixIsSquare(const TQENInt64Matrix& M) { return detail::IsSquareOf(M); }
bool MatrixIsSquare(const TQENLWordMatrix& M) { return detail::IsSquareOf(M); }
bool MatrixIsSquare(const TQENLIntMatrix& M) { return detail::IsSquareOf(M); }
bool MatrixIsSquare(const TQENWordMatrix& M) { return detail::IsSquareOf(M); }
bool MatrixIsSquare(const TQENSmallIntMatrix& M) { return detail::IsSquareOf(M); }
bool MatrixIsSquare(const TQENByteMatrix& M) { return detail::IsSquareOf(M); }
bool MatrixIsSquare(const TQENSIntMatrix& M) { return detail::IsSquareOf(M); }
bool MatricesSameDimensions(const TQENFloatMatrix& M1, const TQENFloatMatrix& M2) {
  return detail::SameDimensionsOf(M1, M2);
}
bool MatricesSameDimensions(const TQENDoubleMatrix& M1, const TQENDoubleMatrix& M2) {
  return detail::SameDimensionsOf(M1, M2);
}
bool MatricesSameDimensions(const TQENSingleMatrix& M1, const TQENSingleMatrix& M2) {
  return detail::SameDimensionsOf(M1, M2);
}
bool MatricesSameDimensions(const TQENInt64Matrix& M1, const TQENInt64Matrix& M2) {
  return detail::SameDimensionsOf(M1, M2);
}
bool MatricesSameDimensions(const TQENLWordMatrix& M1, const TQENLWordMatrix& M2) {
  return detail::SameDimensionsOf(M1, M2);
}
bool MatricesSameDimensions(const TQENLIntMatrix& M1, const TQENLIntMatrix& M2) {
  return detail::SameDimensionsOf(M1, M2);
}
bool MatricesSameDimensions(const TQENWordMatrix& M1, const TQENWordMatrix& M2) {
  return detail::SameDimensionsOf(M1, M2);
}
bool MatricesSameDimensions(const TQENSmallIntMatrix& M1, const TQENSmallIntMatrix& M2) {
  return detail::SameDimensionsOf(M1, M2);
}
bool MatricesSameDimensions(const TQENByteMatrix& M1, const TQENByteMatrix& M2) {
  return detail::SameDimensionsOf(M1, M2);
}
bool MatricesSameDimensions(const TQENSIntMatrix& M1, const TQENSIntMatrix& M2) {
  return detail::SameDimensionsOf(M1, M2);
}

// --- Conversion ---
TQENFloatMatrix Matrix2FloatMatrix(const TQENFloatMatrix& M) { return ToFloatMatrix(M); }
TQENFloatMatrix Matrix2FloatMatrix(const TQENDoubleMatrix& M) { return ToFloatMatrix(M); }
TQENFloatMatrix Matrix2FloatMatrix(const TQENSingleMatrix& M) { return ToFloatMatrix(M); }
TQENFloatMatrix Matrix2FloatMatrix(const TQENInt64Matrix& M) { return ToFloatMatrix(M); }
TQENFloatMatrix Matrix2FloatMatrix(const TQENLWordMatrix& M) { return ToFloatMatrix(M); }
TQENFloatMatrix Matrix2FloatMatrix(const TQENLIntMatrix& M) { return ToFloatMatrix(M); }
TQENFloatMatrix Matrix2FloatMatrix(const TQENWordMatrix& M) { return ToFloatMatrix(M); }
TQENFloatMatrix Matrix2FloatMatrix(const TQENSmallIntMatrix& M) { return ToFloatMatrix(M); }
TQENFloatMatrix Matrix2FloatMatrix(const TQENByteMatrix& M) { return ToFloatMatrix(M); }
TQENFloatMatrix Matrix2FloatMatrix(const TQENSIntMatrix& M) { return ToFloatMatrix(M); }

// --- Two-matrix arithmetic ---
TQENFloatMatrix AddMatrices(const TQENFloatMatrix& M1, const TQENFloatMatrix& M2) {
  return AddOf(M1, M2);
}
TQENDoubleMatrix AddMatrices(const TQENDoubleMatrix& M1, const TQENDoubleMatrix& M2) {
  return AddOf(M1, M2);
}
TQENSingleMatrix AddMatrices(const TQENSingleMatrix& M1, const TQENSingleMatrix& M2) {
  return AddOf(M1, M2);
}
TQENInt64Matrix AddMatrices(const TQENInt64Matrix& M1, const TQENInt64Matrix& M2) {
  return AddOf(M1, M2);
}
TQENLIntMatrix AddMatrices(const TQENLIntMatrix& M1, const TQENLIntMatrix& M2) {
  return AddOf(M1, M2);
}
TQENFloatMatrix SubtractMatrices(const TQENFloatMatrix& M1, const TQENFloatMatrix& M2) {
  return SubtractOf(M1, M2);
}
TQENDoubleMatrix SubtractMatrices(const TQENDoubleMatrix& M1, const TQENDoubleMatrix& M2) {
  return SubtractOf(M1, M2);
}
TQENSingleMatrix SubtractMatrices(const TQENSingleMatrix& M1, const TQENSingleMatrix& M2) {
  return SubtractOf(M1, M2);
}
TQENInt64Matrix SubtractMatrices(const TQENInt64Matrix& M1, const TQENInt64Matrix& M2) {
  return SubtractOf(M1, M2);
}
TQENLIntMatrix SubtractMatrices(const TQENLIntMatrix& M1, const TQENLIntMatrix& M2) {
  return SubtractOf(M1, M2);
}
void AddToMatrix(TQENFloatMatrix& M1, const TQENFloatMatrix& M2) { AddToOf(M1, M2); }
void AddToMatrix(TQENDoubleMatrix& M1, const TQENDoubleMatrix& M2) { AddToOf(M1, M2); }
void AddToMatrix(TQENSingleMatrix& M1, const TQENSingleMatrix& M2) { AddToOf(M1, M2); }
void AddToMatrix(TQENInt64Matrix& M1, const TQENInt64Matrix& M2) { AddToOf(M1, M2); }
void AddToMatrix(TQENLIntMatrix& M1, const TQENLIntMatrix& M2) { AddToOf(M1, M2); }
void SubtractFromMatrix(TQENFloatMatrix& M1, const TQENFloatMatrix& M2) { SubtractFromOf(M1, M2); }
void SubtractFromMatrix(TQENDoubleMatrix& M1, const TQENDoubleMatrix& M2) {
  SubtractFromOf(M1, M2);
}
void SubtractFromMatrix(TQENSingleMatrix& M1, const TQENSingleMatrix& M2) {
  SubtractFromOf(M1, M2);
}
void SubtractFromMatrix(TQENInt64Matrix& M1, const TQENInt64Matrix& M2) { SubtractFromOf(M1, M2); }
void SubtractFromMatrix(TQENLIntMatrix& M1, const TQENLIntMatrix& M2) { SubtractFromOf(M1, M2); }

// --- Scalar arithmetic ---
TQENFloatMatrix MultiplyMatrixByConst(const TQENFloatMatrix& M, Extended K) {
  return MultiplyByConstOf(M, K);
}
TQENDoubleMatrix MultiplyMatrixByConst(const TQENDoubleMatrix& M, Extended K) {
  return MultiplyByConstOf(M, K);
}
TQENSingleMatrix MultiplyMatrixByConst(const TQENSingleMatrix& M, Extended K) {
  return MultiplyByConstOf(M, K);
}
TQENInt64Matrix MultiplyMatrixByConst(const TQENInt64Matrix& M, Int64 K) {
  return MultiplyByConstOf(M, K);
}
TQENLIntMatrix MultiplyMatrixByConst(const TQENLIntMatrix& M, LongInt K) {
  return MultiplyByConstOf(M, K);
}
void MultiplyMatrixByConst2(TQENFloatMatrix& M, Extended K) { MultiplyByConstInPlaceOf(M, K); }
void MultiplyMatrixByConst2(TQENDoubleMatrix& M, Extended K) { MultiplyByConstInPlaceOf(M, K); }
void MultiplyMatrixByConst2(TQENSingleMatrix& M, Extended K) { MultiplyByConstInPlaceOf(M, K); }
void MultiplyMatrixByConst2(TQENInt64Matrix& M, Int64 K) { MultiplyByConstInPlaceOf(M, K); }
void MultiplyMatrixByConst2(TQENLIntMatrix& M, LongInt K) { MultiplyByConstInPlaceOf(M, K); }
void LinearTransformMatrix(TQENFloatMatrix& M, Extended A, Extended B) {
  LinearTransformOf(M, A, B);
}
void LinearTransformMatrix(TQENDoubleMatrix& M, Extended A, Extended B) {
  LinearTransformOf(M, A, B);
}
void LinearTransformMatrix(TQENSingleMatrix& M, Extended A, Extended B) {
  LinearTransformOf(M, A, B);
}
void LinearTransformMatrix(TQENInt64Matrix& M, Int64 A, Int64 B) { LinearTransformOf(M, A, B); }
void LinearTransformMatrix(TQENLIntMatrix& M, LongInt A, LongInt B) { LinearTransformOf(M, A, B); }

// --- Element-wise functions ---
void SquareMatrix(TQENFloatMatrix& M) { SquareOf(M); }
void SquareMatrix(TQENDoubleMatrix& M) { SquareOf(M); }
void SquareMatrix(TQENSingleMatrix& M) { SquareOf(M); }
void SqrtMatrix(TQENFloatMatrix& M) { SqrtOf(M); }
void SqrtMatrix(TQENDoubleMatrix& M) { SqrtOf(M); }
void SqrtMatrix(TQENSingleMatrix& M) { SqrtOf(M); }
void InvMatrix(TQENFloatMatrix& M) { InvOf(M); }
void InvMatrix(TQENDoubleMatrix& M) { InvOf(M); }
void InvMatrix(TQENSingleMatrix& M) { InvOf(M); }
void LnMatrix(TQENFloatMatrix& M) { LnOf(M); }
void LnMatrix(TQENDoubleMatrix& M) { LnOf(M); }
void LnMatrix(TQENSingleMatrix& M) { LnOf(M); }
void Log10Matrix(TQENFloatMatrix& M) { Log10Of(M); }
void Log10Matrix(TQENDoubleMatrix& M) { Log10Of(M); }
void Log10Matrix(TQENSingleMatrix& M) { Log10Of(M); }

// --- Aggregate ---
Extended GrandMean(const TQENFloatMatrix& M, LongWord& N) { return GrandMeanOf(M, N); }
Extended GrandMean(const TQENDoubleMatrix& M, LongWord& N) { return GrandMeanOf(M, N); }
Extended GrandMean(const TQENSingleMatrix& M, LongWord& N) { return GrandMeanOf(M, N); }
Extended GrandMean(const TQENInt64Matrix& M, LongWord& N) { return GrandMeanOf(M, N); }
Extended GrandMean(const TQENLIntMatrix& M, LongWord& N) { return GrandMeanOf(M, N); }

}  // namespace tovrin
