#include "tovrin/currency/TOVRINFinVector.h"

#include <cmath>
#include <utility>

#include "tovrin/currency/detail/MoneyRules.h"
#include "tovrin/detail/QuickSort.h"
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
PackedExtended FloatOf(TQENCurrency x) { return Currency2Float(x); }
PackedExtended FloatOf(TQENLongCurrency x) { return Currency2Float(x); }
PackedExtended FloatOf(Currency x) { return Currency2Float(x); }

}  // namespace

template <detail::MoneyElement T>
void AppendValue2Vector(std::vector<T>& V, T Value) {
  detail::AppendElement(V, Value);
}

template <detail::MoneyElement T>
void AddValue2Vector(std::vector<T>& V, T Value, LongInt Index) {
  detail::InsertElement(V, Value, Index);
}

template <detail::MoneyElement T>
void DeleteValueFromVector(std::vector<T>& V, LongInt Index) {
  detail::DeleteElement(V, Index);
}

template <detail::MoneyElement T>
T MaxVector(const std::vector<T>& V) {
  return detail::LargestElement(V);
}

template <detail::MoneyElement T>
T MinVector(const std::vector<T>& V) {
  return detail::SmallestElement(V);
}

template <detail::MoneyElement T>
void MinMaxVector(const std::vector<T>& V, T& MinValue, T& MaxValue, LongWord& MinIndex,
                  LongWord& MaxIndex, bool& MinUnique, bool& MaxUnique) {
  detail::Extremes(V, MinValue, MaxValue, MinIndex, MaxIndex, MinUnique, MaxUnique);
}

template <detail::MoneyElement T>
T SumVector(const std::vector<T>& V) {
  return SumOf(V);
}

template <detail::MoneyElement T>
bool VectorNonNegative(const std::vector<T>& V) {
  using R = MoneyRules<T>;
  return detail::EveryElement(V, [](T x) { return !R::IsNegative(x); });
}

template <detail::MoneyElement T>
bool VectorNegative(const std::vector<T>& V) {
  using R = MoneyRules<T>;
  return detail::EveryElement(V, [](T x) { return R::IsNegative(x); });
}

template <detail::MoneyElement T>
bool VectorNonPositive(const std::vector<T>& V) {
  using R = MoneyRules<T>;
  return detail::EveryElement(V, [](T x) { return !R::IsPositive(x); });
}

template <detail::MoneyElement T>
bool VectorNonZero(const std::vector<T>& V) {
  using R = MoneyRules<T>;
  return detail::EveryElement(V, [](T x) { return !R::IsZero(x); });
}

template <detail::MoneyElement T>
bool VectorZero(const std::vector<T>& V) {
  using R = MoneyRules<T>;
  return detail::EveryElement(V, [](T x) { return R::IsZero(x); });
}

template <detail::MoneyElement T>
bool VectorPositive(const std::vector<T>& V) {
  using R = MoneyRules<T>;
  return detail::EveryElement(V, [](T x) { return R::IsPositive(x); });
}

template <detail::MoneyElement T>
void QSortVector(std::vector<T>& V, bool Ascending) {
  detail::QuickSortVector(V, Ascending);
}

template <detail::MoneyElement T>
void LinearTransformVector(std::vector<T>& V, Extended A, Extended B) {
  LinearTransformOf(V, A, B);
}

