// Integer arithmetic that wraps. It is done in unsigned types and converted back, so no signed
// overflow ever happens.
#pragma once

#include <cstdint>
#include <functional>
#include <type_traits>

#include "tovrin/foundation/TOVRINGlobals.h"

namespace tovrin::detail {

// Op(a, b) with two's-complement wrap-around at the width of S: worked in the unsigned type
// of that width and converted back.
template <typename S, typename Op>
constexpr S Wrapping(S a, S b, Op op) {
  using U = std::make_unsigned_t<S>;
  return static_cast<S>(op(static_cast<U>(a), static_cast<U>(b)));
}

// Two's-complement wrapping on Int64.
constexpr Int64 WrappingAdd64(Int64 a, Int64 b) { return Wrapping(a, b, std::plus<>{}); }
constexpr Int64 WrappingSub64(Int64 a, Int64 b) { return Wrapping(a, b, std::minus<>{}); }
constexpr Int64 WrappingMul64(Int64 a, Int64 b) { return Wrapping(a, b, std::multiplies<>{}); }

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
constexpr LongInt WrappingAdd32(LongInt a, LongInt b) { return Wrapping(a, b, std::plus<>{}); }
constexpr LongInt WrappingSub32(LongInt a, LongInt b) { return Wrapping(a, b, std::minus<>{}); }
constexpr LongInt WrappingMul32(LongInt a, LongInt b) {
  return Wrapping(a, b, std::multiplies<>{});
}

}  // namespace tovrin::detail
