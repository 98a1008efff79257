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

#define TOVRIN_DEFINE_SIGN_PREDICATE(Name, Test)              \
  template <detail::MoneyElement T>                           \
  bool Name(const std::vector<T>& V) {                        \
    using R = MoneyRules<T>;                                  \
    return detail::EveryElement(V, [](T x) { return Test; }); \
  }
TOVRIN_SIGN_PREDICATES(TOVRIN_DEFINE_SIGN_PREDICATE)
#undef TOVRIN_DEFINE_SIGN_PREDICATE

template <detail::MoneyElement T>
void LinearTransformVector(std::vector<T>& V, Extended A, Extended B) {
  LinearTransformOf(V, A, B);
}

template <detail::MoneyElement T>
TQENFloatVector Vector2FloatVector(const std::vector<T>& V) {
  return ConvertedOf<PackedExtended>(V, [](T x) { return PackedExtended(Currency2Float(x)); });
}

template <detail::MoneyElement T>
std::vector<T> AddVectors(const std::vector<T>& V1, const std::vector<T>& V2) {
  return detail::Combined(V1, V2, &MoneyRules<T>::Add);
}

template <detail::MoneyElement T>
void AddToVector(std::vector<T>& V1, const std::vector<T>& V2) {
  detail::CombineInto(V1, V2, &MoneyRules<T>::Add);
}

template <detail::MoneyElement T>
std::vector<T> SubtractVectors(const std::vector<T>& V1, const std::vector<T>& V2) {
  return detail::Combined(V1, V2, &MoneyRules<T>::Sub);
}

template <detail::MoneyElement T>
void SubtractFromVector(std::vector<T>& V1, const std::vector<T>& V2) {
  detail::CombineInto(V1, V2, &MoneyRules<T>::Sub);
}

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

#define TOVRIN_INSTANTIATE(T)                                                            \
  template T SumVector(const std::vector<T>&);                                           \
  template bool VectorNonNegative(const std::vector<T>&);                                \
  template bool VectorNegative(const std::vector<T>&);                                   \
  template bool VectorNonPositive(const std::vector<T>&);                                \
  template bool VectorNonZero(const std::vector<T>&);                                    \
  template bool VectorZero(const std::vector<T>&);                                       \
  template bool VectorPositive(const std::vector<T>&);                                   \
  template void LinearTransformVector(std::vector<T>&, Extended, Extended);              \
  template TQENFloatVector Vector2FloatVector(const std::vector<T>&);                    \
  template std::vector<T> AddVectors(const std::vector<T>&, const std::vector<T>&);      \
  template void AddToVector(std::vector<T>&, const std::vector<T>&);                     \
  template std::vector<T> SubtractVectors(const std::vector<T>&, const std::vector<T>&); \
  template void SubtractFromVector(std::vector<T>&, const std::vector<T>&);              \
  template TQENLIntVector Vector2RankVector(const std::vector<T>&, bool);                \
  template LongInt Vector2Rank(const std::vector<T>&, LongWord, bool);                   \
  template LongInt Vector2RankValue(const std::vector<T>&, T, bool);
TOVRIN_MONEY_ELEMENTS(TOVRIN_INSTANTIATE)
#undef TOVRIN_INSTANTIATE

}  // namespace tovrin
