#include "tovrin/currency/TOVRINFinMatrix.h"

#include <utility>

#include "tovrin/currency/detail/MoneyRules.h"
#include "tovrin/detail/MatrixArithmetic.h"
#include "tovrin/detail/MatrixRowCol.h"
#include "tovrin/detail/MatrixShape.h"

namespace tovrin {
namespace {

using detail::MatrixOf;
using detail::MoneyRules;

template <typename T>
void DimensionsOf(const MatrixOf<T>& M, LongWord& Rows, LongWord& Cols, bool& Rectangular) {
  const detail::MatrixShape s = detail::ShapeOf(M);
  Rows = s.Rows;
  Cols = s.Cols;
  Rectangular = s.Rectangular;
}

template <typename T>
MatrixOf<T> ScaledOf(const MatrixOf<T>& M, Extended K) {
  return detail::MapMatrix(M, [K](T x) { return MoneyRules<T>::Mul(K, x); });
}

template <typename T>
void ScaleInPlace(MatrixOf<T>& M, Extended K) {
  detail::MapMatrixInPlace(M, [K](T x) { return MoneyRules<T>::Mul(K, x); });
}

template <typename T>
void LinearTransformOf(MatrixOf<T>& M, Extended A, Extended B) {
  detail::MapMatrixInPlace(M, [A, B](T x) { return MoneyRules<T>::Linear(x, A, B); });
}

template <typename T>
T GrandMeanOf(const MatrixOf<T>& M, LongWord& N) {
  using R = MoneyRules<T>;
  const typename R::Sum sum = detail::GrandSumOf(M, N, typename R::Sum{0}, &R::AddToSum);
  return R::MeanOf(sum, N);
}

PackedExtended FloatOf(TQENCurrency x) { return Currency2Float(x); }
PackedExtended FloatOf(TQENLongCurrency x) { return Currency2Float(x); }
PackedExtended FloatOf(Currency x) { return Currency2Float(x); }

}  // namespace

TQENCurrMatrix CreateCurrMatrix(LongWord Rows, LongWord Cols) {
  return detail::CreateMatrixOf<TQENCurrency>(Rows, Cols);
}
TQENLongCurrMatrix CreateLongCurrMatrix(LongWord Rows, LongWord Cols) {
  return detail::CreateMatrixOf<TQENLongCurrency>(Rows, Cols);
}
TQENCurrencyMatrix CreateCurrencyMatrix(LongWord Rows, LongWord Cols) {
  return detail::CreateMatrixOf<Currency>(Rows, Cols);
}

TQENCurrMatrix CreateCurrIdentityMatrix(LongWord N) {
  return detail::CreateIdentityOf(N, TQENCurrency{detail::kMoneyScale<TQENCurrency>});
}
TQENLongCurrMatrix CreateLongCurrIdentityMatrix(LongWord N) {
  return detail::CreateIdentityOf(N, TQENLongCurrency{detail::kMoneyScale<TQENLongCurrency>});
}
TQENCurrencyMatrix CreateCurrencyIdentityMatrix(LongWord N) {
  return detail::CreateIdentityOf(N, Currency{detail::kMoneyScale<Currency>});
}

bool MatrixIsRectangular(const TQENCurrMatrix& M) { return detail::IsRectangularOf(M); }
bool MatrixIsRectangular(const TQENLongCurrMatrix& M) { return detail::IsRectangularOf(M); }
bool MatrixIsRectangular(const TQENCurrencyMatrix& M) { return detail::IsRectangularOf(M); }

void MatrixDimensions(const TQENCurrMatrix& M, LongWord& Rows, LongWord& Cols, bool& Rectangular) {
  DimensionsOf(M, Rows, Cols, Rectangular);
}
void MatrixDimensions(const TQENLongCurrMatrix& M, LongWord& Rows, LongWord& Cols,
                      bool& Rectangular) {
  DimensionsOf(M, Rows, Cols, Rectangular);
}
void MatrixDimensions(const TQENCurrencyMatrix& M, LongWord& Rows, LongWord& Cols,
                      bool& Rectangular) {
  DimensionsOf(M, Rows, Cols, Rectangular);
}

bool MatrixIsSquare(const TQENCurrMatrix& M) { return detail::IsSquareOf(M); }
bool MatrixIsSquare(const TQENLongCurrMatrix& M) { return detail::IsSquareOf(M); }
bool MatrixIsSquare(const TQENCurrencyMatrix& M) { return detail::IsSquareOf(M); }

bool MatricesSameDimensions(const TQENCurrMatrix& M1, const TQENCurrMatrix& M2) {
  return detail::SameDimensionsOf(M1, M2);
}
bool MatricesSameDimensions(const TQENLongCurrMatrix& M1, const TQENLongCurrMatrix& M2) {
  return detail::SameDimensionsOf(M1, M2);
}
bool MatricesSameDimensions(const TQENCurrencyMatrix& M1, const TQENCurrencyMatrix& M2) {
  return detail::SameDimensionsOf(M1, M2);
}

TQENFloatMatrix Matrix2FloatMatrix(const TQENCurrMatrix& M) {
  return detail::ConvertMatrixOf<PackedExtended>(M, [](auto x) { return FloatOf(x); });
}
TQENFloatMatrix Matrix2FloatMatrix(const TQENLongCurrMatrix& M) {
  return detail::ConvertMatrixOf<PackedExtended>(M, [](auto x) { return FloatOf(x); });
}
TQENFloatMatrix Matrix2FloatMatrix(const TQENCurrencyMatrix& M) {
  return detail::ConvertMatrixOf<PackedExtended>(M, [](auto x) { return FloatOf(x); });
}

TQENCurrMatrix AddMatrices(const TQENCurrMatrix& M1, const TQENCurrMatrix& M2) {
  return detail::CombineMatrices(M1, M2, &MoneyRules<TQENCurrency>::Add);
}
TQENLongCurrMatrix AddMatrices(const TQENLongCurrMatrix& M1, const TQENLongCurrMatrix& M2) {
  return detail::CombineMatrices(M1, M2, &MoneyRules<TQENLongCurrency>::Add);
}
TQENCurrencyMatrix AddMatrices(const TQENCurrencyMatrix& M1, const TQENCurrencyMatrix& M2) {
  return detail::CombineMatrices(M1, M2, &MoneyRules<Currency>::Add);
}

void AddToMatrix(TQENCurrMatrix& M1, const TQENCurrMatrix& M2) {
  detail::CombineIntoMatrix(M1, M2, &MoneyRules<TQENCurrency>::Add);
}
void AddToMatrix(TQENLongCurrMatrix& M1, const TQENLongCurrMatrix& M2) {
  detail::CombineIntoMatrix(M1, M2, &MoneyRules<TQENLongCurrency>::Add);
}
void AddToMatrix(TQENCurrencyMatrix& M1, const TQENCurrencyMatrix& M2) {
  detail::CombineIntoMatrix(M1, M2, &MoneyRules<Currency>::Add);
}

TQENCurrMatrix SubtractMatrices(const TQENCurrMatrix& M1, const TQENCurrMatrix& M2) {
  return detail::CombineMatrices(M1, M2, &MoneyRules<TQENCurrency>::Sub);
}
TQENLongCurrMatrix SubtractMatrices(const TQENLongCurrMatrix& M1, const TQENLongCurrMatrix& M2) {
  return detail::CombineMatrices(M1, M2, &MoneyRules<TQENLongCurrency>::Sub);
}
TQENCurrencyMatrix SubtractMatrices(const TQENCurrencyMatrix& M1, const TQENCurrencyMatrix& M2) {
  return detail::CombineMatrices(M1, M2, &MoneyRules<Currency>::Sub);
}

void SubtractFromMatrix(TQENCurrMatrix& M1, const TQENCurrMatrix& M2) {
  detail::CombineIntoMatrix(M1, M2, &MoneyRules<TQENCurrency>::Sub);
}
void SubtractFromMatrix(TQENLongCurrMatrix& M1, const TQENLongCurrMatrix& M2) {
  detail::CombineIntoMatrix(M1, M2, &MoneyRules<TQENLongCurrency>::Sub);
}
void SubtractFromMatrix(TQENCurrencyMatrix& M1, const TQENCurrencyMatrix& M2) {
  detail::CombineIntoMatrix(M1, M2, &MoneyRules<Currency>::Sub);
}

TQENCurrMatrix MultiplyMatrixByConst(const TQENCurrMatrix& M, Extended K) { return ScaledOf(M, K); }
TQENLongCurrMatrix MultiplyMatrixByConst(const TQENLongCurrMatrix& M, Extended K) {
  return ScaledOf(M, K);
}
TQENCurrencyMatrix MultiplyMatrixByConst(const TQENCurrencyMatrix& M, Extended K) {
  return ScaledOf(M, K);
}

void MultiplyMatrixByConst2(TQENCurrMatrix& M, Extended K) { ScaleInPlace(M, K); }
void MultiplyMatrixByConst2(TQENLongCurrMatrix& M, Extended K) { ScaleInPlace(M, K); }
void MultiplyMatrixByConst2(TQENCurrencyMatrix& M, Extended K) { ScaleInPlace(M, K); }

void LinearTransformMatrix(TQENCurrMatrix& M, Extended A, Extended B) {
  LinearTransformOf(M, A, B);
}
void LinearTransformMatrix(TQENLongCurrMatrix& M, Extended A, Extended B) {
  LinearTransformOf(M, A, B);
}
void LinearTransformMatrix(TQENCurrencyMatrix& M, Extended A, Extended B) {
  LinearTransformOf(M, A, B);
}

TQENCurrency GrandMean(const TQENCurrMatrix& M, LongWord& N) { return GrandMeanOf(M, N); }
TQENLongCurrency GrandMean(const TQENLongCurrMatrix& M, LongWord& N) { return GrandMeanOf(M, N); }
Currency GrandMean(const TQENCurrencyMatrix& M, LongWord& N) { return GrandMeanOf(M, N); }

void SwapMatrixRows(TQENCurrMatrix& M, LongWord Row1, LongWord Row2) {
  detail::SwapRowsOf(M, Row1, Row2);
}
void SwapMatrixRows(TQENLongCurrMatrix& M, LongWord Row1, LongWord Row2) {
  detail::SwapRowsOf(M, Row1, Row2);
}
void SwapMatrixRows(TQENCurrencyMatrix& M, LongWord Row1, LongWord Row2) {
  detail::SwapRowsOf(M, Row1, Row2);
}

void SwapMatrixCols(TQENCurrMatrix& M, LongWord Col1, LongWord Col2) {
  detail::SwapColsOf(M, Col1, Col2);
}
void SwapMatrixCols(TQENLongCurrMatrix& M, LongWord Col1, LongWord Col2) {
  detail::SwapColsOf(M, Col1, Col2);
}
void SwapMatrixCols(TQENCurrencyMatrix& M, LongWord Col1, LongWord Col2) {
  detail::SwapColsOf(M, Col1, Col2);
}

void QSortMatrixRowsOnCol(TQENCurrMatrix& M, LongWord Col, bool Ascending) {
  detail::QSortRowsOnColOf(M, Col, Ascending);
}
void QSortMatrixRowsOnCol(TQENLongCurrMatrix& M, LongWord Col, bool Ascending) {
  detail::QSortRowsOnColOf(M, Col, Ascending);
}
void QSortMatrixRowsOnCol(TQENCurrencyMatrix& M, LongWord Col, bool Ascending) {
  detail::QSortRowsOnColOf(M, Col, Ascending);
}

void QSortMatrixColsOnRow(TQENCurrMatrix& M, LongWord Row, bool Ascending) {
  detail::QSortColsOnRowOf(M, Row, Ascending);
}
void QSortMatrixColsOnRow(TQENLongCurrMatrix& M, LongWord Row, bool Ascending) {
  detail::QSortColsOnRowOf(M, Row, Ascending);
}
void QSortMatrixColsOnRow(TQENCurrencyMatrix& M, LongWord Row, bool Ascending) {
  detail::QSortColsOnRowOf(M, Row, Ascending);
}

TQENCurrVector ExtractMatrixRow(const TQENCurrMatrix& M, LongWord Row) {
  return detail::ExtractRowOf(M, Row);
}
TQENLongCurrVector ExtractMatrixRow(const TQENLongCurrMatrix& M, LongWord Row) {
  return detail::ExtractRowOf(M, Row);
}
TQENCurrencyVector ExtractMatrixRow(const TQENCurrencyMatrix& M, LongWord Row) {
  return detail::ExtractRowOf(M, Row);
}

TQENCurrVector ExtractMatrixCol(const TQENCurrMatrix& M, LongWord Col) {
  return detail::ExtractColOf(M, Col);
}
TQENLongCurrVector ExtractMatrixCol(const TQENLongCurrMatrix& M, LongWord Col) {
  return detail::ExtractColOf(M, Col);
}
TQENCurrencyVector ExtractMatrixCol(const TQENCurrencyMatrix& M, LongWord Col) {
  return detail::ExtractColOf(M, Col);
}

void OverwriteMatrixRow(TQENCurrMatrix& M, LongWord Row, const TQENCurrVector& V,
                        TQENCurrency Fill) {
  detail::OverwriteRowOf(M, Row, V, Fill);
}
void OverwriteMatrixRow(TQENLongCurrMatrix& M, LongWord Row, const TQENLongCurrVector& V,
                        TQENLongCurrency Fill) {
  detail::OverwriteRowOf(M, Row, V, Fill);
}
void OverwriteMatrixRow(TQENCurrencyMatrix& M, LongWord Row, const TQENCurrencyVector& V,
                        Currency Fill) {
  detail::OverwriteRowOf(M, Row, V, Fill);
}

void OverwriteMatrixCol(TQENCurrMatrix& M, LongWord Col, const TQENCurrVector& V,
                        TQENCurrency Fill) {
  detail::OverwriteColOf(M, Col, V, Fill);
}
void OverwriteMatrixCol(TQENLongCurrMatrix& M, LongWord Col, const TQENLongCurrVector& V,
                        TQENLongCurrency Fill) {
  detail::OverwriteColOf(M, Col, V, Fill);
}
void OverwriteMatrixCol(TQENCurrencyMatrix& M, LongWord Col, const TQENCurrencyVector& V,
                        Currency Fill) {
  detail::OverwriteColOf(M, Col, V, Fill);
}

TQENCurrMatrix CopyMatrix(const TQENCurrMatrix& M) { return detail::CopyMatrixOf(M); }
TQENLongCurrMatrix CopyMatrix(const TQENLongCurrMatrix& M) { return detail::CopyMatrixOf(M); }
TQENCurrencyMatrix CopyMatrix(const TQENCurrencyMatrix& M) { return detail::CopyMatrixOf(M); }

TQENCurrMatrix TransposeMatrix(const TQENCurrMatrix& M) { return detail::TransposeOf(M); }
TQENLongCurrMatrix TransposeMatrix(const TQENLongCurrMatrix& M) { return detail::TransposeOf(M); }
TQENCurrencyMatrix TransposeMatrix(const TQENCurrencyMatrix& M) { return detail::TransposeOf(M); }

}  // namespace tovrin
