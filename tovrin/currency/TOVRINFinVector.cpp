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

void AppendValue2Vector(TQENCurrVector& V, TQENCurrency Value) { detail::AppendElement(V, Value); }
void AppendValue2Vector(TQENLongCurrVector& V, TQENLongCurrency Value) {
  detail::AppendElement(V, Value);
}
void AppendValue2Vector(TQENCurrencyVector& V, Currency Value) { detail::AppendElement(V, Value); }

void AddValue2Vector(TQENCurrVector& V, TQENCurrency Value, LongInt Index) {
  detail::InsertElement(V, Value, Index);
}
void AddValue2Vector(TQENLongCurrVector& V, TQENLongCurrency Value, LongInt Index) {
  detail::InsertElement(V, Value, Index);
}
void AddValue2Vector(TQENCurrencyVector& V, Currency Value, LongInt Index) {
  detail::InsertElement(V, Value, Index);
}

void DeleteValueFromVector(TQENCurrVector& V, LongInt Index) { detail::DeleteElement(V, Index); }
void DeleteValueFromVector(TQENLongCurrVector& V, LongInt Index) {
  detail::DeleteElement(V, Index);
}
void DeleteValueFromVector(TQENCurrencyVector& V, LongInt Index) {
  detail::DeleteElement(V, Index);
}

TQENCurrency MaxVector(const TQENCurrVector& V) { return detail::LargestElement(V); }
TQENLongCurrency MaxVector(const TQENLongCurrVector& V) { return detail::LargestElement(V); }
Currency MaxVector(const TQENCurrencyVector& V) { return detail::LargestElement(V); }

TQENCurrency MinVector(const TQENCurrVector& V) { return detail::SmallestElement(V); }
TQENLongCurrency MinVector(const TQENLongCurrVector& V) { return detail::SmallestElement(V); }
Currency MinVector(const TQENCurrencyVector& V) { return detail::SmallestElement(V); }

void MinMaxVector(const TQENCurrVector& V, TQENCurrency& MinValue, TQENCurrency& MaxValue,
                  LongWord& MinIndex, LongWord& MaxIndex, bool& MinUnique, bool& MaxUnique) {
  detail::Extremes(V, MinValue, MaxValue, MinIndex, MaxIndex, MinUnique, MaxUnique);
}
void MinMaxVector(const TQENLongCurrVector& V, TQENLongCurrency& MinValue,
                  TQENLongCurrency& MaxValue, LongWord& MinIndex, LongWord& MaxIndex,
                  bool& MinUnique, bool& MaxUnique) {
  detail::Extremes(V, MinValue, MaxValue, MinIndex, MaxIndex, MinUnique, MaxUnique);
}
void MinMaxVector(const TQENCurrencyVector& V, Currency& MinValue, Currency& MaxValue,
                  LongWord& MinIndex, LongWord& MaxIndex, bool& MinUnique, bool& MaxUnique) {
  detail::Extremes(V, MinValue, MaxValue, MinIndex, MaxIndex, MinUnique, MaxUnique);
}

TQENCurrency SumVector(const TQENCurrVector& V) { return SumOf(V); }
TQENLongCurrency SumVector(const TQENLongCurrVector& V) { return SumOf(V); }
Currency SumVector(const TQENCurrencyVector& V) { return SumOf(V); }

bool VectorNonNegative(const TQENCurrVector& V) {
  using R = MoneyRules<TQENCurrency>;
  return detail::EveryElement(V, [](TQENCurrency x) { return !R::IsNegative(x); });
}
bool VectorNonNegative(const TQENLongCurrVector& V) {
  using R = MoneyRules<TQENLongCurrency>;
  return detail::EveryElement(V, [](TQENLongCurrency x) { return !R::IsNegative(x); });
}
bool VectorNonNegative(const TQENCurrencyVector& V) {
  using R = MoneyRules<Currency>;
  return detail::EveryElement(V, [](Currency x) { return !R::IsNegative(x); });
}

bool VectorNegative(const TQENCurrVector& V) {
  using R = MoneyRules<TQENCurrency>;
  return detail::EveryElement(V, [](TQENCurrency x) { return R::IsNegative(x); });
}
bool VectorNegative(const TQENLongCurrVector& V) {
  using R = MoneyRules<TQENLongCurrency>;
  return detail::EveryElement(V, [](TQENLongCurrency x) { return R::IsNegative(x); });
}
bool VectorNegative(const TQENCurrencyVector& V) {
  using R = MoneyRules<Currency>;
  return detail::EveryElement(V, [](Currency x) { return R::IsNegative(x); });
}

