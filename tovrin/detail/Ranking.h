// Ranks of values within a vector, shared by the vector and money units.
//
// A rank is the first position, in a copy of the vector sorted by the explicit-stack quick
// sort, holding a value equal to the one ranked; ties therefore share the lowest rank of their
// group and -1 means that nothing is equal. Equality is a callable `equal(a, b)` on keys (the
// element values as ValueOf<T> gives them): SameFloat at the element's own precision or exact
// equality by default, the money units pass their own.
//
// The first match is found by a search of the sorted copy instead of a scan from the front.
// This gives exactly the scan's answer because the keys equal to any x form one unbroken
// stretch of the order (true of exact equality and of a tolerance that grows no faster than
// the values themselves), so the keys that sort before x and are not equal to it are a prefix
// of the sorted copy. A key unordered with itself (a NaN) breaks that premise: a vector holding
// one is ranked by the plain scan.
#pragma once

#include <algorithm>
#include <cstddef>
#include <utility>
#include <vector>

#include "tovrin/detail/ElementRules.h"
#include "tovrin/detail/QuickSort.h"
#include "tovrin/foundation/TOVRINGlobals.h"

namespace tovrin::detail {

// The default equality of ranking: SameFloat at the key's precision, exact for integers.
struct RankEquals {
  template <typename K>
  bool operator()(K a, K b) const {
    return ElementEquals<K>(a, b);
  }
};

template <typename K>
bool IsUnorderedKey(const K& k) {
  return !(k == k);
}

// True when the key w sorts before x (in the order chosen by Ascending) and is not equal to
// it: the keys for which this holds form a prefix of the sorted copy.
template <typename K, typename Equal>
bool SortsBeforeAndDiffers(const K& w, const K& x, bool Ascending, Equal& equal) {
  return (Ascending ? w < x : x < w) && !equal(w, x);
}

// The first position of the sorted W whose key equals x, or -1.
template <typename T, typename Equal>
LongInt FirstEqualPosition(const std::vector<T>& W, ValueOf<T> x, bool Ascending, Equal& equal,
                           bool sorted) {
  const std::size_t n = W.size();
  std::size_t j = 0;
  if (sorted) {
    std::size_t count = n;  // binary search for the end of the prefix
    while (count > 0) {
      const std::size_t half = count / 2;
      if (SortsBeforeAndDiffers(static_cast<ValueOf<T>>(W[j + half]), x, Ascending, equal)) {
        j += half + 1;
        count -= half + 1;
      } else {
        count = half;
      }
    }
    return (j < n && equal(static_cast<ValueOf<T>>(W[j]), x)) ? static_cast<LongInt>(j) : -1;
  }
  for (; j < n; ++j) {
    if (equal(static_cast<ValueOf<T>>(W[j]), x)) return static_cast<LongInt>(j);
  }
  return -1;
}

template <typename T>
bool HoldsUnorderedKey(const std::vector<T>& V) {
  return std::any_of(V.begin(), V.end(),
                     [](const T& e) { return IsUnorderedKey(static_cast<ValueOf<T>>(e)); });
}

// The rank of Value among the elements of V, or -1 (also for an empty V).
template <typename T, typename Equal = RankEquals>
LongInt RankOfValue(const std::vector<T>& V, ValueOf<T> Value, bool Ascending,
                    Equal equal = Equal{}) {
  if (V.empty()) return -1;
  std::vector<T> W(V);
  QuickSortVector(W, Ascending);
  return FirstEqualPosition(W, Value, Ascending, equal, !HoldsUnorderedKey(W));
}

// The rank of V[Index], or -1 when Index is not a position of V (nothing is sorted then).
template <typename T, typename Equal = RankEquals>
LongInt RankOfElement(const std::vector<T>& V, LongWord Index, bool Ascending,
                      Equal equal = Equal{}) {
  if (Index >= V.size()) return -1;
  return RankOfValue(V, static_cast<ValueOf<T>>(V[Index]), Ascending, equal);
}

// The rank of every element: Result[i] is the rank of V[i]. One sort of (element, position)
// pairs, which moves the values exactly as the sort of a plain copy would, then one sweep of
// the sorted values in which the first-match position only moves forward.
template <typename T, typename Equal = RankEquals>
TQENLIntVector RankVector(const std::vector<T>& V, bool Ascending, Equal equal = Equal{}) {
  const LongInt n = static_cast<LongInt>(V.size());
  TQENLIntVector result(V.size());
  if (n == 0) return result;
  if (HoldsUnorderedKey(V)) {
    std::vector<T> W(V);
    QuickSortVector(W, Ascending);
    for (std::size_t i = 0; i < V.size(); ++i) {
      const LongInt rank =
          FirstEqualPosition(W, static_cast<ValueOf<T>>(V[i]), Ascending, equal, /*sorted=*/false);
      if (rank >= 0) result[i] = rank;  // an element equal to nothing keeps rank 0
    }
    return result;
  }
  struct Entry {
    T value;
    LongInt position;
  };
  std::vector<Entry> entries(V.size());
  for (LongInt i = 0; i < n; ++i) entries[static_cast<std::size_t>(i)] = Entry{V[i], i};
  Entry* const data = entries.data();  // position p is data[p - 1]
  QuickSortPositions(
      n, Ascending, [data](LongInt p) { return static_cast<ValueOf<T>>(data[p - 1].value); },
      [](const ValueOf<T>& a, const ValueOf<T>& b) { return a < b; },
      [data](LongInt p, LongInt q) { std::swap(data[p - 1], data[q - 1]); });
  std::size_t first = 0;
  for (std::size_t k = 0; k < entries.size(); ++k) {
    const ValueOf<T> x = static_cast<ValueOf<T>>(entries[k].value);
    while (
        SortsBeforeAndDiffers(static_cast<ValueOf<T>>(entries[first].value), x, Ascending, equal)) {
      ++first;
    }
    result[static_cast<std::size_t>(entries[k].position)] = static_cast<LongInt>(first);
  }
  return result;
}

}  // namespace tovrin::detail
