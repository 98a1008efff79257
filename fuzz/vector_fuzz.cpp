// The vector families on arbitrary element types, lengths, values, indexes and constants.
// Every call either returns or raises EMathError (those documented never to raise must not);
// a call that raises leaves its operands exactly as they were (compared bit for bit, so NaN
// elements compare as themselves); const operands never change; a few cheap results are
// checked (lengths, index ranges, sorted permutations).
#include <algorithm>
#include <array>
#include <cmath>
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <functional>
#include <limits>
#include <span>
#include <type_traits>
#include <vector>

#include "fuzz/FuzzInput.h"
#include "tovrin/foundation/TOVRINErrors.h"
#include "tovrin/vector/TOVRINVector.h"

namespace {

using namespace tovrin;
using fuzzing::Expect;
using fuzzing::Fail;
using fuzzing::Input;
using fuzzing::MayRaise;
using fuzzing::NoRaise;

template <class F>
F FloatValue(Input& in) {
  using L = std::numeric_limits<F>;
  const std::uint8_t sel = in.Next();
  const F sign = (sel & 0x80) ? F(-1) : F(1);
  switch (sel % 16) {
    case 0:
      return sign * F(0);
    case 1:
      return sign;
    case 2:
      return L::quiet_NaN();
    case 3:
      return sign * L::infinity();
    case 4:
      return sign * L::denorm_min();
    case 5:
      return sign * L::max();
    case 6:
      return sign * L::min();
    case 7:
      return sign * F(5e-12L);
    case 8:
      return sign * F(5e-12L) * F(0.999L);
    case 9:
      return F(static_cast<std::int8_t>(in.Next()));
    case 10: {
      const auto num = static_cast<std::int8_t>(in.Next());
      const auto den = static_cast<std::uint8_t>(in.Next() | 1);
      return F(num) / F(den);
    }
    case 11:
      return sign * L::epsilon();
    case 12:
      return F(static_cast<std::int16_t>(in.Raw<std::uint16_t>())) * F(0.001L);
    default: {
      F v = 0;
      if constexpr (std::is_same_v<F, Extended>) {
        in.Bytes(&v, 10);  // any of the 80-bit encodings, unnormals included
      } else {
        in.Bytes(&v, sizeof v);
      }
      return v;
    }
  }
}

template <class I>
I IntValue(Input& in) {
  using L = std::numeric_limits<I>;
  const std::uint8_t sel = in.Next();
  switch (sel % 8) {
    case 0:
      return I(0);
    case 1:
      return I(1);
    case 2:
      return static_cast<I>(-1);
    case 3:
      return L::min();
    case 4:
      return L::max();
    case 5:
      return static_cast<I>(static_cast<std::int8_t>(in.Next()));
    default:
      return in.Raw<I>();
  }
}

// The value type of an element: Extended for the packed elements.
template <class E>
using ValueOf = std::conditional_t<std::is_same_v<E, PackedExtended>, Extended, E>;

template <class E>
ValueOf<E> Value(Input& in) {
  using T = ValueOf<E>;
  if constexpr (std::is_floating_point_v<T>) {
    return FloatValue<T>(in);
  } else {
    return IntValue<T>(in);
  }
}

template <class V>
V MakeVector(Input& in, std::size_t n) {
  V v(n);
  for (auto& e : v) e = Value<typename V::value_type>(in);
  return v;
}

template <class V>
bool SameBits(const V& a, const V& b) {
  return a.size() == b.size() &&
         (a.empty() || std::memcmp(a.data(), b.data(), a.size() * sizeof(a[0])) == 0);
}

// Runs a call that changes V1 (and maybe V2): an EMathError must leave both as they were.
template <class V, class F>
bool Guarded(V& v, F&& f) {
  const V before = v;
  try {
    f();
  } catch (const EMathError&) {
    Expect(SameBits(before, v));
    return false;
  }
  return true;
}

template <class V>
bool HasNaN(const V& v) {
  using T = ValueOf<typename V::value_type>;
  if constexpr (std::is_floating_point_v<T>) {
    for (const auto& e : v) {
      if (std::isnan(static_cast<T>(e))) return true;
    }
  }
  return false;
}

// The same elements in some order: compared as sorted byte strings.
template <class V>
bool SamePermutation(const V& a, const V& b) {
  using Bytes = std::array<unsigned char, sizeof(typename V::value_type)>;
  if (a.size() != b.size()) return false;
  std::vector<Bytes> x(a.size()), y(b.size());
  if (!a.empty()) std::memcpy(x.data(), a.data(), a.size() * sizeof(a[0]));
  if (!b.empty()) std::memcpy(y.data(), b.data(), b.size() * sizeof(b[0]));
  std::sort(x.begin(), x.end());
  std::sort(y.begin(), y.end());
  return x == y;
}

template <class V>
bool SortedBy(const V& v, bool ascending) {
  using T = ValueOf<typename V::value_type>;
  for (std::size_t i = 1; i < v.size(); ++i) {
    const T a = v[i - 1], b = v[i];
    if (ascending ? (b < a) : (a < b)) return false;
  }
  return true;
}

constexpr std::size_t kMaxLength = 64;

template <class V>
void Exercise(Input& in) {
  using E = typename V::value_type;
  using T = ValueOf<E>;
  constexpr bool kFloat = std::is_floating_point_v<T>;
  V a = MakeVector<V>(in, in.Next() % (kMaxLength + 1));
  const std::uint8_t second = in.Next();
  V b = MakeVector<V>(in, (second & 1) ? a.size() : second % (kMaxLength + 1));

  for (int step = 0; step < 48 && !in.Empty(); ++step) {
    const std::uint8_t op = in.Next();
    const bool flag = op & 0x80;
    const V a0 = a;
    const V b0 = b;
    switch (op % 40) {
      case 0:  // building
        if constexpr (requires(V & v, T x) { AppendValue2Vector(v, x); }) {
          const T x = Value<E>(in);
          if (a.size() < 4 * kMaxLength) {
            NoRaise([&] { AppendValue2Vector(a, x); });
            Expect(a.size() == a0.size() + 1);
          }
        }
        break;
      case 1:
        if constexpr (requires(V & v, T x) { AddValue2Vector(v, x, LongInt{}); }) {
          const T x = Value<E>(in);
          const LongInt index = IntValue<LongInt>(in);
          if (a.size() < 4 * kMaxLength) {
            NoRaise([&] { AddValue2Vector(a, x, index); });
            Expect(a.size() == a0.size() + 1);
          }
        }
        break;
      case 2:
        if constexpr (requires(V & v) { DeleteValueFromVector(v, LongInt{}); }) {
          const LongInt index = IntValue<LongInt>(in);
          NoRaise([&] { DeleteValueFromVector(a, index); });
          const bool inside = index >= 0 && static_cast<std::size_t>(index) < a0.size();
          Expect(a.size() == a0.size() - (inside ? 1 : 0));
        }
        break;
      case 3: {  // aggregates
        const bool ok = MayRaise([&] {
          (void)MaxVector(a);
          (void)MinVector(a);
          (void)SumVector(a);
          (void)SumSqVector(a);
        });
        Expect(ok == !a.empty());
        break;
      }
      case 4: {
        T mn{}, mx{};
        LongWord imn = 0, imx = 0;
        bool umn = false, umx = false;
        const bool ok = MayRaise([&] { MinMaxVector(a, mn, mx, imn, imx, umn, umx); });
        Expect(ok == !a.empty());
        if (ok) Expect(imn < a.size() && imx < a.size());
        break;
      }
      case 5:
        if constexpr (requires(const V& v) { SumSqDiffVector(v, T{}); }) {
          const T mean = Value<E>(in);
          MayRaise([&] { (void)SumSqDiffVector(a, mean); });
        }
        if constexpr (!kFloat && requires(const V& v) { SumSqDiffVector(v, Extended{}); }) {
          const Extended mean = FloatValue<Extended>(in);
          MayRaise([&] { (void)SumSqDiffVector(a, mean); });
        }
        break;
      case 6:  // predicates
        if constexpr (requires(const V& v) { VectorNonNegative(v); }) {
          const bool ok = MayRaise([&] {
            (void)VectorNonNegative(a);
            (void)VectorNegative(a);
            (void)VectorNonZero(a);
            (void)VectorZero(a);
            (void)VectorNonPositive(a);
            (void)VectorPositive(a);
          });
          Expect(ok == !a.empty());
        }
        break;
      case 7:  // in-place transforms
        if constexpr (requires(V & v) { SquareVector(v); }) {
          const bool ok = Guarded(a, [&] { SquareVector(a); });
          Expect(ok == !a0.empty());
        }
        break;
      case 8:
        if constexpr (requires(V & v) { SqrtVector(v); }) {
          const bool expected = !a0.empty() && VectorNonNegative(a0);
          Expect(Guarded(a, [&] { SqrtVector(a); }) == expected);
        }
        break;
      case 9:
        if constexpr (requires(V & v) { InvVector(v); }) {
          const bool expected = !a0.empty() && VectorNonZero(a0);
          Expect(Guarded(a, [&] { InvVector(a); }) == expected);
        }
        break;
      case 10:
        if constexpr (requires(V & v) { LnVector(v); }) {
          const bool expected = !a0.empty() && VectorPositive(a0);
          switch (in.Next() % 3) {
            case 0:
              Expect(Guarded(a, [&] { LnVector(a); }) == expected);
              break;
            case 1:
              Expect(Guarded(a, [&] { Log10Vector(a); }) == expected);
              break;
            default:
              Expect(Guarded(a, [&] { Log2Vector(a); }) == expected);
              break;
          }
        }
        break;
      case 11:
        if constexpr (requires(V & v, T x) { LinearTransformVector(v, x, x); }) {
          const T m = Value<E>(in);
          const T c = Value<E>(in);
          Expect(Guarded(a, [&] { LinearTransformVector(a, m, c); }) == !a0.empty());
        }
        break;
      case 12:
        if constexpr (kFloat && requires(V & v, std::function<T(T)> f) { TransformVector(v, f); }) {
          const std::uint8_t kind = in.Next();
          const int raise_after = kind >> 2;
          int calls = 0;
          const T k = Value<E>(in);
          auto func = [&](T x) -> T {
            if ((kind & 3) == 3 && calls++ == raise_after) detail::RaiseMathError(rsInvalidValue);
            switch (kind & 3) {
              case 0:
                return x;
              case 1:
                return x * k;
              default:
                return x + k;
            }
          };
          if (kind >= 0xF8) {
            // An empty function is refused before anything is written.
            Expect(!Guarded(a, [&] { TransformVector(a, std::function<T(T)>{}); }));
          } else if ((kind & 3) == 3) {
            if (MayRaise([&] { TransformVector(a, func); })) Expect(!a0.empty());
          } else {
            Expect(Guarded(a, [&] { TransformVector(a, func); }) == !a0.empty());
          }
        }
        break;
      case 13: {
        const T x = Value<E>(in);
        NoRaise([&] {
          if (flag) {
            ClearVector(a);
          } else {
            FillVector(a, x);
          }
        });
        Expect(a.size() == a0.size());
        break;
      }
      case 14:  // producers
        if constexpr (requires(const V& v) { MovingAverage(v, LongWord{}, LongWord{}); }) {
          const auto window = IntValue<LongWord>(in);
          const auto offset = IntValue<LongWord>(in);
          V r;
          const bool ok = MayRaise([&] { r = MovingAverage(a, window, offset); });
          Expect(ok == (!a.empty() && window != 0 && window <= a.size()));
          if (ok) Expect(r.size() == a.size());
        }
        break;
      case 15: {
        V r, c;
        NoRaise([&] {
          r = ReverseVector(a);
          c = CopyVector(a);
        });
        Expect(SameBits(c, a));
        V rr = r;
        std::reverse(rr.begin(), rr.end());
        Expect(SameBits(rr, a));
        break;
      }
      case 16:  // two vectors
        if constexpr (requires(const V& v) { AddVectors(v, v); }) {
          V r;
          const bool ok = MayRaise([&] { r = flag ? AddVectors(a, b) : SubtractVectors(a, b); });
          Expect(ok == (a.size() == b.size()));
          if (ok) Expect(r.size() == a.size());
        }
        break;
      case 17:
        if constexpr (requires(V & v) { AddToVector(v, v); }) {
          const bool ok = Guarded(a, [&] { flag ? AddToVector(a, b) : SubtractFromVector(a, b); });
          Expect(ok == (a0.size() == b.size()));
        }
        break;
      case 18:
        if constexpr (requires(const V& v) { DotProdVectors(v, v); }) {
          const bool ok = MayRaise([&] {
            (void)DotProdVectors(a, b);
            (void)SumSqDiffVectors(a, b);
          });
          Expect(ok == (a.size() == b.size() && !a.empty()));
        }
        break;
      case 19:
        NoRaise([&] {
          (void)VectorMagnitude(a);
          (void)VectorMagnitude(b);
        });
        break;
      case 20:
        if constexpr (requires(const V& v) { AngleBetweenVectors(v, v); }) {
          MayRaise([&] { (void)AngleBetweenVectors(a, flag ? a : b); });
        }
        break;
      case 21: {  // conversions
        std::vector<T> plain(a.begin(), a.end());
        TQENFloatVector f1, f2;
        NoRaise([&] {
          f1 = Array2FloatVector(std::span<const T>(plain));
          f2 = Vector2FloatVector(a);
        });
        Expect(SameBits(f1, f2) && f1.size() == a.size());
        if constexpr (requires(const V& v) { Vector2Int64Vector(v); }) {
          TQENInt64Vector i1, i2;
          NoRaise([&] {
            i1 = Array2Int64Vector(std::span<const T>(plain));
            i2 = Vector2Int64Vector(a);
          });
          Expect(SameBits(i1, i2) && i1.size() == a.size());
        }
        if constexpr (requires(const V& v) { Vector2LIntVector(v); }) {
          TQENLIntVector l1, l2;
          NoRaise([&] {
            l1 = Array2LIntVector(std::span<const T>(plain));
            l2 = Vector2LIntVector(a);
          });
          Expect(SameBits(l1, l2) && l1.size() == a.size());
        }
        break;
      }
      case 22:
        if constexpr (std::is_same_v<V, TQENFloatVector>) {
          const Extended x = FloatValue<Extended>(in);
          MayRaise([&] { (void)QENPolynomial(a, x); });
        }
        break;
      case 23: {  // sorting and ranking
        NoRaise([&] { QSortVector(a, flag); });
        Expect(SamePermutation(a, a0));
        if (!HasNaN(a0)) Expect(SortedBy(a, flag));
        break;
      }
      case 24: {
        TQENLIntVector ranks;
        NoRaise([&] { ranks = Vector2RankVector(a, flag); });
        Expect(ranks.size() == a.size());
        for (const LongInt r : ranks) Expect(r >= 0 && static_cast<std::size_t>(r) < a.size());
        break;
      }
      case 25: {
        const LongWord index =
            a.empty() || (op & 0x40) ? IntValue<LongWord>(in) : LongWord(in.Next() % a.size());
        LongInt rank = 0;
        NoRaise([&] { rank = Vector2Rank(a, index, flag); });
        Expect(rank >= -1 && rank < static_cast<LongInt>(a.size()));
        if (index >= a.size()) Expect(rank == -1);
        break;
      }
      case 26: {
        const T x = (op & 0x40) && !a.empty() ? T(a[in.Next() % a.size()]) : Value<E>(in);
        LongInt rank = 0;
        NoRaise([&] { rank = Vector2RankValue(a, x, flag); });
        Expect(rank >= -1 && rank < static_cast<LongInt>(a.size()));
        break;
      }
      case 27:  // let the second operand take the first's shape now and then
        b = flag ? a : ReverseVector(a);
        break;
      case 28:
        std::swap(a, b);
        break;
      default:  // a fresh element somewhere
        if (!a.empty()) a[in.Next() % a.size()] = Value<E>(in);
        break;
    }
    if (op % 40 != 27 && op % 40 != 28) {
      // Query-only steps must not have changed their operands; b is read-only everywhere.
      Expect(SameBits(b, b0));
      switch (op % 40) {
        case 3:
        case 4:
        case 5:
        case 6:
        case 14:
        case 15:
        case 16:
        case 18:
        case 19:
        case 20:
        case 21:
        case 22:
        case 24:
        case 25:
        case 26:
          Expect(SameBits(a, a0));
          break;
        default:
          break;
      }
    }
  }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  Input in(data, size);
  switch (in.Next() % 10) {
    case 0:
      Exercise<TQENFloatVector>(in);
      break;
    case 1:
      Exercise<TQENDoubleVector>(in);
      break;
    case 2:
      Exercise<TQENSingleVector>(in);
      break;
    case 3:
      Exercise<TQENInt64Vector>(in);
      break;
    case 4:
      Exercise<TQENLWordVector>(in);
      break;
    case 5:
      Exercise<TQENLIntVector>(in);
      break;
    case 6:
      Exercise<TQENWordVector>(in);
      break;
    case 7:
      Exercise<TQENSmallIntVector>(in);
      break;
    case 8:
      Exercise<TQENByteVector>(in);
      break;
    default:
      Exercise<TQENSIntVector>(in);
      break;
  }
  return 0;
}
