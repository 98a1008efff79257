// Gamma, LnGamma, Beta, IncompleteBeta and InverseIncompleteBeta beside Boost.Math at long
// double, on the argument sets of the reference table that the unit tests use. Before the timed
// runs the program prints, for each function, the largest relative error of tovrin and of Boost
// against that table (computed at 256 bits by tovrin/foundation/TOVRINMath_GammaBeta_reference.py).
//
// Boost is only a yardstick here (scripts/setup-bench.sh installs its headers); without it the
// program times tovrin alone.
#include <benchmark/benchmark.h>

#include <cmath>
#include <cstdio>
#include <exception>
#include <iterator>
#include <limits>
#include <span>
#include <vector>

#include "tovrin/foundation/TOVRINMath.h"

#ifdef TOVRIN_HAVE_BOOST
#include <boost/math/special_functions/beta.hpp>
#include <boost/math/special_functions/gamma.hpp>
#endif

namespace tovrin::testdata {
#include "tovrin/foundation/TOVRINMath_GammaBeta_reference.inc"
}  // namespace tovrin::testdata

namespace {

using tovrin::Extended;
using namespace tovrin::testdata;

#ifdef TOVRIN_HAVE_BOOST
// Errors come back as IEEE values (as tovrin's do) rather than as exceptions.
using BoostPolicy = boost::math::policies::policy<
    boost::math::policies::domain_error<boost::math::policies::ignore_error>,
    boost::math::policies::pole_error<boost::math::policies::ignore_error>,
    boost::math::policies::overflow_error<boost::math::policies::ignore_error>,
    boost::math::policies::underflow_error<boost::math::policies::ignore_error>,
    boost::math::policies::denorm_error<boost::math::policies::ignore_error>,
    boost::math::policies::evaluation_error<boost::math::policies::ignore_error>>;
#endif

// The function pairs, each taking one table row.
struct GammaOps {
  static constexpr std::span<const SpecialCase1> Table() { return kGammaTable; }
  static Extended Ours(const SpecialCase1& r) { return tovrin::Gamma(r.x); }
#ifdef TOVRIN_HAVE_BOOST
  static Extended Boost(const SpecialCase1& r) { return boost::math::tgamma(r.x, BoostPolicy()); }
#endif
};
struct LnGammaOps {
  static constexpr std::span<const SpecialCase1> Table() { return kLnGammaTable; }
  static Extended Ours(const SpecialCase1& r) { return tovrin::LnGamma(r.x); }
#ifdef TOVRIN_HAVE_BOOST
  static Extended Boost(const SpecialCase1& r) { return boost::math::lgamma(r.x, BoostPolicy()); }
#endif
};
struct BetaOps {
  static constexpr std::span<const SpecialCase2> Table() { return kBetaTable; }
  static Extended Ours(const SpecialCase2& r) { return tovrin::Beta(r.a, r.b); }
#ifdef TOVRIN_HAVE_BOOST
  static Extended Boost(const SpecialCase2& r) {
    return boost::math::beta(r.a, r.b, BoostPolicy());
  }
#endif
};
struct IncompleteBetaOps {
  static constexpr std::span<const SpecialCase3> Table() { return kIncompleteBetaTable; }
  static Extended Ours(const SpecialCase3& r) { return tovrin::IncompleteBeta(r.x, r.a, r.b); }
#ifdef TOVRIN_HAVE_BOOST
  static Extended Boost(const SpecialCase3& r) {
    try {
      return boost::math::ibeta(r.a, r.b, r.x, BoostPolicy());
    } catch (const std::exception&) {
      return std::numeric_limits<Extended>::quiet_NaN();
    }
  }
#endif
};
// The incomplete beta's table split by shape: both shapes up to 1000, and at least one above
// (the large-shape region, mostly near the mean).
std::span<const SpecialCase3> ShapeSubset(bool large) {
  static const std::vector<SpecialCase3> small_rows = [] {
    std::vector<SpecialCase3> rows;
    for (const auto& r : kIncompleteBetaTable)
      if (std::fmax(r.a, r.b) <= 1000.0L) rows.push_back(r);
    return rows;
  }();
  static const std::vector<SpecialCase3> large_rows = [] {
    std::vector<SpecialCase3> rows;
    for (const auto& r : kIncompleteBetaTable)
      if (std::fmax(r.a, r.b) > 1000.0L) rows.push_back(r);
    return rows;
  }();
  return large ? std::span<const SpecialCase3>(large_rows)
               : std::span<const SpecialCase3>(small_rows);
}
struct IncompleteBetaSmallShapesOps : IncompleteBetaOps {
  static std::span<const SpecialCase3> Table() { return ShapeSubset(false); }
};
struct IncompleteBetaLargeShapesOps : IncompleteBetaOps {
  static std::span<const SpecialCase3> Table() { return ShapeSubset(true); }
};
struct InverseIncompleteBetaOps {
  static constexpr std::span<const SpecialCase3> Table() { return kInverseIncompleteBetaTable; }
  static Extended Ours(const SpecialCase3& r) {
    return tovrin::InverseIncompleteBeta(r.x, r.a, r.b);
  }
#ifdef TOVRIN_HAVE_BOOST
  static Extended Boost(const SpecialCase3& r) {
    // Some of Boost's root finders raise whatever the policy says; count that as a NaN.
    try {
      return boost::math::ibeta_inv(r.a, r.b, r.x, BoostPolicy());
    } catch (const std::exception&) {
      return std::numeric_limits<Extended>::quiet_NaN();
    }
  }
#endif
};

Extended RelativeError(Extended got, Extended expected) {
  if (got == expected) return 0.0L;
  if (std::isnan(got)) return 1.0L;
  if (expected == 0.0L) return std::fabs(got);
  return std::fabs((got - expected) / expected);
}

// Largest relative error over the whole table and over its rows marked "ordinary" (1e-17).
template <typename Ops, typename F>
void ReportErrors(const char* name, const char* who, F call) {
  Extended worst = 0.0L;
  Extended worst_ordinary = 0.0L;
  for (const auto& row : Ops::Table()) {
    const Extended err = RelativeError(call(row), row.expected);
    if (err > worst) worst = err;
    if (row.tolerance < 1e-16L && err > worst_ordinary) worst_ordinary = err;
  }
  std::printf("| %s | %s | %zu | %.2Le | %.2Le |\n", name, who, Ops::Table().size(), worst_ordinary,
              worst);
}

// Seconds of CPU per call, printed with an SI prefix ("185n" is 185 ns).
void SetPerCallCounter(benchmark::State& state, std::size_t calls_per_iteration) {
  state.counters["per_call"] = benchmark::Counter(
      static_cast<double>(state.iterations()) * static_cast<double>(calls_per_iteration),
      benchmark::Counter::kIsRate | benchmark::Counter::kInvert);
}

template <typename Ops>
void BM_Ours(benchmark::State& state) {
  const auto table = Ops::Table();
  for (auto _ : state) {
    for (const auto& row : table) benchmark::DoNotOptimize(Ops::Ours(row));
  }
  SetPerCallCounter(state, table.size());
}

#ifdef TOVRIN_HAVE_BOOST
template <typename Ops>
void BM_Boost(benchmark::State& state) {
  const auto table = Ops::Table();
  for (auto _ : state) {
    for (const auto& row : table) benchmark::DoNotOptimize(Ops::Boost(row));
  }
  SetPerCallCounter(state, table.size());
}
#endif

#ifdef TOVRIN_HAVE_BOOST
#define TOVRIN_SPECIAL_BENCH(Ops)                \
  BENCHMARK(BM_Ours<Ops>)->Name("tovrin/" #Ops); \
  BENCHMARK(BM_Boost<Ops>)->Name("boost/" #Ops);
#else
#define TOVRIN_SPECIAL_BENCH(Ops) BENCHMARK(BM_Ours<Ops>)->Name("tovrin/" #Ops);
#endif

TOVRIN_SPECIAL_BENCH(GammaOps)
TOVRIN_SPECIAL_BENCH(LnGammaOps)
TOVRIN_SPECIAL_BENCH(BetaOps)
TOVRIN_SPECIAL_BENCH(IncompleteBetaOps)
TOVRIN_SPECIAL_BENCH(IncompleteBetaSmallShapesOps)
TOVRIN_SPECIAL_BENCH(IncompleteBetaLargeShapesOps)
TOVRIN_SPECIAL_BENCH(InverseIncompleteBetaOps)

template <typename Ops>
void ReportPair(const char* name) {
  ReportErrors<Ops>(name, "tovrin", [](const auto& row) { return Ops::Ours(row); });
#ifdef TOVRIN_HAVE_BOOST
  ReportErrors<Ops>(name, "Boost", [](const auto& row) { return Ops::Boost(row); });
#endif
}

}  // namespace

int main(int argc, char** argv) {
  std::printf("Largest relative error against the 256-bit reference table\n\n");
  std::printf("| function | library | values | ordinary rows | all rows |\n");
  std::printf("|---|---|---|---|---|\n");
  ReportPair<GammaOps>("Gamma");
  ReportPair<LnGammaOps>("LnGamma");
  ReportPair<BetaOps>("Beta");
  ReportPair<IncompleteBetaOps>("IncompleteBeta");
  ReportPair<IncompleteBetaSmallShapesOps>("IncompleteBeta, shapes <= 1000");
  ReportPair<IncompleteBetaLargeShapesOps>("IncompleteBeta, a shape > 1000");
  ReportPair<InverseIncompleteBetaOps>("InverseIncompleteBeta");
  std::printf("\n");
  benchmark::Initialize(&argc, argv);
  if (benchmark::ReportUnrecognizedArguments(argc, argv)) return 1;
  benchmark::RunSpecifiedBenchmarks();
  benchmark::Shutdown();
  return 0;
}
