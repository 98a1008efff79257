// Building and aggregates of the vector unit.
#include "tovrin/detail/ElementRules.h"
#include "tovrin/detail/VectorAlgorithms.h"
#include "tovrin/vector/TOVRINVector.h"

namespace tovrin {
namespace {

using detail::ElementRules;
using detail::ValueOf;

// The sum of the elements' terms in index order, as the element's rules form and add them.
template <typename T, typename Term>
detail::SumOf<T> SumOfRuleTerms(const std::vector<T>& V, Term term) {
  return detail::SumOfTerms(V, term, [](detail::SumOf<T> s, detail::SumOf<T> t) {
    return ElementRules<T>::SumAdd(s, t);
  });
}

}  // namespace

template <detail::BuildableOrMoneyElement T>
void AppendValue2Vector(std::vector<T>& V, detail::ValueOf<T> Value) {
  detail::AppendElement(V, Value);
}

template <detail::BuildableOrMoneyElement T>
void AddValue2Vector(std::vector<T>& V, detail::ValueOf<T> Value, LongInt Index) {
  detail::InsertElement(V, Value, Index);
}

template <detail::BuildableOrMoneyElement T>
void DeleteValueFromVector(std::vector<T>& V, LongInt Index) {
  detail::DeleteElement(V, Index);
}

template <detail::AnyOrMoneyElement T>
detail::ValueOf<T> MaxVector(const std::vector<T>& V) {
  return detail::ExtremeElement(V, [](ValueOf<T> held, ValueOf<T> x) { return held < x; });
}

template <detail::AnyOrMoneyElement T>
detail::ValueOf<T> MinVector(const std::vector<T>& V) {
  return detail::ExtremeElement(V, [](ValueOf<T> held, ValueOf<T> x) { return x < held; });
}

template <detail::AnyOrMoneyElement T>
void MinMaxVector(const std::vector<T>& V, detail::ValueOf<T>& MinValue,
                  detail::ValueOf<T>& MaxValue, LongWord& MinIndex, LongWord& MaxIndex,
                  bool& MinUnique, bool& MaxUnique) {
  detail::Extremes(V, MinValue, MaxValue, MinIndex, MaxIndex, MinUnique, MaxUnique);
}

template <detail::AnyElement T>
detail::SumOf<T> SumVector(const std::vector<T>& V) {
  return SumOfRuleTerms(V, [](ValueOf<T> x) { return ElementRules<T>::SumTerm(x); });
}

template <detail::AnyElement T>
detail::SumOf<T> SumSqVector(const std::vector<T>& V) {
  return SumOfRuleTerms(V, [](ValueOf<T> x) { return ElementRules<T>::SquareTerm(x); });
}

template <detail::BuildableElement T>
detail::SumOf<T> SumSqDiffVector(const std::vector<T>& V, detail::ValueOf<T> Mean) {
  return SumOfRuleTerms(V,
                        [Mean](ValueOf<T> x) { return ElementRules<T>::DeviationSquare(x, Mean); });
}

// About an Extended centre the integer elements are widened and everything is Extended.
template <detail::WideIntegerElement T>
Extended SumSqDiffVector(const std::vector<T>& V, Extended Mean) {
  return detail::SumOfTerms(
      V,
      [Mean](ValueOf<T> x) {
        const Extended d = Extended(x) - Mean;
        return d * d;
      },
      [](Extended s, Extended t) { return s + t; });
}

TOVRIN_DEFINE_SIGN_PREDICATES(detail::SignedElement, ElementRules)

using detail::SumOf;

#define TOVRIN_INSTANTIATE(T)                                                            \
  template ValueOf<T> MaxVector(const std::vector<T>&);                                  \
  template ValueOf<T> MinVector(const std::vector<T>&);                                  \
  template void MinMaxVector(const std::vector<T>&, ValueOf<T>&, ValueOf<T>&, LongWord&, \
                             LongWord&, bool&, bool&);
TOVRIN_ALL_AND_MONEY_ELEMENTS(TOVRIN_INSTANTIATE)
#undef TOVRIN_INSTANTIATE

#define TOVRIN_INSTANTIATE(T)                         \
  template SumOf<T> SumVector(const std::vector<T>&); \
  template SumOf<T> SumSqVector(const std::vector<T>&);
TOVRIN_ALL_ELEMENTS(TOVRIN_INSTANTIATE)
#undef TOVRIN_INSTANTIATE

#define TOVRIN_INSTANTIATE(T)                                          \
  template void AppendValue2Vector(std::vector<T>&, ValueOf<T>);       \
  template void AddValue2Vector(std::vector<T>&, ValueOf<T>, LongInt); \
  template void DeleteValueFromVector(std::vector<T>&, LongInt);
TOVRIN_BUILDABLE_AND_MONEY_ELEMENTS(TOVRIN_INSTANTIATE)
#undef TOVRIN_INSTANTIATE

#define TOVRIN_INSTANTIATE(T) template SumOf<T> SumSqDiffVector(const std::vector<T>&, ValueOf<T>);
TOVRIN_BUILDABLE_ELEMENTS(TOVRIN_INSTANTIATE)
#undef TOVRIN_INSTANTIATE

#define TOVRIN_INSTANTIATE(T) template Extended SumSqDiffVector(const std::vector<T>&, Extended);
TOVRIN_WIDE_INTEGER_ELEMENTS(TOVRIN_INSTANTIATE)
#undef TOVRIN_INSTANTIATE

#define TOVRIN_INSTANTIATE(T) TOVRIN_INSTANTIATE_SIGN_PREDICATES(T)
TOVRIN_SIGNED_ELEMENTS(TOVRIN_INSTANTIATE)
#undef TOVRIN_INSTANTIATE

}  // namespace tovrin
