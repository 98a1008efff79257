#include "tovrin/currency/TOVRINFinVector.h"

#include <cmath>
#include <utility>

#include "tovrin/currency/detail/MoneyRules.h"
#include "tovrin/detail/Ranking.h"
#include "tovrin/detail/VectorAlgorithms.h"

namespace tovrin {
namespace {

using detail::MoneyRules;

template <typename T>
T SumOf(const std::vector<T>& V) {
  return detail::SumOfTerms(
      V, [](T x) { return x; }, &MoneyRules<T>::Add);
}

template <typename T>
void LinearTransformOf(std::vector<T>& V, Extended A, Extended B) {
  detail::RequireElements(V);
  detail::ApplyInPlace(V, [A, B](T x) { return MoneyRules<T>::Linear(x, A, B); });
}

template <typename To, typename From, typename ConvertFn>
std::vector<To> ConvertedOf(const std::vector<From>& V, ConvertFn Convert) {
  std::vector<To> result(V.size());
  for (std::size_t i = 0; i < V.size(); ++i) result[i] = Convert(V[i]);
  return result;
}

template <typename T>
T Same(T x) {
  return x;
}

TQENCurrency CurrFromFloat(PackedExtended x) { return Float2QENCurrency(x); }
TQENLongCurrency LongCurrFromFloat(PackedExtended x) { return Float2QENLongCurrency(x); }
Currency CurrencyFromFloat(PackedExtended x) { return detail::Float2Money<Currency>(x); }

}  // namespace

template <detail::MoneyElement T>
T SumVector(const std::vector<T>& V) {
  return SumOf(V);
}

TOVRIN_DEFINE_SIGN_PREDICATES(detail::MoneyElement, MoneyRules)

template <detail::MoneyElement T>
void LinearTransformVector(std::vector<T>& V, Extended A, Extended B) {
  LinearTransformOf(V, A, B);
}

template <detail::MoneyElement T>
TQENFloatVector Vector2FloatVector(const std::vector<T>& V) {
  return ConvertedOf<PackedExtended>(V, [](T x) { return PackedExtended(Currency2Float(x)); });
}

TOVRIN_DEFINE_VECTOR_COMBINATIONS(detail::MoneyElement, MoneyRules)

template <detail::MoneyElement T>
TQENLIntVector Vector2RankVector(const std::vector<T>& V, bool Ascending) {
  return detail::RankVector(V, Ascending, detail::MoneyRankEquals{});
}

template <detail::MoneyElement T>
LongInt Vector2Rank(const std::vector<T>& V, LongWord Index, bool Ascending) {
  return detail::RankOfElement(V, Index, Ascending, detail::MoneyRankEquals{});
}

template <detail::MoneyElement T>
LongInt Vector2RankValue(const std::vector<T>& V, T Value, bool Ascending) {
  return detail::RankOfValue(V, Value, Ascending, detail::MoneyRankEquals{});
}

// One row per target type; the columns are the conversions from TQENCurrency,
// TQENLongCurrency, Currency and Extended elements.
#define TOVRIN_DEFINE_CONVERSIONS(To, Name, FromCurr, FromLongCurr, FromCurrency, FromFloat) \
  TQEN##Name##Vector Vector2QEN##Name##Vector(const TQENCurrVector& V) {                     \
    return ConvertedOf<To>(V, FromCurr);                                                     \
  }                                                                                          \
  TQEN##Name##Vector Vector2QEN##Name##Vector(const TQENLongCurrVector& V) {                 \
    return ConvertedOf<To>(V, FromLongCurr);                                                 \
  }                                                                                          \
  TQEN##Name##Vector Vector2QEN##Name##Vector(const TQENCurrencyVector& V) {                 \
    return ConvertedOf<To>(V, FromCurrency);                                                 \
  }                                                                                          \
  TQEN##Name##Vector Vector2QEN##Name##Vector(const TQENFloatVector& V) {                    \
    return ConvertedOf<To>(V, FromFloat);                                                    \
  }
TOVRIN_DEFINE_CONVERSIONS(TQENCurrency, Curr, Same<TQENCurrency>, QENLongCurrency2QENCurrency,
                          Currency2QENCurrency, CurrFromFloat)
TOVRIN_DEFINE_CONVERSIONS(TQENLongCurrency, LongCurr, QENCurrency2QENLongCurrency,
                          Same<TQENLongCurrency>, Currency2QENLongCurrency, LongCurrFromFloat)
TOVRIN_DEFINE_CONVERSIONS(Currency, Currency, QENCurrency2Currency, QENLongCurrency2Currency,
                          Same<Currency>, CurrencyFromFloat)
#undef TOVRIN_DEFINE_CONVERSIONS

#define TOVRIN_INSTANTIATE(T)                                               \
  TOVRIN_INSTANTIATE_SIGN_PREDICATES(T)                                     \
  TOVRIN_INSTANTIATE_VECTOR_COMBINATIONS(T)                                 \
  template T SumVector(const std::vector<T>&);                              \
  template void LinearTransformVector(std::vector<T>&, Extended, Extended); \
  template TQENFloatVector Vector2FloatVector(const std::vector<T>&);       \
  template TQENLIntVector Vector2RankVector(const std::vector<T>&, bool);   \
  template LongInt Vector2Rank(const std::vector<T>&, LongWord, bool);      \
  template LongInt Vector2RankValue(const std::vector<T>&, T, bool);
TOVRIN_MONEY_ELEMENTS(TOVRIN_INSTANTIATE)
#undef TOVRIN_INSTANTIATE

}  // namespace tovrin
