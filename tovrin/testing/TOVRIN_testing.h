// What every unit's tests share: the error check, the closeness checks, the element-type lists
// and small builders of vectors and matrices from plain numbers. Header-only; the CMake target
// tovrin_testing carries it, with GoogleTest, into each test program.
#pragma once

#include <atomic>
#include <cmath>
#include <cstdint>
#include <cstring>
#include <functional>
#include <initializer_list>
#include <limits>
#include <type_traits>
#include <vector>

#include <gtest/gtest.h>

#include "tovrin/foundation/TOVRINElementTypes.h"
#include "tovrin/foundation/TOVRINErrors.h"
#include "tovrin/foundation/TOVRINGlobals.h"

namespace tovrin::testing {

inline constexpr Extended kInf = std::numeric_limits<Extended>::infinity();
inline constexpr Extended kNaN = std::numeric_limits<Extended>::quiet_NaN();
inline constexpr Extended kEps = std::numeric_limits<Extended>::epsilon();  // 2^-63

// Runs call and expects EMathError with the identifier Ident.
template <typename Call>
void ExpectRaises(TResStringId Ident, Call&& call) {
  try {
    call();
    ADD_FAILURE() << "no EMathError, expected " << ResStringName(Ident);
  } catch (const EMathError& e) {
    EXPECT_EQ(e.Ident(), Ident) << "raised " << ResStringName(e.Ident()) << ", expected "
                                << ResStringName(Ident);
  }
}

// Runs each call, expecting EMathError(Ident) from every one (a table of calls with one
// identifier).
inline void ExpectEachRaises(TResStringId Ident,
                             std::initializer_list<std::function<void()>> calls) {
  int i = 0;
  for (const auto& call : calls) {
    SCOPED_TRACE(::testing::Message() << "call " << i++ << " of the list");
    ExpectRaises(Ident, call);
  }
}

// Bitwise equality of two vectors or matrices (PackedExtended has no operator==; a NaN or a
// negative zero must come back as it was).
template <typename T>
bool SameBits(const std::vector<T>& A, const std::vector<T>& B) {
  if (A.size() != B.size()) return false;
  if constexpr (std::is_trivially_copyable_v<T>) {
    return A.empty() || std::memcmp(A.data(), B.data(), A.size() * sizeof(T)) == 0;
  } else {
    for (std::size_t i = 0; i < A.size(); ++i) {
      if (!SameBits(A[i], B[i])) return false;
    }
    return true;
  }
}

// Runs call on a copy of Operand, expecting EMathError(Ident) and the copy unchanged.
template <typename Operand, typename Call>
void ExpectRaisesUntouched(TResStringId Ident, const Operand& operand, Call&& call) {
  Operand work = operand;
  ExpectRaises(Ident, [&] { call(work); });
  EXPECT_TRUE(SameBits(work, operand)) << "operand changed by a failed call";
}

// Sets a switch (QENMatrixRectangularCheck, say) for its lifetime and restores the value it had,
// however the test ends.
template <typename Switch, typename Value>
class SwitchGuard {
 public:
  SwitchGuard(Switch& s, Value value) : switch_(s), saved_(s) { s = value; }
  ~SwitchGuard() { switch_ = saved_; }
  SwitchGuard(const SwitchGuard&) = delete;
  SwitchGuard& operator=(const SwitchGuard&) = delete;