bool VectorNonPositive(const TQENCurrVector& V) {
  using R = MoneyRules<TQENCurrency>;
  return detail::EveryElement(V, [](TQENCurrency x) { return !R::IsPositive(x); });
}
bool VectorNonPositive(const TQENLongCurrVector& V) {
  using R = MoneyRules<TQENLongCurrency>;
  return detail::EveryElement(V, [](TQENLongCurrency x) { return !R::IsPositive(x); });
}
bool VectorNonPositive(const TQENCurrencyVector& V) {
  using R = MoneyRules<Currency>;
  return detail::EveryElement(V, [](Currency x) { return !R::IsPositive(x); });
}

bool VectorNonZero(const TQENCurrVector& V) {
  using R = MoneyRules<TQENCurrency>;
  return detail::EveryElement(V, [](TQENCurrency x) { return !R::IsZero(x); });
}
bool VectorNonZero(const TQENLongCurrVector& V) {
  using R = MoneyRules<TQENLongCurrency>;
  return detail::EveryElement(V, [](TQENLongCurrency x) { return !R::IsZero(x); });
}
bool VectorNonZero(const TQENCurrencyVector& V) {
  using R = MoneyRules<Currency>;
  return detail::EveryElement(V, [](Currency x) { return !R::IsZero(x); });
}

bool VectorZero(const TQENCurrVector& V) {
  using R = MoneyRules<TQENCurrency>;
  return detail::EveryElement(V, [](TQENCurrency x) { return R::IsZero(x); });
}
bool VectorZero(const TQENLongCurrVector& V) {
  using R = MoneyRules<TQENLongCurrency>;
  return detail::EveryElement(V, [](TQENLongCurrency x) { return R::IsZero(x); });
}
bool VectorZero(const TQENCurrencyVector& V) {
  using R = MoneyRules<Currency>;
  return detail::EveryElement(V, [](Currency x) { return R::IsZero(x); });
}

bool VectorPositive(const TQENCurrVector& V) {
  using R = MoneyRules<TQENCurrency>;
  return detail::EveryElement(V, [](TQENCurrency x) { return R::IsPositive(x); });
}
bool VectorPositive(const TQENLongCurrVector& V) {
  using R = MoneyRules<TQENLongCurrency>;
  return detail::EveryElement(V, [](TQENLongCurrency x) { return R::IsPositive(x); });
}
bool VectorPositive(const TQENCurrencyVector& V) {
  using R = MoneyRules<Currency>;
  return detail::EveryElement(V, [](Currency x) { return R::IsPositive(x); });
}

void QSortVector(TQENCurrVector& V, bool Ascending) { detail::QuickSortVector(V, Ascending); }
void QSortVector(TQENLongCurrVector& V, bool Ascending) { detail::QuickSortVector(V, Ascending); }
void QSortVector(TQENCurrencyVector& V, bool Ascending) { detail::QuickSortVector(V, Ascending); }

void LinearTransformVector(TQENCurrVector& V, Extended A, Extended B) {
  LinearTransformOf(V, A, B);
}
void LinearTransformVector(TQENLongCurrVector& V, Extended A, Extended B) {
  LinearTransformOf(V, A, B);
}
void LinearTransformVector(TQENCurrencyVector& V, Extended A, Extended B) {
  LinearTransformOf(V, A, B);
}

TQENFloatVector Vector2FloatVector(const TQENCurrVector& V) {
  return ConvertedOf<PackedExtended>(V, [](auto x) { return FloatOf(x); });
}
TQENFloatVector Vector2FloatVector(const TQENLongCurrVector& V) {
  return ConvertedOf<PackedExtended>(V, [](auto x) { return FloatOf(x); });
}
TQENFloatVector Vector2FloatVector(const TQENCurrencyVector& V) {
  return ConvertedOf<PackedExtended>(V, [](auto x) { return FloatOf(x); });
}

TQENCurrVector AddVectors(const TQENCurrVector& V1, const TQENCurrVector& V2) {
  return detail::Combined(V1, V2, &MoneyRules<TQENCurrency>::Add);
}
TQENLongCurrVector AddVectors(const TQENLongCurrVector& V1, const TQENLongCurrVector& V2) {
  return detail::Combined(V1, V2, &MoneyRules<TQENLongCurrency>::Add);
}
TQENCurrencyVector AddVectors(const TQENCurrencyVector& V1, const TQENCurrencyVector& V2) {
  return detail::Combined(V1, V2, &MoneyRules<Currency>::Add);
}

