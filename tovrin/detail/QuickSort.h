// The explicit-stack quick sort shared by the vector, matrix and money units.
//
// The sort works on 1-based positions 1..N through three callables, so that one algorithm
// orders vector elements, matrix rows on a column key, matrix columns on a row key and money
// values alike:
//   key(p)      the sort key at position p, returned by value (the pivot is a copy of it);
//   less(a, b)  the strict order of two keys (`a < b` for ascending order);
//   swap(p, q)  exchanges whatever sits at positions p and q (called also when p == q).
// It is the classic Hoare partition around the middle position, not stable, with no recursion:
// the larger part is pushed on a stack of TQStackRec entries and the loop goes on with the
// smaller one, so the stack never holds more than log2(N) entries. Equal keys stop both scans
// and are exchanged, which keeps runs of equal keys balanced. A key that is unordered with
// everything (a NaN) only makes the scans stop earlier; no position outside 1..N is ever read.
#pragma once

#include <cmath>
#include <cstdint>
#include <cstring>
#include <type_traits>
#include <utility>
#include <vector>

#include "tovrin/foundation/TOVRINElementTypes.h"
#include "tovrin/foundation/TOVRINErrors.h"
#include "tovrin/foundation/TOVRINGlobals.h"
#include "tovrin/foundation/TOVRINMath.h"

namespace tovrin {

// One entry of the explicit stack of the quick sorts: 1-based bounds of a stretch still
// to be sorted.
struct TQStackRec {
  LongInt Lower;
  LongInt Upper;
};

}  // namespace tovrin

