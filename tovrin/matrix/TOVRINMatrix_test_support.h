// Helpers shared by the matrix unit's tests.
#pragma once

#include <gtest/gtest.h>

#include <functional>
#include <initializer_list>
#include <vector>

#include "tovrin/matrix/TOVRINMatrix.h"

namespace tovrin::testing {

// Sets QENMatrixRectangularCheck for the lifetime of the guard and restores the previous value
// afterwards (also when a test fails or throws).
class RectangularCheckSwitch {
 public:
  explicit RectangularCheckSwitch(bool Value) : saved_(QENMatrixRectangularCheck.load()) {
    QENMatrixRectangularCheck = Value;
  }
  ~RectangularCheckSwitch() { QENMatrixRectangularCheck = saved_; }
  RectangularCheckSwitch(const RectangularCheckSwitch&) = delete;
  RectangularCheckSwitch& operator=(const RectangularCheckSwitch&) = delete;

 private:
  bool saved_;
};

template <typename T>
using Matrix = std::vector<std::vector<T>>;

// A matrix of element type T from literal rows (rows may differ in length).
template <typename T>
Matrix<T> Make(std::initializer_list<std::initializer_list<long double>> Rows) {
  Matrix<T> m;
  for (const auto& row : Rows) {
    std::vector<T> r;
    for (long double x : row) r.push_back(T(x));
    m.push_back(std::move(r));
  }
  return m;
}

// The elements as Extended values, for comparisons that do not care about the stored type.
template <typename T>
std::vector<std::vector<long double>> Values(const Matrix<T>& M) {
  std::vector<std::vector<long double>> r;
  for (const auto& row : M) {
    std::vector<long double> v;
    for (const auto& x : row) v.push_back(static_cast<long double>(x));
    r.push_back(std::move(v));
  }
  return r;
}

template <typename T>
std::vector<long double> Values(const std::vector<T>& V) {
  std::vector<long double> r;
  for (const auto& x : V) r.push_back(static_cast<long double>(x));
  return r;
}

// Bitwise equality of two matrices (PackedExtended has no operator==).
template <typename T>
bool SameBits(const Matrix<T>& A, const Matrix<T>& B) {
  if (A.size() != B.size()) return false;
  for (std::size_t i = 0; i < A.size(); ++i) {
    if (A[i].size() != B[i].size()) return false;
    if (!A[i].empty() && std::memcmp(A[i].data(), B[i].data(), A[i].size() * sizeof(T)) != 0) {
      return false;
    }
  }
  return true;
}

// Runs Call, expecting EMathError with the identifier Ident.
inline void ExpectMathError(TResStringId Ident, const std::function<void()>& Call) {
  try {
    Call();
    ADD_FAILURE() << "expected EMathError " << ResStringName(Ident) << ", nothing was raised";
  } catch (const EMathError& e) {
    EXPECT_EQ(e.Ident(), Ident) << "raised " << ResStringName(e.Ident()) << " instead of "
                                << ResStringName(Ident);
  }
}

// Runs Call on a copy of M, expecting EMathError(Ident) and the copy unchanged afterwards.
template <typename T, typename CallFn>
void ExpectRaisesUntouched(TResStringId Ident, const Matrix<T>& M, CallFn Call) {
  Matrix<T> work = M;
  ExpectMathError(Ident, [&] { Call(work); });
  EXPECT_TRUE(SameBits(work, M)) << "operand changed by a failed call";
}

// The ten matrix types and the subsets of the family tables.
using AllMatrixTypes = ::testing::Types<PackedExtended, Double, Single, Int64, LongWord, LongInt,
                                        Word, SmallInt, Byte, ShortInt>;
using FloatMatrixTypes = ::testing::Types<PackedExtended, Double, Single>;
using ArithmeticMatrixTypes = ::testing::Types<PackedExtended, Double, Single, Int64, LongInt>;

}  // namespace tovrin::testing