void AddToVector(TQENCurrVector& V1, const TQENCurrVector& V2) {
  detail::CombineInto(V1, V2, &MoneyRules<TQENCurrency>::Add);
}
void AddToVector(TQENLongCurrVector& V1, const TQENLongCurrVector& V2) {
  detail::CombineInto(V1, V2, &MoneyRules<TQENLongCurrency>::Add);
}
void AddToVector(TQENCurrencyVector& V1, const TQENCurrencyVector& V2) {
  detail::CombineInto(V1, V2, &MoneyRules<Currency>::Add);
}

TQENCurrVector SubtractVectors(const TQENCurrVector& V1, const TQENCurrVector& V2) {
  return detail::Combined(V1, V2, &MoneyRules<TQENCurrency>::Sub);
}
TQENLongCurrVector SubtractVectors(const TQENLongCurrVector& V1, const TQENLongCurrVector& V2) {
  return detail::Combined(V1, V2, &MoneyRules<TQENLongCurrency>::Sub);
}
TQENCurrencyVector SubtractVectors(const TQENCurrencyVector& V1, const TQENCurrencyVector& V2) {
  return detail::Combined(V1, V2, &MoneyRules<Currency>::Sub);
}

void SubtractFromVector(TQENCurrVector& V1, const TQENCurrVector& V2) {
  detail::CombineInto(V1, V2, &MoneyRules<TQENCurrency>::Sub);
}
void SubtractFromVector(TQENLongCurrVector& V1, const TQENLongCurrVector& V2) {
  detail::CombineInto(V1, V2, &MoneyRules<TQENLongCurrency>::Sub);
}
void SubtractFromVector(TQENCurrencyVector& V1, const TQENCurrencyVector& V2) {
  detail::CombineInto(V1, V2, &MoneyRules<Currency>::Sub);
}

void FillVector(TQENCurrVector& V, TQENCurrency Value) { detail::FillElements(V, Value); }
void FillVector(TQENLongCurrVector& V, TQENLongCurrency Value) { detail::FillElements(V, Value); }
void FillVector(TQENCurrencyVector& V, Currency Value) { detail::FillElements(V, Value); }

void ClearVector(TQENCurrVector& V) { detail::ClearElements(V); }
void ClearVector(TQENLongCurrVector& V) { detail::ClearElements(V); }
void ClearVector(TQENCurrencyVector& V) { detail::ClearElements(V); }

TQENCurrVector ReverseVector(const TQENCurrVector& V) { return detail::Reversed(V); }
TQENLongCurrVector ReverseVector(const TQENLongCurrVector& V) { return detail::Reversed(V); }
TQENCurrencyVector ReverseVector(const TQENCurrencyVector& V) { return detail::Reversed(V); }

TQENCurrVector CopyVector(const TQENCurrVector& V) { return detail::CopyOf(V); }
TQENLongCurrVector CopyVector(const TQENLongCurrVector& V) { return detail::CopyOf(V); }
TQENCurrencyVector CopyVector(const TQENCurrencyVector& V) { return detail::CopyOf(V); }

TQENLIntVector Vector2RankVector(const TQENCurrVector& V, bool Ascending) {
  return detail::RankVector(V, Ascending, detail::MoneyRankEquals{});
}
TQENLIntVector Vector2RankVector(const TQENLongCurrVector& V, bool Ascending) {
  return detail::RankVector(V, Ascending, detail::MoneyRankEquals{});
}
TQENLIntVector Vector2RankVector(const TQENCurrencyVector& V, bool Ascending) {
  return detail::RankVector(V, Ascending, detail::MoneyRankEquals{});
}

LongInt Vector2Rank(const TQENCurrVector& V, LongWord Index, bool Ascending) {
  return detail::RankOfElement(V, Index, Ascending, detail::MoneyRankEquals{});
}
LongInt Vector2Rank(const TQENLongCurrVector& V, LongWord Index, bool Ascending) {
  return detail::RankOfElement(V, Index, Ascending, detail::MoneyRankEquals{});
}
LongInt Vector2Rank(const TQENCurrencyVector& V, LongWord Index, bool Ascending) {
  return detail::RankOfElement(V, Index, Ascending, detail::MoneyRankEquals{});
}

LongInt Vector2RankValue(const TQENCurrVector& V, TQENCurrency Value, bool Ascending) {
  return detail::RankOfValue(V, Value, Ascending, detail::MoneyRankEquals{});
}
LongInt Vector2RankValue(const TQENLongCurrVector& V, TQENLongCurrency Value, bool Ascending) {
  return detail::RankOfValue(V, Value, Ascending, detail::MoneyRankEquals{});
}
LongInt Vector2RankValue(const TQENCurrencyVector& V, Currency Value, bool Ascending) {
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

}  // namespace tovrin
