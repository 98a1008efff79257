// Sorting and ranking of the vector unit. The quick sort and the rank search are shared with
// the matrix and money units and live in detail/QuickSort.h and detail/Ranking.h.
#include "tovrin/vector/TOVRINVector.h"
#include "tovrin/vector/detail/QuickSort.h"
#include "tovrin/vector/detail/Ranking.h"

namespace tovrin {

void QSortVector(TQENFloatVector& V, bool Ascending) { detail::QuickSortVector(V, Ascending); }
void QSortVector(TQENDoubleVector& V, bool Ascending) { detail::QuickSortVector(V, Ascending); }
void QSortVector(TQENSingleVector& V, bool Ascending) { detail::QuickSortVector(V, Ascending); }
void QSortVector(TQENInt64Vector& V, bool Ascending) { detail::QuickSortVector(V, Ascending); }
void QSortVector(TQENLWordVector& V, bool Ascending) { detail::QuickSortVector(V, Ascending); }
void QSortVector(TQENLIntVector& V, bool Ascending) { detail::QuickSortVector(V, Ascending); }
void QSortVector(TQENWordVector& V, bool Ascending) { detail::QuickSortVector(V, Ascending); }
void QSortVector(TQENSmallIntVector& V, bool Ascending) { detail::QuickSortVector(V, Ascending); }
void QSortVector(TQENByteVector& V, bool Ascending) { detail::QuickSortVector(V, Ascending); }
void QSortVector(TQENSIntVector& V, bool Ascending) { detail::QuickSortVector(V, Ascending); }

TQENLIntVector Vector2RankVector(const TQENFloatVector& V, bool Ascending) {
  return detail::RankVector(V, Ascending);
}
TQENLIntVector Vector2RankVector(const TQENDoubleVector& V, bool Ascending) {
  return detail::RankVector(V, Ascending);
}
TQENLIntVector Vector2RankVector(const TQENSingleVector& V, bool Ascending) {
  return detail::RankVector(V, Ascending);
}
TQENLIntVector Vector2RankVector(const TQENInt64Vector& V, bool Ascending) {
  return detail::RankVector(V, Ascending);
}
TQENLIntVector Vector2RankVector(const TQENLWordVector& V, bool Ascending) {
  return detail::RankVector(V, Ascending);
}
TQENLIntVector Vector2RankVector(const TQENLIntVector& V, bool Ascending) {
  return detail::RankVector(V, Ascending);
}
TQENLIntVector Vector2RankVector(const TQENWordVector& V, bool Ascending) {
  return detail::RankVector(V, Ascending);
}
TQENLIntVector Vector2RankVector(const TQENSmallIntVector& V, bool Ascending) {
  return detail::RankVector(V, Ascending);
}
TQENLIntVector Vector2RankVector(const TQENByteVector& V, bool Ascending) {
  return detail::RankVector(V, Ascending);
}
TQENLIntVector Vector2RankVector(const TQENSIntVector& V, bool Ascending) {
  return detail::RankVector(V, Ascending);
}

LongInt Vector2Rank(const TQENFloatVector& V, LongWord Index, bool Ascending) {
  return detail::RankOfElement(V, Index, Ascending);
}
LongInt Vector2Rank(const TQENDoubleVector& V, LongWord Index, bool Ascending) {
  return detail::RankOfElement(V, Index, Ascending);
}
LongInt Vector2Rank(const TQENSingleVector& V, LongWord Index, bool Ascending) {
  return detail::RankOfElement(V, Index, Ascending);
}
LongInt Vector2Rank(const TQENInt64Vector& V, LongWord Index, bool Ascending) {
  return detail::RankOfElement(V, Index, Ascending);
}
LongInt Vector2Rank(const TQENLWordVector& V, LongWord Index, bool Ascending) {
  return detail::RankOfElement(V, Index, Ascending);
}
LongInt Vector2Rank(const TQENLIntVector& V, LongWord Index, bool Ascending) {
  return detail::RankOfElement(V, Index, Ascending);
}
LongInt Vector2Rank(const TQENWordVector& V, LongWord Index, bool Ascending) {
  return detail::RankOfElement(V, Index, Ascending);
}
LongInt Vector2Rank(const TQENSmallIntVector& V, LongWord Index, bool Ascending) {
  return detail::RankOfElement(V, Index, Ascending);
}
LongInt Vector2Rank(const TQENByteVector& V, LongWord Index, bool Ascending) {
  return detail::RankOfElement(V, Index, Ascending);
}
LongInt Vector2Rank(const TQENSIntVector& V, LongWord Index, bool Ascending) {
  return detail::RankOfElement(V, Index, Ascending);
}

LongInt Vector2RankValue(const TQENFloatVector& V, Extended Value, bool Ascending) {
  return detail::RankOfValue(V, Value, Ascending);
}
LongInt Vector2RankValue(const TQENDoubleVector& V, Double Value, bool Ascending) {
  return detail::RankOfValue(V, Value, Ascending);
}
LongInt Vector2RankValue(const TQENSingleVector& V, Single Value, bool Ascending) {
  return detail::RankOfValue(V, Value, Ascending);
}
LongInt Vector2RankValue(const TQENInt64Vector& V, Int64 Value, bool Ascending) {
  return detail::RankOfValue(V, Value, Ascending);
}
LongInt Vector2RankValue(const TQENLWordVector& V, LongWord Value, bool Ascending) {
  return detail::RankOfValue(V, Value, Ascending);
}
LongInt Vector2RankValue(const TQENLIntVector& V, LongInt Value, bool Ascending) {
  return detail::RankOfValue(V, Value, Ascending);
}
LongInt Vector2RankValue(const TQENWordVector& V, Word Value, bool Ascending) {
  return detail::RankOfValue(V, Value, Ascending);
}
LongInt Vector2RankValue(const TQENSmallIntVector& V, SmallInt Value, bool Ascending) {
  return detail::RankOfValue(V, Value, Ascending);
}
LongInt Vector2RankValue(const TQENByteVector& V, Byte Value, bool Ascending) {
  return detail::RankOfValue(V, Value, Ascending);
}
LongInt Vector2RankValue(const TQENSIntVector& V, ShortInt Value, bool Ascending) {
  return detail::RankOfValue(V, Value, Ascending);
}

}  // namespace tovrin
