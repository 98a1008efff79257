// Vector algorithms shared by the numeric vector unit and the money vector unit.
//
// Each template works on std::vector<T> for any element type T whose value type is
// ValueOf<T> (Extended for PackedExtended, T itself otherwise); where the rule differs by
// element type (how a term of a sum is formed, how two terms add, which test an element must
// pass) the caller passes it as a callable. Every template runs its checks before it touches
// an operand and raises through RaiseMathError.
#pragma once

#include <algorithm>
#include <cstddef>
#include <utility>
#include <vector>

#include "tovrin/detail/ElementRules.h"
#include "tovrin/foundation/TOVRINErrors.h"
#include "tovrin/foundation/TOVRINGlobals.h"

namespace tovrin::detail {

// --- Building --------------------------------------------------------------------------------

template <typename T>
void AppendElement(std::vector<T>& V, ValueOf<T> Value) {
  V.push_back(T(Value));
}

// Inserts at Index when Index is a position of V; any other Index appends.
template <typename T>
void InsertElement(std::vector<T>& V, ValueOf<T> Value, LongInt Index) {
  if (Index >= 0 && static_cast<std::size_t>(Index) < V.size()) {
    V.insert(V.begin() + Index, T(Value));
  } else {
    V.push_back(T(Value));
  }
}

// Removes the element at Index when Index is a position of V, else does nothing. Removing the
// only element releases the storage, as clearing the vector would.
template <typename T>
void DeleteElement(std::vector<T>& V, LongInt Index) {
  if (Index < 0 || static_cast<std::size_t>(Index) >= V.size()) return;
  if (V.size() == 1) {
    std::vector<T>().swap(V);
  } else {
    V.erase(V.begin() + Index);
  }
}

// --- Aggregates ------------------------------------------------------------------------------

template <typename T>
void RequireElements(const std::vector<T>& V) {
  if (V.empty()) RaiseMathError(rsVectorIsEmpty);
}

// The first element that no later one displaces: in index order, x replaces the one held when
// Displaces(held, x). Raises rsVectorIsEmpty.
template <typename T, typename DisplacesFn>
ValueOf<T> ExtremeElement(const std::vector<T>& V, DisplacesFn Displaces) {
  RequireElements(V);
  ValueOf<T> result = V[0];
  for (std::size_t i = 1; i < V.size(); ++i) {
    const ValueOf<T> x = V[i];
    if (Displaces(result, x)) result = x;
  }
  return result;
}

// Both extremes in one pass: their values, the first positions at which they occur, and
// whether each occurs only once. Raises rsVectorIsEmpty before any output is written.
template <typename T>
void Extremes(const std::vector<T>& V, ValueOf<T>& MinValue, ValueOf<T>& MaxValue,
              LongWord& MinIndex, LongWord& MaxIndex, bool& MinUnique, bool& MaxUnique) {
  RequireElements(V);
  ValueOf<T> lo = V[0];
  ValueOf<T> hi = lo;
  LongWord loIndex = 0;
  LongWord hiIndex = 0;
  bool loUnique = true;
  bool hiUnique = true;
  for (std::size_t i = 1; i < V.size(); ++i) {
    const ValueOf<T> x = V[i];
    if (x < lo) {
      lo = x;
      loIndex = static_cast<LongWord>(i);
      loUnique = true;
    } else if (x == lo) {
      loUnique = false;
    }
    if (x > hi) {
      hi = x;
      hiIndex = static_cast<LongWord>(i);
      hiUnique = true;
    } else if (x == hi) {
      hiUnique = false;
    }
  }
  MinValue = lo;
  MaxValue = hi;
  MinIndex = loIndex;
  MaxIndex = hiIndex;
  MinUnique = loUnique;
  MaxUnique = hiUnique;
}

// term(V[0]) + term(V[1]) + ... in index order, the sum formed by add(sum, term).
// Raises rsVectorIsEmpty.
template <typename T, typename Term, typename Add>
auto SumOfTerms(const std::vector<T>& V, Term term, Add add) {
  RequireElements(V);
  auto sum = term(static_cast<ValueOf<T>>(V[0]));
  for (std::size_t i = 1; i < V.size(); ++i) sum = add(sum, term(static_cast<ValueOf<T>>(V[i])));
  return sum;
}

// True when every element passes; the visit stops at the first failure. Raises
// rsVectorIsEmpty.
template <typename T, typename Passes>
bool EveryElement(const std::vector<T>& V, Passes passes) {
  RequireElements(V);
  for (const T& e : V) {
    if (!passes(static_cast<ValueOf<T>>(e))) return false;
  }
  return true;
}

// --- Families written once for the numeric and the money vectors --------------------------
// TOVRIN_DEFINE_...(Concept, Rules) defines a family's public templates for the element types
// of Concept with the element rules Rules<T> (ElementRules or MoneyRules);
// TOVRIN_INSTANTIATE_...(T) instantiates them for T.

// The six sign predicates: true when every element passes its test (EveryElement: the visit
// stops at the first that fails, rsVectorIsEmpty for an empty vector).
#define TOVRIN_SIGN_PREDICATES(X, A, B)         \
  X(A, B, VectorNonNegative, !R::IsNegative(x)) \
  X(A, B, VectorNegative, R::IsNegative(x))     \
  X(A, B, VectorNonZero, R::IsNonZero(x))       \
  X(A, B, VectorZero, R::IsZero(x))             \
  X(A, B, VectorNonPositive, !R::IsPositive(x)) \
  X(A, B, VectorPositive, R::IsPositive(x))
#define TOVRIN_DETAIL_SIGN_PREDICATE(Concept, Rules, Name, Test)               \
  template <Concept T>                                                         \
  bool Name(const std::vector<T>& V) {                                         \
    using R = Rules<T>;                                                        \
    return detail::EveryElement(V, [](detail::ValueOf<T> x) { return Test; }); \
  }
#define TOVRIN_DETAIL_SIGN_PREDICATE_OF(T, Unused, Name, Test) \
  template bool Name(const std::vector<T>&);
#define TOVRIN_DEFINE_SIGN_PREDICATES(Concept, Rules) \
  TOVRIN_SIGN_PREDICATES(TOVRIN_DETAIL_SIGN_PREDICATE, Concept, Rules)
#define TOVRIN_INSTANTIATE_SIGN_PREDICATES(T) \
  TOVRIN_SIGN_PREDICATES(TOVRIN_DETAIL_SIGN_PREDICATE_OF, T, )

// Element-by-element sums and differences: a new vector, and in place into V1
// (rsSameDimensions for unequal lengths). The matrix families (MatrixArithmetic.h) are
// defined by the same entry, with Container detail::MatrixOf.
#define TOVRIN_VECTOR_COMBINATIONS(X, A, B)          \
  X(A, B, std::vector, AddVectors, AddToVector, Add) \
  X(A, B, std::vector, SubtractVectors, SubtractFromVector, Sub)
#define TOVRIN_DETAIL_COMBINATION(Concept, Rules, Container, Producer, InPlace, Op)             \
  template <Concept T>                                                                          \
  Container<T> Producer(const Container<T>& X1, const Container<T>& X2) {                       \
    return detail::Combined(                                                                    \
        X1, X2, [](detail::ValueOf<T> a, detail::ValueOf<T> b) { return Rules<T>::Op(a, b); }); \
  }                                                                                             \
  template <Concept T>                                                                          \
  void InPlace(Container<T>& X1, const Container<T>& X2) {                                      \
    detail::CombineInto(                                                                        \
        X1, X2, [](detail::ValueOf<T> a, detail::ValueOf<T> b) { return Rules<T>::Op(a, b); }); \
  }
#define TOVRIN_DETAIL_COMBINATION_OF(T, Unused, Container, Producer, InPlace, Op) \
  template Container<T> Producer(const Container<T>&, const Container<T>&);       \
  template void InPlace(Container<T>&, const Container<T>&);
#define TOVRIN_DEFINE_VECTOR_COMBINATIONS(Concept, Rules) \
  TOVRIN_VECTOR_COMBINATIONS(TOVRIN_DETAIL_COMBINATION, Concept, Rules)
#define TOVRIN_INSTANTIATE_VECTOR_COMBINATIONS(T) \
  TOVRIN_VECTOR_COMBINATIONS(TOVRIN_DETAIL_COMBINATION_OF, T, )

// --- Element-wise forms ----------------------------------------------------------------------

template <typename T>
void RequireSameLength(const std::vector<T>& V1, const std::vector<T>& V2) {
  if (V1.size() != V2.size()) RaiseMathError(rsSameDimensions);
}

// V[i] := f(V[i]) for every element (no checks).
template <typename T, typename F>
void ApplyInPlace(std::vector<T>& V, F f) {
  for (T& e : V) e = T(f(static_cast<ValueOf<T>>(e)));
}

// V1[i] := f(V1[i], V2[i]); raises rsSameDimensions for unequal lengths (two empty vectors
// are fine).
template <typename T, typename F>
void CombineInto(std::vector<T>& V1, const std::vector<T>& V2, F f) {
  RequireSameLength(V1, V2);
  for (std::size_t i = 0; i < V1.size(); ++i) {
    V1[i] = T(f(static_cast<ValueOf<T>>(V1[i]), static_cast<ValueOf<T>>(V2[i])));
  }
}

// A new vector holding f(V1[i], V2[i]); raises rsSameDimensions for unequal lengths.
template <typename T, typename F>
std::vector<T> Combined(const std::vector<T>& V1, const std::vector<T>& V2, F f) {
  RequireSameLength(V1, V2);
  std::vector<T> result(V1.size());
  for (std::size_t i = 0; i < V1.size(); ++i) {
    result[i] = T(f(static_cast<ValueOf<T>>(V1[i]), static_cast<ValueOf<T>>(V2[i])));
  }
  return result;
}

template <typename T>
void FillElements(std::vector<T>& V, ValueOf<T> Value) {
  std::fill(V.begin(), V.end(), T(Value));
}

// Every element set to zero; the length is kept.
template <typename T>
void ClearElements(std::vector<T>& V) {
  std::fill(V.begin(), V.end(), T{});
}

template <typename T>
std::vector<T> Reversed(const std::vector<T>& V) {
  return std::vector<T>(V.rbegin(), V.rend());
}

// An independent copy (a new block, never shared with V).
template <typename T>
std::vector<T> CopyOf(const std::vector<T>& V) {
  return std::vector<T>(V.begin(), V.end());
}

}  // namespace tovrin::detail
