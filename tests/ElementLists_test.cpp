// The families exist for exactly the element types of their lists: a call with any other
// element type does not compile. Checked at compile time, one family per list.
#include "tovrin/tovrin.h"

#include <array>
#include <span>
#include <vector>

namespace tovrin {
namespace {

// Name<T> holds when the call compiles for an argument of type T.
#define TOVRIN_ACCEPTS(Name, Param, Call) \
  template <typename T>                   \
  concept Name = requires(Param) {        \
    Call;                                 \
  };

TOVRIN_ACCEPTS(CanSqrt, T& v, SqrtVector(v))
TOVRIN_ACCEPTS(CanAppend, T& v, AppendValue2Vector(v, 1))
TOVRIN_ACCEPTS(CanAdd, const T& v, AddVectors(v, v))
TOVRIN_ACCEPTS(CanTestSign, const T& v, VectorPositive(v))
TOVRIN_ACCEPTS(CanConvertToLInt, const T& v, Vector2LIntVector(v))
TOVRIN_ACCEPTS(CanSort, T& v, QSortVector(v, true))

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
TOVRIN_ACCEPTS(CanConvertArray, const T& a, Array2FloatVector(a))
static_assert(CanConvertArray<std::span<const Word>> && CanConvertArray<TQENWordVector>);
static_assert(CanConvertArray<std::array<Double, 3>> && CanConvertArray<std::span<Byte>>);
static_assert(!CanConvertArray<std::vector<long long>> && !CanConvertArray<std::vector<char>>);

TOVRIN_ACCEPTS(CanInvert, T& m, MatrixInverse(m, m))
TOVRIN_ACCEPTS(CanSumRow, const T& m, SumMatrixRow(m, 0))
TOVRIN_ACCEPTS(CanTakeMedian, const T& v, GetMedian(v))

static_assert(CanInvert<TQENDoubleMatrix> && !CanInvert<TQENInt64Matrix>);
static_assert(CanSumRow<TQENLWordMatrix> && !CanSumRow<TQENLIntMatrix>);
static_assert(CanTakeMedian<TQENLWordVector> && !CanTakeMedian<TQENWordVector>);
#undef TOVRIN_ACCEPTS

}  // namespace
}  // namespace tovrin
