// What is money-specific in the money matrices: creation with the stored unit on the diagonal,
// the conversion to amounts and the arithmetic under MoneyRules. The shape queries and the row
// and column moves are the matrix unit's templates.
#include "tovrin/currency/TOVRINFinMatrix.h"

#include "tovrin/currency/detail/MoneyRules.h"
#include "tovrin/detail/MatrixArithmetic.h"
#include "tovrin/detail/MatrixShape.h"

namespace tovrin {

using detail::MatrixOf;
using detail::MoneyRules;

// The identity holds the amount 1 as its stored integer.
TOVRIN_DEFINE_MATRIX_CREATION(TQENCurrency, Curr, detail::kMoneyScale<TQENCurrency>)
TOVRIN_DEFINE_MATRIX_CREATION(TQENLongCurrency, LongCurr, detail::kMoneyScale<TQENLongCurrency>)
TOVRIN_DEFINE_MATRIX_CREATION(Currency, Currency, detail::kMoneyScale<Currency>)

template <detail::MoneyElement T>
TQENFloatMatrix Matrix2FloatMatrix(const MatrixOf<T>& M) {
  return detail::ConvertMatrixOf<PackedExtended>(M, [](T x) { return Currency2Float(x); });
}

TOVRIN_DEFINE_MATRIX_COMBINATIONS(detail::MoneyElement, MoneyRules)

template <detail::MoneyElement T>
MatrixOf<T> MultiplyMatrixByConst(const MatrixOf<T>& M, Extended K) {
  return detail::MapMatrix(M, [K](T x) { return MoneyRules<T>::Mul(K, x); });
}

template <detail::MoneyElement T>
void MultiplyMatrixByConst2(MatrixOf<T>& M, Extended K) {
  detail::MapMatrixInPlace(M, [K](T x) { return MoneyRules<T>::Mul(K, x); });
}

template <detail::MoneyElement T>
void LinearTransformMatrix(MatrixOf<T>& M, Extended A, Extended B) {
  detail::MapMatrixInPlace(M, [A, B](T x) { return MoneyRules<T>::Linear(x, A, B); });
}

template <detail::MoneyElement T>
T GrandMean(const MatrixOf<T>& M, LongWord& N) {
  using R = MoneyRules<T>;
  const typename R::Sum sum = detail::GrandSumOf(M, N, typename R::Sum{0}, &R::AddToSum);
  return R::MeanOf(sum, N);
}

#define TOVRIN_INSTANTIATE(T)                                               \
  TOVRIN_INSTANTIATE_MATRIX_COMBINATIONS(T)                                 \
  template TQENFloatMatrix Matrix2FloatMatrix(const MatrixOf<T>&);          \
  template MatrixOf<T> MultiplyMatrixByConst(const MatrixOf<T>&, Extended); \
  template void MultiplyMatrixByConst2(MatrixOf<T>&, Extended);             \
  template void LinearTransformMatrix(MatrixOf<T>&, Extended, Extended);    \
  template T GrandMean(const MatrixOf<T>&, LongWord&);
TOVRIN_MONEY_ELEMENTS(TOVRIN_INSTANTIATE)
#undef TOVRIN_INSTANTIATE

}  // namespace tovrin
