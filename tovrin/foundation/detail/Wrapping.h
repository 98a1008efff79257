// Integer arithmetic that wraps. It is done in unsigned types and converted back, so no signed
// overflow ever happens.
#pragma once

#include <cstdint>

#include "tovrin/foundation/TOVRINGlobals.h"

namespace tovrin::detail {

// Two's-complement wrapping on Int64.
constexpr Int64 WrappingAdd64(Int64 a, Int64 b) {
  return static_cast<Int64>(static_cast<std::uint64_t>(a) + static_cast<std::uint64_t>(b));
}
constexpr Int64 WrappingSub64(Int64 a, Int64 b) {
  return static_cast<Int64>(static_cast<std::uint64_t>(a) - static_cast<std::uint64_t>(b));
}
constexpr Int64 WrappingMul64(Int64 a, Int64 b) {
  return static_cast<Int64>(static_cast<std::uint64_t>(a) * static_cast<std::uint64_t>(b));
}

// The low 32 bits of x * x taken as a LongInt and sign-extended (the square of LongInt,
// SmallInt, ShortInt, Word and Byte elements).
constexpr Int64 WrappingSquare32(Int64 x) {
  // The low 32 bits of the square depend only on the low 32 bits of x, so a 32-bit unsigned
  // product gives them (and vectorises as well as a plain loop).
  const auto low = static_cast<std::uint32_t>(x);
  return static_cast<LongInt>(low * low);
}
// The low 32 bits of x * x taken as a LongWord and zero-extended (the LongWord square).
constexpr Int64 WrappingSquareU32(LongWord x) {
  return static_cast<Int64>(static_cast<std::uint32_t>(static_cast<std::uint64_t>(x) * x));
}

// 32-bit wrapping sums, differences and products.
constexpr LongInt WrappingAdd32(LongInt a, LongInt b) {
  return static_cast<LongInt>(static_cast<std::uint32_t>(a) + static_cast<std::uint32_t>(b));
}
constexpr LongInt WrappingSub32(LongInt a, LongInt b) {
  return static_cast<LongInt>(static_cast<std::uint32_t>(a) - static_cast<std::uint32_t>(b));
}
constexpr LongInt WrappingMul32(LongInt a, LongInt b) {
  return static_cast<LongInt>(static_cast<std::uint32_t>(a) * static_cast<std::uint32_t>(b));
}

}  // namespace tovrin::detail
