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

template <detail::MoneyElement T>
bool MatrixIsRectangular(const detail::MatrixOf<T>& M) {
  return detail::IsRectangularOf(M);
}

template <detail::MoneyElement T>
void MatrixDimensions(const detail::MatrixOf<T>& M, LongWord& Rows, LongWord& Cols,
                      bool& Rectangular) {
  DimensionsOf(M, Rows, Cols, Rectangular);
}

template <detail::MoneyElement T>
bool MatrixIsSquare(const detail::MatrixOf<T>& M) {
  return detail::IsSquareOf(M);
}

template <detail::MoneyElement T>
bool MatricesSameDimensions(const detail::MatrixOf<T>& M1, const detail::MatrixOf<T>& M2) {
  return detail::SameDimensionsOf(M1, M2);
}

template <detail::MoneyElement T>
TQENFloatMatrix Matrix2FloatMatrix(const detail::MatrixOf<T>& M) {
  return detail::ConvertMatrixOf<PackedExtended>(M, [](auto x) { return FloatOf(x); });
}

template <detail::MoneyElement T>
detail::MatrixOf<T> AddMatrices(const detail::MatrixOf<T>& M1, const detail::MatrixOf<T>& M2) {
  return detail::CombineMatrices(M1, M2, &MoneyRules<T>::Add);
}

template <detail::MoneyElement T>
void AddToMatrix(detail::MatrixOf<T>& M1, const detail::MatrixOf<T>& M2) {
  detail::CombineIntoMatrix(M1, M2, &MoneyRules<T>::Add);
}

template <detail::MoneyElement T>
detail::MatrixOf<T> SubtractMatrices(const detail::MatrixOf<T>& M1, const detail::MatrixOf<T>& M2) {
  return detail::CombineMatrices(M1, M2, &MoneyRules<T>::Sub);
}

template <detail::MoneyElement T>
void SubtractFromMatrix(detail::MatrixOf<T>& M1, const detail::MatrixOf<T>& M2) {
  detail::CombineIntoMatrix(M1, M2, &MoneyRules<T>::Sub);
}

template <detail::MoneyElement T>
detail::MatrixOf<T> MultiplyMatrixByConst(const detail::MatrixOf<T>& M, Extended K) {
  return ScaledOf(M, K);
}

template <detail::MoneyElement T>
void MultiplyMatrixByConst2(detail::MatrixOf<T>& M, Extended K) {
  ScaleInPlace(M, K);
}

template <detail::MoneyElement T>
void LinearTransformMatrix(detail::MatrixOf<T>& M, Extended A, Extended B) {
  LinearTransformOf(M, A, B);
}

template <detail::MoneyElement T>
T GrandMean(const detail::MatrixOf<T>& M, LongWord& N) {
  return GrandMeanOf(M, N);
}

template <detail::MoneyElement T>
void SwapMatrixRows(detail::MatrixOf<T>& M, LongWord Row1, LongWord Row2) {
  detail::SwapRowsOf(M, Row1, Row2);
}

template <detail::MoneyElement T>
void SwapMatrixCols(detail::MatrixOf<T>& M, LongWord Col1, LongWord Col2) {
  detail::SwapColsOf(M, Col1, Col2);
}

template <detail::MoneyElement T>
void QSortMatrixRowsOnCol(detail::MatrixOf<T>& M, LongWord Col, bool Ascending) {
  detail::QSortRowsOnColOf(M, Col, Ascending);
}

template <detail::MoneyElement T>
void QSortMatrixColsOnRow(detail::MatrixOf<T>& M, LongWord Row, bool Ascending) {
  detail::QSortColsOnRowOf(M, Row, Ascending);
}

template <detail::MoneyElement T>
std::vector<T> ExtractMatrixRow(const detail::MatrixOf<T>& M, LongWord Row) {
  return detail::ExtractRowOf(M, Row);
}

template <detail::MoneyElement T>
std::vector<T> ExtractMatrixCol(const detail::MatrixOf<T>& M, LongWord Col) {
  return detail::ExtractColOf(M, Col);
}

template <detail::MoneyElement T>
void OverwriteMatrixRow(detail::MatrixOf<T>& M, LongWord Row, const std::vector<T>& V, T Fill) {
  detail::OverwriteRowOf(M, Row, V, Fill);
}

template <detail::MoneyElement T>
void OverwriteMatrixCol(detail::MatrixOf<T>& M, LongWord Col, const std::vector<T>& V, T Fill) {
  detail::OverwriteColOf(M, Col, V, Fill);
}

template <detail::MoneyElement T>
detail::MatrixOf<T> CopyMatrix(const detail::MatrixOf<T>& M) {
  return detail::CopyMatrixOf(M);
}

template <detail::MoneyElement T>
detail::MatrixOf<T> TransposeMatrix(const detail::MatrixOf<T>& M) {
  return detail::TransposeOf(M);
}

using detail::MatrixOf;

#define TOVRIN_INSTANTIATE(T)                                                         \
  template bool MatrixIsRectangular(const MatrixOf<T>&);                              \
  template void MatrixDimensions(const MatrixOf<T>&, LongWord&, LongWord&, bool&);    \
  template bool MatrixIsSquare(const MatrixOf<T>&);                                   \
  template bool MatricesSameDimensions(const MatrixOf<T>&, const MatrixOf<T>&);       \
  template TQENFloatMatrix Matrix2FloatMatrix(const MatrixOf<T>&);                    \
  template MatrixOf<T> AddMatrices(const MatrixOf<T>&, const MatrixOf<T>&);           \
  template void AddToMatrix(MatrixOf<T>&, const MatrixOf<T>&);                        \
  template MatrixOf<T> SubtractMatrices(const MatrixOf<T>&, const MatrixOf<T>&);      \
  template void SubtractFromMatrix(MatrixOf<T>&, const MatrixOf<T>&);                 \
  template MatrixOf<T> MultiplyMatrixByConst(const MatrixOf<T>&, Extended);           \
  template void MultiplyMatrixByConst2(MatrixOf<T>&, Extended);                       \
  template void LinearTransformMatrix(MatrixOf<T>&, Extended, Extended);              \
  template T GrandMean(const MatrixOf<T>&, LongWord&);                                \
  template void SwapMatrixRows(MatrixOf<T>&, LongWord, LongWord);                     \
  template void SwapMatrixCols(MatrixOf<T>&, LongWord, LongWord);                     \
  template void QSortMatrixRowsOnCol(MatrixOf<T>&, LongWord, bool);                   \
  template void QSortMatrixColsOnRow(MatrixOf<T>&, LongWord, bool);                   \
  template std::vector<T> ExtractMatrixRow(const MatrixOf<T>&, LongWord);             \
  template std::vector<T> ExtractMatrixCol(const MatrixOf<T>&, LongWord);             \
  template void OverwriteMatrixRow(MatrixOf<T>&, LongWord, const std::vector<T>&, T); \
  template void OverwriteMatrixCol(MatrixOf<T>&, LongWord, const std::vector<T>&, T); \
  template MatrixOf<T> CopyMatrix(const MatrixOf<T>&);                                \
  template MatrixOf<T> TransposeMatrix(const MatrixOf<T>&);
TOVRIN_MONEY_ELEMENTS(TOVRIN_INSTANTIATE)
#undef TOVRIN_INSTANTIATE

}  // namespace tovrin