namespace tovrin::detail {

// Entries of the explicit stack for N positions: Round(log2 N) + 2, rounded to the nearest
// integer whatever the caller's floating-point rounding mode (std::nearbyint would follow it).
// The logarithm of an integer is never exactly a half, so how halves go does not arise.
inline LongInt QuickSortStackSize(LongInt N) {
  return static_cast<LongInt>(std::round(QENLog2(static_cast<Extended>(N)))) + 2;
}

// Sorts positions 1..N so that `less` holds along them wherever it can (see above).
// With a Cutoff above 0, stretches of at most Cutoff + 1 positions are left unpartitioned
// (each already holds exactly the keys that belong there); the caller finishes them.
template <typename KeyAt, typename Less, typename SwapAt>
void QuickSortPositions(LongInt N, KeyAt&& key, Less&& less, SwapAt&& swap, LongInt Cutoff = 0) {
  if (N < 2) return;
  std::vector<TQStackRec> stack(static_cast<std::size_t>(QuickSortStackSize(N)));
  const LongInt capacity = static_cast<LongInt>(stack.size());
  LongInt sp = 0;
  stack[0] = TQStackRec{1, N};
  // The halving argument bounds the depth by log2(N); the guard only keeps a comparison that
  // breaks the order's rules from ever writing past the stack.
  auto push = [&](LongInt lower, LongInt upper) {
    if (sp + 1 >= capacity) RaiseMathError(rsInvalidValue);
    stack[static_cast<std::size_t>(++sp)] = TQStackRec{lower, upper};
  };
  while (sp >= 0) {
    LongInt l = stack[static_cast<std::size_t>(sp)].Lower;
    LongInt r = stack[static_cast<std::size_t>(sp)].Upper;
    --sp;
    while (r - l > Cutoff) {
      const auto pivot = key(l + (r - l) / 2);
      LongInt i = l;
      LongInt j = r;
      do {
        while (less(key(i), pivot)) ++i;
        while (less(pivot, key(j))) --j;
        if (i <= j) {
          swap(i, j);
          ++i;
          --j;
        }
      } while (i <= j);
      if ((j - l) < (r - i)) {
        if (r - i > Cutoff) push(i, r);
        r = j;
      } else {
        if (j - l > Cutoff) push(l, j);
        l = i;
      }
    }
  }
}

// The same with the direction chosen at run time: descending order is ascending order under
// the reversed comparison (the scans of a descending sort are the ascending ones mirrored).
template <typename KeyAt, typename Less, typename SwapAt>
void QuickSortPositions(LongInt N, bool Ascending, KeyAt&& key, Less&& less, SwapAt&& swap) {
  if (Ascending) {
    QuickSortPositions(N, key, less, swap);
  } else {
    QuickSortPositions(
        N, key, [&less](const auto& a, const auto& b) { return less(b, a); }, swap);
  }
}

// Whether equal elements of V are indistinguishable, so that every ordering of V gives the
// same bits and the sort may finish short stretches by straight insertion: always for
// integers and money, for Double and Single when V holds no NaN and no negative zero (-0 and
// +0 compare equal but differ). Extended elements always take the plain algorithm.
template <typename T>
bool EqualElementsAreIdentical(const std::vector<T>& V) {
  if constexpr (std::is_integral_v<T> || std::is_enum_v<T>) {
    return true;
  } else if constexpr (std::is_floating_point_v<T>) {
    for (const T x : V) {
      if (x != x || (x == 0 && std::signbit(x))) return false;
    }
    return true;
  } else {
    return false;
  }
}

// An integer key that orders packed Extended values as their `<` does: the magnitude
// (15-bit exponent above the 64-bit mantissa) with the sign applied, so that -0 and +0 get the
// same key. It holds for canonical encodings that are not NaN (zeros and denormals with the
// explicit integer bit clear, normals and infinities with it set); PackedKeysAreExact checks
// a vector for them.
struct PackedExtendedFields {
  std::uint64_t mantissa;
  std::uint16_t signExponent;
};
inline PackedExtendedFields FieldsOf(const PackedExtended& x) {
  PackedExtendedFields f;
  std::memcpy(&f.mantissa, &x, 8);
  std::memcpy(&f.signExponent, reinterpret_cast<const unsigned char*>(&x) + 8, 2);
  return f;
}
inline __int128 PackedKey(const PackedExtended& x) {
  const PackedExtendedFields f = FieldsOf(x);
  const auto magnitude = static_cast<__int128>(
      (static_cast<unsigned __int128>(f.signExponent & 0x7FFF) << 64) | f.mantissa);
  const __int128 sign = -static_cast<__int128>(f.signExponent >> 15);  // 0 or all ones
  return (magnitude ^ sign) - sign;
}
inline bool PackedKeysAreExact(const std::vector<PackedExtended>& V) {
  for (const PackedExtended& x : V) {
    const PackedExtendedFields f = FieldsOf(x);
    const unsigned exponent = f.signExponent & 0x7FFFu;
    const bool integerBit = (f.mantissa >> 63) != 0;
    const bool canonical = exponent == 0 ? !integerBit
                                         : integerBit && (exponent != 0x7FFFu ||
                                                          f.mantissa == (std::uint64_t{1} << 63));
    if (!canonical) return false;
  }
  return true;
}

// Sorts a vector in place by the elements' own `<` (exact, also for floats), exchanging
// elements whole as SwapXY does, for the numeric and the money types alike. PackedExtended
// elements are compared as Extended values. Where equal elements are indistinguishable the
// result is the same as the plain algorithm's to the bit, but the partitioning stops at short
// stretches and one straight insertion pass finishes them.
template <typename T>
void QuickSortVector(std::vector<T>& V, bool Ascending) {
  const LongInt n = static_cast<LongInt>(V.size());
  if (n < 2) return;
  T* const data = V.data();  // position p is data[p - 1]
  auto swap = [data](LongInt p, LongInt q) { std::swap(data[p - 1], data[q - 1]); };
  if constexpr (std::is_same_v<T, PackedExtended>) {
    // The same comparisons through integer keys, which read the packed bytes directly.
    if (PackedKeysAreExact(V)) {
      QuickSortPositions(
          n, Ascending, [data](LongInt p) { return PackedKey(data[p - 1]); },
          [](__int128 a, __int128 b) { return a < b; }, swap);
      return;
    }
  }
  auto key = [data](LongInt p) { return static_cast<ValueOf<T>>(data[p - 1]); };
  auto less = [](ValueOf<T> a, ValueOf<T> b) { return a < b; };
  if (!EqualElementsAreIdentical(V)) {
    QuickSortPositions(n, Ascending, key, less, swap);
    return;
  }
  constexpr LongInt kInsertionCutoff = 16;
  auto in_order = [Ascending](T a, T b) { return Ascending ? a < b : b < a; };
  if (Ascending) {
    QuickSortPositions(n, key, less, swap, kInsertionCutoff);
  } else {
    QuickSortPositions(
        n, key, [](ValueOf<T> a, ValueOf<T> b) { return b < a; }, swap, kInsertionCutoff);
  }
  for (std::size_t i = 1; i < V.size(); ++i) {
    const T x = data[i];
    std::size_t j = i;
    for (; j > 0 && in_order(x, data[j - 1]); --j) data[j] = data[j - 1];
    data[j] = x;
  }
}

}  // namespace tovrin::detail
