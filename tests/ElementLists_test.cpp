// The families exist for exactly the element types of their lists: a call with any other
// element type does not compile. Checked at compile time, one family per list.
#include "tovrin/tovrin.h"

#include <array>
#include <span>
#include <vector>

namespace tovrin {
namespace {

template <typename V>
concept CanSqrt = requires(V& v) {
  SqrtVector(v);
};
template <typename V>
concept CanAppend = requires(V& v) {
  AppendValue2Vector(v, 1);
};
template <typename V>
concept CanAdd = requires(const V& v) {
  AddVectors(v, v);
};
template <typename V>
concept CanTestSign = requires(const V& v) {
  VectorPositive(v);
};
template <typename V>
concept CanConvertToLInt = requires(const V& v) {
  Vector2LIntVector(v);
};
template <typename V>
concept CanSort = requires(V& v) {
  QSortVector(v, true);
};

static_assert(CanSqrt<TQENFloatVector> && CanSqrt<TQENSingleVector>);
static_assert(!CanSqrt<TQENInt64Vector> && !CanSqrt<TQENWordVector>);
static_assert(CanAppend<TQENLWordVector> && !CanAppend<TQENWordVector>);
static_assert(CanAdd<TQENLIntVector> && !CanAdd<TQENLWordVector>);
static_assert(CanTestSign<TQENInt64Vector> && !CanTestSign<TQENLIntVector>);
static_assert(CanConvertToLInt<TQENWordVector> && !CanConvertToLInt<TQENLWordVector>);
// Neither a vector of another element type nor a matrix is an element vector.
static_assert(CanSort<TQENSIntVector> && !CanSort<std::vector<Int64*>>);
static_assert(!CanSort<TQENFloatMatrix> && !CanSort<std::vector<long double>>);

// The open-array conversions take a span, and what converts to one of a listed type.
template <typename A>
concept CanConvertArray = requires(const A& a) {
  Array2FloatVector(a);
};
static_assert(CanConvertArray<std::span<const Word>> && CanConvertArray<TQENWordVector>);
static_assert(CanConvertArray<std::array<Double, 3>> && CanConvertArray<std::span<Byte>>);
static_assert(!CanConvertArray<std::vector<long long>> && !CanConvertArray<std::vector<char>>);

template <typename M>
concept CanInvert = requires(M& m) {
  MatrixInverse(m, m);
};
template <typename M>
concept CanSumRow = requires(const M& m) {
  SumMatrixRow(m, 0);
};
template <typename V>
concept CanTakeMedian = requires(const V& v) {
  GetMedian(v);
};

static_assert(CanInvert<TQENDoubleMatrix> && !CanInvert<TQENInt64Matrix>);
static_assert(CanSumRow<TQENLWordMatrix> && !CanSumRow<TQENLIntMatrix>);
static_assert(CanTakeMedian<TQENLWordVector> && !CanTakeMedian<TQENWordVector>);

}  // namespace
}  // namespace tovrin
