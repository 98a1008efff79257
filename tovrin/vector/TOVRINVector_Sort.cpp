// Sorting and ranking of the vector unit. The quick sort and the rank search are shared with
// the matrix and money units and live in detail/QuickSort.h and detail/Ranking.h.
#include "tovrin/detail/QuickSort.h"
#include "tovrin/detail/Ranking.h"
#include "tovrin/vector/TOVRINVector.h"

namespace tovrin {

using detail::ValueOf;

template <detail::AnyOrMoneyElement T>
void QSortVector(std::vector<T>& V, bool Ascending) {
  detail::QuickSortVector(V, Ascending);
}

template <detail::AnyElement T>
TQENLIntVector Vector2RankVector(const std::vector<T>& V, bool Ascending) {
  return detail::RankVector(V, Ascending);
}

template <detail::AnyElement T>
LongInt Vector2Rank(const std::vector<T>& V, LongWord Index, bool Ascending) {
  return detail::RankOfElement(V, Index, Ascending);
}

template <detail::AnyElement T>
LongInt Vector2RankValue(const std::vector<T>& V, detail::ValueOf<T> Value, bool Ascending) {
  return detail::RankOfValue(V, Value, Ascending);
}

#define TOVRIN_INSTANTIATE(T) template void QSortVector(std::vector<T>&, bool);
TOVRIN_ALL_AND_MONEY_ELEMENTS(TOVRIN_INSTANTIATE)
#undef TOVRIN_INSTANTIATE

#define TOVRIN_INSTANTIATE(T)                                             \
  template TQENLIntVector Vector2RankVector(const std::vector<T>&, bool); \
  template LongInt Vector2Rank(const std::vector<T>&, LongWord, bool);    \
  template LongInt Vector2RankValue(const std::vector<T>&, ValueOf<T>, bool);
TOVRIN_ALL_ELEMENTS(TOVRIN_INSTANTIATE)
#undef TOVRIN_INSTANTIATE

}  // namespace tovrin
