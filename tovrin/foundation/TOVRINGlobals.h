// Element types, containers and constants of tovrin.
//
// Every vector is a std::vector of one of ten element types; a matrix is a vector of rows
// that may differ in length. `Extended` is the 80-bit x87 type; inside a TQENFloatVector it
// is stored packed in exactly ten bytes (PackedExtended), so that a vector of n extended
// values occupies 10 * n bytes.
#pragma once

#include <cstdint>
#include <cstring>
#include <limits>
#include <type_traits>
#include <vector>

namespace tovrin {

static_assert(std::numeric_limits<long double>::digits == 64,
              "tovrin needs the 80-bit x87 extended type as long double");

using Extended = long double;
using Double = double;
using Single = float;
using Int64 = std::int64_t;
using LongWord = std::uint32_t;
using LongInt = std::int32_t;
using Word = std::uint16_t;
using SmallInt = std::int16_t;
using Byte = std::uint8_t;
using ShortInt = std::int8_t;

// An Extended held in exactly ten bytes. Value-initialisation gives zero; it converts to and
// from Extended implicitly, so `Extended x = V[i]` and `V[i] = x` read and write an element.
class PackedExtended {
 public:
  PackedExtended() = default;
  PackedExtended(Extended x) noexcept { std::memcpy(bytes_, &x, sizeof bytes_); }  // NOLINT
  operator Extended() const noexcept {                                             // NOLINT
    Extended x = 0;
    std::memcpy(&x, bytes_, sizeof bytes_);
    return x;
  }
  PackedExtended& operator+=(Extended x) noexcept { return *this = Extended(*this) + x; }
  PackedExtended& operator-=(Extended x) noexcept { return *this = Extended(*this) - x; }
  PackedExtended& operator*=(Extended x) noexcept { return *this = Extended(*this) * x; }
  PackedExtended& operator/=(Extended x) noexcept { return *this = Extended(*this) / x; }

 private:
  unsigned char bytes_[10];
};
static_assert(sizeof(PackedExtended) == 10 && alignof(PackedExtended) == 1);
static_assert(std::is_trivially_copyable_v<PackedExtended>);

using TQENFloatVector = std::vector<PackedExtended>;
using TQENDoubleVector = std::vector<Double>;
using TQENSingleVector = std::vector<Single>;
using TQENInt64Vector = std::vector<Int64>;
using TQENLWordVector = std::vector<LongWord>;
using TQENLIntVector = std::vector<LongInt>;
using TQENWordVector = std::vector<Word>;
using TQENSmallIntVector = std::vector<SmallInt>;
using TQENByteVector = std::vector<Byte>;
using TQENSIntVector = std::vector<ShortInt>;

using TQENFloatMatrix = std::vector<TQENFloatVector>;
using TQENDoubleMatrix = std::vector<TQENDoubleVector>;
using TQENSingleMatrix = std::vector<TQENSingleVector>;
using TQENInt64Matrix = std::vector<TQENInt64Vector>;
using TQENLWordMatrix = std::vector<TQENLWordVector>;
using TQENLIntMatrix = std::vector<TQENLIntVector>;
using TQENWordMatrix = std::vector<TQENWordVector>;
using TQENSmallIntMatrix = std::vector<TQENSmallIntVector>;
using TQENByteMatrix = std::vector<TQENByteVector>;
using TQENSIntMatrix = std::vector<TQENSIntVector>;

// Fixed-point money. Distinct types so that they overload apart from the integer vectors:
// `Currency{15000}` is the amount 1.5; `static_cast<Int64>(c)` reads the stored integer.
enum class TQENCurrency : LongInt {};    // amount x 100
enum class TQENLongCurrency : Int64 {};  // amount x 1000000
enum class Currency : Int64 {};          // amount x 10000

using TQENCurrVector = std::vector<TQENCurrency>;
using TQENLongCurrVector = std::vector<TQENLongCurrency>;
using TQENCurrencyVector = std::vector<Currency>;
using TQENCurrMatrix = std::vector<TQENCurrVector>;
using TQENLongCurrMatrix = std::vector<TQENLongCurrVector>;
using TQENCurrencyMatrix = std::vector<TQENCurrencyVector>;

inline constexpr Extended QENPi = 3.14159265358979323846264338327950288L;
inline constexpr Extended TwoPi = 6.28318530717958647692528676655900577L;
inline constexpr Extended Sqrt2 = 1.41421356237309504880168872420969808L;
inline constexpr Extended Sqrt3 = 1.73205080756887729352744634150587237L;
inline constexpr Extended Sqrt5 = 2.23606797749978969640917046790188876L;

// The comparison tolerance behind FloatIsZero and its companions and SameFloat.
inline constexpr Extended QENTolerance = 5e-12L;
// SameFloat of Double and Single values compares at a tolerance suited to their precision.
inline constexpr Double QENDoubleTolerance = 5e-12;
inline constexpr Single QENSingleTolerance = 5e-6F;

// The text shown for a missing value.
inline constexpr const char* QENNullStr = "N/A";

}  // namespace tovrin