 private:
  Switch& switch_;
  Value saved_;
};

// |actual - expected| <= bound.
inline ::testing::AssertionResult Near(Extended actual, Extended expected, Extended bound) {
  const Extended error = std::fabs(actual - expected);
  if (error <= bound) return ::testing::AssertionSuccess();
  return ::testing::AssertionFailure()
         << "actual " << static_cast<double>(actual) << " expected "
         << static_cast<double>(expected) << " error " << static_cast<double>(error) << " bound "
         << static_cast<double>(bound);
}
// |actual - expected| <= relative * |expected|.
inline ::testing::AssertionResult RelNear(Extended actual, Extended expected,
                                          Extended relative = 4e-18L) {
  return Near(actual, expected, relative * std::fabs(expected));
}
// Relative above 1, absolute below: |actual - expected| <= tolerance * max(1, |expected|).
inline ::testing::AssertionResult ScaledNear(Extended actual, Extended expected,
                                             Extended tolerance) {
  return Near(actual, expected, tolerance * std::fmax(1.0L, std::fabs(expected)));
}

// The stored element type as arithmetic sees it: PackedExtended reads as Extended.
using ::tovrin::detail::ValueOf;
template <typename T>
using Matrix = std::vector<std::vector<T>>;
// Sets QENMatrixRectangularCheck for a scope.
using MatrixSwitch = SwitchGuard<std::atomic<bool>, bool>;

// A vector of element type T from plain numbers.
template <typename T>
std::vector<T> Vec(std::initializer_list<long double> values) {
  std::vector<T> v;
  for (long double x : values) v.push_back(T(static_cast<ValueOf<T>>(x)));
  return v;
}
// A matrix of element type T from literal rows (rows may differ in length).
template <typename T>
std::vector<std::vector<T>> Mat(std::initializer_list<std::initializer_list<long double>> rows) {
  std::vector<std::vector<T>> m;
  for (const auto& row : rows) m.push_back(Vec<T>(row));
  return m;
}
// The elements as Extended, so that vectors and matrices of every type compare alike.
template <typename T>
std::vector<Extended> Values(const std::vector<T>& v) {
  std::vector<Extended> out;
  for (const T& e : v) out.push_back(static_cast<Extended>(static_cast<ValueOf<T>>(e)));
  return out;
}
template <typename T>
std::vector<std::vector<Extended>> Values(const std::vector<std::vector<T>>& m) {
  std::vector<std::vector<Extended>> out;
  for (const auto& row : m) out.push_back(Values(row));
  return out;
}
// Money values (TQENCurrency, TQENLongCurrency, Currency) from their stored integers, and back.
template <typename T>
T Money(Int64 stored) {
  return static_cast<T>(static_cast<std::underlying_type_t<T>>(stored));
}
template <typename T>
std::vector<T> MoneyVec(std::initializer_list<Int64> stored) {
  std::vector<T> v;
  for (const Int64 s : stored) v.push_back(Money<T>(s));
  return v;
}
template <typename T>
std::vector<std::vector<T>> MoneyMat(std::initializer_list<std::initializer_list<Int64>> rows) {
  std::vector<std::vector<T>> m;
  for (const auto& row : rows) m.push_back(MoneyVec<T>(row));
  return m;
}
template <typename T>
requires std::is_enum_v<T> Int64 Stored(T x) {
  return static_cast<Int64>(static_cast<std::underlying_type_t<T>>(x));
}
template <typename T>
requires std::is_enum_v<T> std::vector<Int64> Stored(const std::vector<T>& v) {
  std::vector<Int64> out;
  for (const T x : v) out.push_back(Stored(x));
  return out;
}
template <typename T>
requires std::is_enum_v<T> std::vector<std::vector<Int64>> Stored(
    const std::vector<std::vector<T>>& m) {
  std::vector<std::vector<Int64>> out;
  for (const auto& row : m) out.push_back(Stored(row));
  return out;
}

// FNV-1a over the bits of a stream of results (the 10 value bytes of an Extended, the 8 of an
// Int64), for tests that pin long runs of results to a recorded hash.
class ValueHash {
 public:
  explicit ValueHash(std::uint64_t basis = 0xCBF29CE484222325ULL) : hash_(basis) {}
  void Add(Extended x) {
    unsigned char bytes[sizeof(Extended)] = {};
    std::memcpy(bytes, &x, sizeof(Extended));
    AddBytes(bytes, 10);
  }
  void Add(Int64 k) {
    unsigned char bytes[sizeof(Int64)];
    std::memcpy(bytes, &k, sizeof(Int64));
    AddBytes(bytes, sizeof(Int64));
  }
  std::uint64_t Value() const { return hash_; }

 private:
  void AddBytes(const unsigned char* bytes, std::size_t n) {
    for (std::size_t i = 0; i < n; ++i) hash_ = (hash_ ^ bytes[i]) * 0x100000001B3ULL;
  }
  std::uint64_t hash_;
};

using Row = std::vector<Extended>;
using Rows = std::vector<Row>;

// The element-type lists of the families, for typed tests: an algorithm runs on the types whose
// rules change its result; a type rule is tested once.
using AllElements = ::testing::Types<PackedExtended, Double, Single, Int64, LongWord, LongInt, Word,
                                     SmallInt, Byte, ShortInt>;
using BuildableElements =
    ::testing::Types<PackedExtended, Double, Single, Int64, LongWord, LongInt>;
using FloatElements = ::testing::Types<PackedExtended, Double, Single>;
using ArithmeticElements = ::testing::Types<PackedExtended, Double, Single, Int64, LongInt>;
// One type for each rule: Extended, Single (its own precision), Int64, LongWord (32-bit
// unsigned wrap), LongInt (32-bit signed wrap) and Byte (widening).
using RuleElements = ::testing::Types<PackedExtended, Single, Int64, LongWord, LongInt, Byte>;
using MoneyElements = ::testing::Types<TQENCurrency, TQENLongCurrency, Currency>;

// A typed test suite Name over the element types Types.
#define TOVRIN_TYPED_SUITE(Name, Types)   \
  template <typename T>                   \
  class Name : public ::testing::Test {}; \
  TYPED_TEST_SUITE(Name, Types)

}  // namespace tovrin::testing
