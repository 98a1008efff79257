// The matrix families on arbitrary (ragged) shapes, element values, indexes and constants,
// with QENMatrixRectangularCheck on and off. Every call either returns or raises EMathError
// (EAccessViolation only where documented: the two-matrix sums and differences with an M1
// without rows); a raising call leaves its operands exactly as they were, except the
// element-wise functions, which stop where an element fails; const operands never change.
#include <algorithm>
#include <cmath>
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <limits>
#include <type_traits>
#include <vector>

#include "fuzz/FuzzInput.h"
#include "tovrin/foundation/TOVRINErrors.h"
#include "tovrin/matrix/TOVRINMatrix.h"

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
    case 10:
    case 11:
      return F(static_cast<std::int8_t>(in.Next()) % 8);
    case 12: {
      const auto num = static_cast<std::int8_t>(in.Next());
      const auto den = static_cast<std::uint8_t>(in.Next() | 1);
      return F(num) / F(den);
    }
    default: {
      F v = 0;
      if constexpr (std::is_same_v<F, Extended>) {
        in.Bytes(&v, 10);
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

// An index: mostly a small one near the shape, now and then anything.
LongWord Index(Input& in) {
  const std::uint8_t sel = in.Next();
  if (sel < 224) return sel % 10;
  return IntValue<LongWord>(in);
}

constexpr std::size_t kMaxSide = 8;

template <class M>
M MakeMatrix(Input& in) {
  using E = typename M::value_type::value_type;
  const std::uint8_t shape = in.Next();
  const std::size_t rows = shape % (kMaxSide + 1);
  const bool ragged = (shape & 0xC0) == 0xC0;
  const std::size_t cols = in.Next() % (kMaxSide + 1);
  M m(rows);
  for (auto& row : m) {
    row.resize(ragged ? in.Next() % (kMaxSide + 1) : cols);
    for (auto& e : row) e = Value<E>(in);
  }
  return m;
}

template <class V>
bool SameBits(const V& a, const V& b) {
  return a.size() == b.size() &&
         (a.empty() || std::memcmp(a.data(), b.data(), a.size() * sizeof(a[0])) == 0);
}

template <class M>
bool SameMatrix(const M& a, const M& b) {
  if (a.size() != b.size()) return false;
  for (std::size_t i = 0; i < a.size(); ++i) {
    if (!SameBits(a[i], b[i])) return false;
  }
  return true;
}

template <class M>
std::size_t ElementCount(const M& m) {
  std::size_t n = 0;
  for (const auto& row : m) n += row.size();
  return n;
}

// A call that changes its operands: an EMathError must leave them as they were.
template <class M, class F>
bool Guarded(M& m, F&& f) {
  const M before = m;
  try {
    f();
  } catch (const EMathError&) {
    Expect(SameMatrix(before, m));
    return false;
  }
  return true;
}

// Restores the shape switch whatever happens.
struct SwitchGuard {
  explicit SwitchGuard(bool on) { QENMatrixRectangularCheck = on; }
  ~SwitchGuard() { QENMatrixRectangularCheck = true; }
};

template <class M>
void Exercise(Input& in) {
  using V = typename M::value_type;
  using E = typename V::value_type;
  using T = ValueOf<E>;
  constexpr bool kFloat = std::is_floating_point_v<T>;
  // The scalar the arithmetic takes: Extended for the float types.
  using K = std::conditional_t<kFloat, Extended, T>;
  auto Scalar = [&in]() -> K {
    if constexpr (kFloat) {
      return FloatValue<Extended>(in);
    } else {
      return IntValue<K>(in);
    }
  };

  M a = MakeMatrix<M>(in);
  M b = MakeMatrix<M>(in);

  for (int step = 0; step < 32 && !in.Empty(); ++step) {
    const std::uint8_t op = in.Next();
    const bool flag = op & 0x80;
    SwitchGuard on(!(op & 0x40));
    const M a0 = a;
    const M b0 = b;
    bool a_const = true;
    switch (op % 40) {
      case 0: {  // creation
        const LongWord rows = in.Next() % (kMaxSide + 1);
        const LongWord cols = in.Next() % (kMaxSide + 1);
        NoRaise([&] {
          TQENFloatMatrix f = CreateFloatMatrix(rows, cols);
          Expect(f.size() == rows && ElementCount(f) == rows * cols);
          TQENSIntMatrix s = CreateSIntIdentityMatrix(rows);
          Expect(s.size() == rows);
          TQENDoubleMatrix d = CreateDoubleIdentityMatrix(cols);
          Expect(cols == 0 || MatrixIsIdentity(d));
          (void)CreateByteMatrix(rows, cols);
          (void)CreateLWordIdentityMatrix(rows);
        });
        break;
      }
      case 1: {  // shape queries
        NoRaise([&] {
          (void)MatrixRows(a);
          (void)MatrixCols(a);
          (void)MatrixIsRectangular(a);
          LongWord r = 0, c = 0;
          bool rect = false;
          MatrixDimensions(a, r, c, rect);
          (void)MatrixIsSquare(a);
          (void)MatricesSameDimensions(a, b);
        });
        break;
      }
      case 2: {
        TQENFloatMatrix f;
        NoRaise([&] { f = Matrix2FloatMatrix(a); });
        Expect(f.size() == a.size());
        for (std::size_t i = 0; i < a.size(); ++i) Expect(f[i].size() == a[i].size());
        break;
      }
      case 3:  // two-matrix arithmetic
        if constexpr (requires(const M& m) { AddMatrices(m, m); }) {
          M r;
          try {
            r = flag ? AddMatrices(a, b) : SubtractMatrices(a, b);
          } catch (const EMathError&) {
          } catch (const EAccessViolation&) {
            Expect(a.empty());
          }
        }
        break;
      case 4:
        if constexpr (requires(M & m) { AddToMatrix(m, m); }) {
          a_const = false;
          const M before = a;
          try {
            flag ? AddToMatrix(a, b) : SubtractFromMatrix(a, b);
          } catch (const EMathError&) {
            Expect(SameMatrix(before, a));
          } catch (const EAccessViolation&) {
            Expect(a0.empty() && SameMatrix(before, a));
          }
        }
        break;
      case 5:  // scalar arithmetic
        if constexpr (requires(const M& m, K k) { MultiplyMatrixByConst(m, k); }) {
          const K k = Scalar();
          M r;
          const bool ok = MayRaise([&] { r = MultiplyMatrixByConst(a, k); });
          Expect(ok == !a.empty());
          if (ok) {
            Expect(r.size() == a.size());
            for (std::size_t i = 0; i < a.size(); ++i) Expect(r[i].size() == a[i].size());
          }
        }
        break;
      case 6:
        if constexpr (requires(M & m, K k) { MultiplyMatrixByConst2(m, k); }) {
          a_const = false;
          const K k = Scalar();
          const K c = Scalar();
          if (flag) {
            Expect(Guarded(a, [&] { MultiplyMatrixByConst2(a, k); }) == !a0.empty());
          } else {
            Expect(Guarded(a, [&] { LinearTransformMatrix(a, k, c); }) == !a0.empty());
          }
        }
        break;
      case 7:  // element-wise: may stop half way, so only the raise condition is checked
        if constexpr (requires(M & m) { SqrtMatrix(m); }) {
          a_const = false;
          const int which = in.Next() % 5;
          bool bad = false;
          for (const auto& row : a0) {
            for (const auto& e : row) {
              const Extended x = T(e);
              if ((which == 1 && x < 0) || (which == 2 && x == 0) || (which >= 3 && x <= 0)) {
                bad = true;
              }
            }
          }
          const bool ok = MayRaise([&] {
            switch (which) {
              case 0:
                SquareMatrix(a);
                break;
              case 1:
                SqrtMatrix(a);
                break;
              case 2:
                InvMatrix(a);
                break;
              case 3:
                LnMatrix(a);
                break;
              default:
                Log10Matrix(a);
                break;
            }
          });
          Expect(ok == (!a0.empty() && !bad));
          Expect(a.size() == a0.size());
          for (std::size_t i = 0; i < a.size(); ++i) Expect(a[i].size() == a0[i].size());
        }
        break;
      case 8:
        if constexpr (requires(const M& m, LongWord& n) { GrandMean(m, n); }) {
          LongWord n = 0;
          const bool ok = MayRaise([&] { (void)GrandMean(a, n); });
          Expect(ok == (ElementCount(a) != 0));
          if (ok) Expect(n == ElementCount(a));
        }
        break;
      case 9: {  // row and column operations
        a_const = false;
        const LongWord i = Index(in), j = Index(in);
        if (flag) {
          Guarded(a, [&] { SwapMatrixRows(a, i, j); });
        } else {
          Guarded(a, [&] { SwapMatrixCols(a, i, j); });
        }
        break;
      }
      case 10:
        if constexpr (requires(M & m, K k) { ScaleMatrixRow(m, LongWord{}, k); }) {
          a_const = false;
          const LongWord i = Index(in);
          const K k = Scalar();
          if (flag) {
            Guarded(a, [&] { ScaleMatrixRow(a, i, k); });
          } else {
            Guarded(a, [&] { ScaleMatrixCol(a, i, k); });
          }
        }
        break;
      case 11:
        if constexpr (requires(M & m, K k) { AddMatrixRows(m, LongWord{}, LongWord{}, k); }) {
          a_const = false;
          const LongWord i = Index(in), j = Index(in);
          const K k = Scalar();
          if (flag) {
            Guarded(a, [&] { AddMatrixRows(a, i, j, k); });
          } else {
            Guarded(a, [&] { AddMatrixCols(a, i, j, k); });
          }
        }
        break;
      case 12: {
        a_const = false;
        const LongWord i = Index(in);
        const bool ascending = in.Next() & 1;
        if (flag) {
          Guarded(a, [&] { QSortMatrixRowsOnCol(a, i, ascending); });
        } else {
          Guarded(a, [&] { QSortMatrixColsOnRow(a, i, ascending); });
        }
        break;
      }
      case 13: {
        const LongWord i = Index(in);
        V r;
        if (flag) {
          MayRaise([&] { r = ExtractMatrixRow(a, i); });
        } else {
          MayRaise([&] { r = ExtractMatrixCol(a, i); });
        }
        break;
      }
      case 14: {
        a_const = false;
        const LongWord i = Index(in);
        V v(in.Next() % (kMaxSide + 2));
        for (auto& e : v) e = Value<E>(in);
        const T fill = Value<E>(in);
        if (flag) {
          Guarded(a, [&] { OverwriteMatrixRow(a, i, v, fill); });
        } else {
          Guarded(a, [&] { OverwriteMatrixCol(a, i, v, fill); });
        }
        break;
      }
      case 15: {
        M c;
        NoRaise([&] { c = CopyMatrix(a); });
        Expect(SameMatrix(c, a));
        break;
      }
      case 16: {
        M t;
        if (MayRaise([&] { t = TransposeMatrix(a); })) {
          if (!a.empty()) {
            Expect(t.size() == a[0].size());
            for (const auto& row : t) Expect(row.size() == a.size());
          }
        }
        break;
      }
      case 17:
        if constexpr (requires(const M& m) { MultiplyMatrices(m, m); }) {
          M r;
          MayRaise([&] { r = MultiplyMatrices(a, flag ? b : TransposeMatrix(a)); });
        }
        break;
      case 18:
        if constexpr (requires(const M& m) { SumMatrixRow(m, LongWord{}); }) {
          const LongWord i = Index(in);
          MayRaise([&] { (void)(flag ? SumMatrixRow(a, i) : SumMatrixCol(a, i)); });
        }
        break;
      case 19:  // row reduction
        if constexpr (requires(M & m) { RowEchelonForm(m); }) {
          a_const = false;
          if (flag) {
            Guarded(a, [&] { RowEchelonForm(a); });
          } else {
            LongWord rank = 0;
            if (Guarded(a, [&] { RowEchelonFormRank(a, rank); })) Expect(rank <= a.size());
          }
        }
        break;
      case 20:
        if constexpr (requires(M & m) { MatrixInverse(m, m); }) {
          a_const = false;
          M inverse = b;
          const M inverse0 = inverse;
          try {
            (void)MatrixInverse(a, inverse);
          } catch (const EMathError&) {
            Expect(SameMatrix(a, a0) && SameMatrix(inverse, inverse0));
          }
        }
        break;
      case 21:
        if constexpr (requires(M & m) { MatrixDeterminant(m); }) {
          a_const = false;
          Guarded(a, [&] { (void)MatrixDeterminant(a); });
        }
        break;
      case 22:
        if constexpr (requires(const M& m) { MatrixZeroRows(m); }) {
          LongWord zero = 0;
          if (MayRaise([&] { zero = MatrixZeroRows(a); })) Expect(zero <= a.size());
          MayRaise([&] { (void)MatrixIsIdentity(a); });
        }
        break;
      case 23:  // now and then a square, well-conditioned start for the reductions
        if (a.empty() || flag) {
          const std::size_t n = in.Next() % (kMaxSide + 1);
          a.assign(n, V(n));
          for (std::size_t i = 0; i < n; ++i) {
            for (std::size_t j = 0; j < n; ++j)
              a[i][j] = T(static_cast<std::int8_t>(in.Next()) % 5);
          }
        }
        a_const = false;
        break;
      case 24:
        b = flag ? a : M(a.begin(), a.end());
        if (!b.empty() && !flag) std::reverse(b.begin(), b.end());
        break;
      case 25:
        std::swap(a, b);
        break;
      case 26:  // a row of another length
        a_const = false;
        if (!a.empty()) a[in.Next() % a.size()].resize(in.Next() % (kMaxSide + 1));
        break;
      default:
        a_const = false;
        if (!a.empty()) {
          auto& row = a[in.Next() % a.size()];
          if (!row.empty()) row[in.Next() % row.size()] = Value<E>(in);
        }
        break;
    }
    if (op % 40 != 24 && op % 40 != 25) {
      Expect(SameMatrix(b, b0));
      if (a_const) Expect(SameMatrix(a, a0));
    }
  }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  Input in(data, size);
  switch (in.Next() % 10) {
    case 0:
      Exercise<TQENFloatMatrix>(in);
      break;
    case 1:
      Exercise<TQENDoubleMatrix>(in);
      break;
    case 2:
      Exercise<TQENSingleMatrix>(in);
      break;
    case 3:
      Exercise<TQENInt64Matrix>(in);
      break;
    case 4:
      Exercise<TQENLWordMatrix>(in);
      break;
    case 5:
      Exercise<TQENLIntMatrix>(in);
      break;
    case 6:
      Exercise<TQENWordMatrix>(in);
      break;
    case 7:
      Exercise<TQENSmallIntMatrix>(in);
      break;
    case 8:
      Exercise<TQENByteMatrix>(in);
      break;
    default:
      Exercise<TQENSIntMatrix>(in);
      break;
  }
  return 0;
}