template <detail::MoneyElement T>
TQENFloatVector Vector2FloatVector(const std::vector<T>& V) {
  return ConvertedOf<PackedExtended>(V, [](auto x) { return FloatOf(x); });
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
void FillVector(std::vector<T>& V, T Value) {
  detail::FillElements(V, Value);
}

template <detail::MoneyElement T>
void ClearVector(std::vector<T>& V) {
  detail::ClearElements(V);
}

template <detail::MoneyElement T>
std::vector<T> ReverseVector(const std::vector<T>& V) {
  return detail::Reversed(V);
}

template <detail::MoneyElement T>
std::vector<T> CopyVector(const std::vector<T>& V) {
  return detail::CopyOf(V);
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

TQENCurrVector Vector2QENCurrVector(const TQENCurrVector& V) {
  return ConvertedOf<TQENCurrency>(V, Same<TQENCurrency>);
}
TQENCurrVector Vector2QENCurrVector(const TQENLongCurrVector& V) {
  return ConvertedOf<TQENCurrency>(V, QENLongCurrency2QENCurrency);
}
TQENCurrVector Vector2QENCurrVector(const TQENCurrencyVector& V) {
  return ConvertedOf<TQENCurrency>(V, Currency2QENCurrency);
}
TQENCurrVector Vector2QENCurrVector(const TQENFloatVector& V) {
  return ConvertedOf<TQENCurrency>(V, CurrFromFloat);
}

TQENLongCurrVector Vector2QENLongCurrVector(const TQENCurrVector& V) {
  return ConvertedOf<TQENLongCurrency>(V, QENCurrency2QENLongCurrency);
}
TQENLongCurrVector Vector2QENLongCurrVector(const TQENLongCurrVector& V) {
  return ConvertedOf<TQENLongCurrency>(V, Same<TQENLongCurrency>);
}
TQENLongCurrVector Vector2QENLongCurrVector(const TQENCurrencyVector& V) {
  return ConvertedOf<TQENLongCurrency>(V, Currency2QENLongCurrency);
}
TQENLongCurrVector Vector2QENLongCurrVector(const TQENFloatVector& V) {
  return ConvertedOf<TQENLongCurrency>(V, LongCurrFromFloat);
}

TQENCurrencyVector Vector2QENCurrencyVector(const TQENCurrVector& V) {
  return ConvertedOf<Currency>(V, QENCurrency2Currency);
}
TQENCurrencyVector Vector2QENCurrencyVector(const TQENLongCurrVector& V) {
  return ConvertedOf<Currency>(V, QENLongCurrency2Currency);
}
TQENCurrencyVector Vector2QENCurrencyVector(const TQENCurrencyVector& V) {
  return ConvertedOf<Currency>(V, Same<Currency>);
}
TQENCurrencyVector Vector2QENCurrencyVector(const TQENFloatVector& V) {
  return ConvertedOf<Currency>(V, CurrencyFromFloat);
}

using detail::MatrixOf;

#define TOVRIN_INSTANTIATE(T)                                                                    \
  template void AppendValue2Vector(std::vector<T>&, T);                                          \
  template void AddValue2Vector(std::vector<T>&, T, LongInt);                                    \
  template void DeleteValueFromVector(std::vector<T>&, LongInt);                                 \
  template T MaxVector(const std::vector<T>&);                                                   \
  template T MinVector(const std::vector<T>&);                                                   \
  template void MinMaxVector(const std::vector<T>&, T&, T&, LongWord&, LongWord&, bool&, bool&); \
  template T SumVector(const std::vector<T>&);                                                   \
  template bool VectorNonNegative(const std::vector<T>&);                                        \
  template bool VectorNegative(const std::vector<T>&);                                           \
  template bool VectorNonPositive(const std::vector<T>&);                                        \
  template bool VectorNonZero(const std::vector<T>&);                                            \
  template bool VectorZero(const std::vector<T>&);                                               \
  template bool VectorPositive(const std::vector<T>&);                                           \
  template void QSortVector(std::vector<T>&, bool);                                              \
  template void LinearTransformVector(std::vector<T>&, Extended, Extended);                      \
  template TQENFloatVector Vector2FloatVector(const std::vector<T>&);                            \
  template std::vector<T> AddVectors(const std::vector<T>&, const std::vector<T>&);              \
  template void AddToVector(std::vector<T>&, const std::vector<T>&);                             \
  template std::vector<T> SubtractVectors(const std::vector<T>&, const std::vector<T>&);         \
  template void SubtractFromVector(std::vector<T>&, const std::vector<T>&);                      \
  template void FillVector(std::vector<T>&, T);                                                  \
  template void ClearVector(std::vector<T>&);                                                    \
  template std::vector<T> ReverseVector(const std::vector<T>&);                                  \
  template std::vector<T> CopyVector(const std::vector<T>&);                                     \
  template TQENLIntVector Vector2RankVector(const std::vector<T>&, bool);                        \
  template LongInt Vector2Rank(const std::vector<T>&, LongWord, bool);                           \
  template LongInt Vector2RankValue(const std::vector<T>&, T, bool);
TOVRIN_MONEY_ELEMENTS(TOVRIN_INSTANTIATE)
#undef TOVRIN_INSTANTIATE

}  // namespace tovrin
