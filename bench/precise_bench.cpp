// The precise distribution family beside Boost.Math's cdf, quantile and pdf at long double, on
// the rows of its reference table (tovrin/statistics/TOVRINPrecise_reference.py, mpmath at 80
// digits): one benchmark per function and side, each iteration calling the function on all of
// that function's rows. `precise_bench --accuracy` prints instead, for each function, the
// largest relative error of tovrin and of Boost on the same rows.
//
// Boost is only a yardstick here (scripts/setup-bench.sh installs its headers); without it the
// program times tovrin alone.
#include <benchmark/benchmark.h>

#include <cmath>
#include <cstdio>
#include <string>
#include <string_view>
#include <vector>

#include "tovrin/statistics/TOVRINPrecise.h"
#include "tovrin/statistics/TOVRINPrecise_testing.h"

#ifdef TOVRIN_HAVE_BOOST
// Boost 1.74's complemented F quantile trips GCC's flow analysis (a variable set on every path
// through a reference it does not follow).
#pragma GCC diagnostic ignored "-Wmaybe-uninitialized"
#include <boost/math/distributions/beta.hpp>
#include <boost/math/distributions/binomial.hpp>
#include <boost/math/distributions/chi_squared.hpp>
#include <boost/math/distributions/exponential.hpp>
#include <boost/math/distributions/fisher_f.hpp>
#include <boost/math/distributions/hypergeometric.hpp>
#include <boost/math/distributions/lognormal.hpp>
#include <boost/math/distributions/normal.hpp>
#include <boost/math/distributions/poisson.hpp>
#include <boost/math/distributions/students_t.hpp>
#include <boost/math/special_functions/gamma.hpp>
#endif

namespace {

using tovrin::Extended;
using tovrin::testing_precise::FindPreciseCall;
using tovrin::testing_precise::kPreciseCalls;
using tovrin::testing_precise::kPreciseReference;
using tovrin::testing_precise::PreciseCall;
using tovrin::testing_precise::PreciseRow;

#ifdef TOVRIN_HAVE_BOOST
namespace bm = boost::math;
namespace bp = boost::math::policies;
// Errors come back as IEEE values rather than as exceptions; no promotion beyond long double.
using Pol = bp::policy<bp::domain_error<bp::ignore_error>, bp::pole_error<bp::ignore_error>,
                       bp::overflow_error<bp::ignore_error>, bp::underflow_error<bp::ignore_error>,
                       bp::evaluation_error<bp::ignore_error>, bp::promote_float<false>,
                       bp::promote_double<false>>;
using Normal = bm::normal_distribution<Extended, Pol>;
using LogNormal = bm::lognormal_distribution<Extended, Pol>;
using Chi = bm::chi_squared_distribution<Extended, Pol>;
using FisherF = bm::fisher_f_distribution<Extended, Pol>;
using StudentT = bm::students_t_distribution<Extended, Pol>;
using Expo = bm::exponential_distribution<Extended, Pol>;
using BetaDist = bm::beta_distribution<Extended, Pol>;
using Binomial = bm::binomial_distribution<Extended, Pol>;
using Hyper = bm::hypergeometric_distribution<Extended, Pol>;
using Poisson = bm::poisson_distribution<Extended, Pol>;
using bm::complement;

#define PEER(Body) [](const Extended* a) -> Extended { return Body; }

// Boost's counterpart of each function, on the same arguments. Less of a discrete family is
// the cdf one count below; the beta interval forms are left to tovrin alone.
struct NamedPeer {
  std::string_view name;
  PreciseCall call;
};
const NamedPeer kPeers[] = {
    {"NormalZ", PEER(pdf(Normal(), a[0]))},
    {"NormalLess", PEER(cdf(Normal(), a[0]))},
    {"NormalGreater", PEER(cdf(complement(Normal(), a[0])))},
    {"InvNormalLess", PEER(quantile(Normal(), a[0]))},
    {"InvNormalGreater", PEER(quantile(complement(Normal(), a[0])))},
    {"NormalPDF", PEER(pdf(Normal(a[0], a[1]), a[2]))},
    {"NormalDistLess", PEER(cdf(Normal(a[0], a[1]), a[2]))},
    {"NormalDistGreater", PEER(cdf(complement(Normal(a[0], a[1]), a[2])))},
    {"InvNormalDistLess", PEER(quantile(Normal(a[0], a[1]), a[2]))},
    {"InvNormalDistGreater", PEER(quantile(complement(Normal(a[0], a[1]), a[2])))},
    {"LogNormalPDF", PEER(pdf(LogNormal(a[0], a[1]), a[2]))},
    {"LogNormalLess", PEER(cdf(LogNormal(a[0], a[1]), a[2]))},
    {"LogNormalGreater", PEER(cdf(complement(LogNormal(a[0], a[1]), a[2])))},
    {"InvLogNormalLess", PEER(quantile(LogNormal(a[0], a[1]), a[2]))},
    {"InvLogNormalGreater", PEER(quantile(complement(LogNormal(a[0], a[1]), a[2])))},
    {"IncompleteGamma", PEER(bm::gamma_p(a[0], a[1], Pol()))},
    {"IncompleteGammaUpper", PEER(bm::gamma_q(a[0], a[1], Pol()))},
    {"ChiSquareLess", PEER(cdf(Chi(a[1]), a[0]))},
    {"ChiSquareGreater", PEER(cdf(complement(Chi(a[1]), a[0])))},
    {"InvChiSquareLess", PEER(quantile(Chi(a[1]), a[0]))},
    {"InvChiSquareGreater", PEER(quantile(complement(Chi(a[1]), a[0])))},
    {"ChiSquarePDF", PEER(pdf(Chi(a[1]), a[0]))},
    {"FDistLess", PEER(cdf(FisherF(a[1], a[2]), a[0]))},
    {"FDistGreater", PEER(cdf(complement(FisherF(a[1], a[2]), a[0])))},
    {"InvFDistLess", PEER(quantile(FisherF(a[1], a[2]), a[0]))},
    {"InvFDistGreater", PEER(quantile(complement(FisherF(a[1], a[2]), a[0])))},
    {"FDistPDF", PEER(pdf(FisherF(a[1], a[2]), a[0]))},
    {"StudentTLess", PEER(cdf(StudentT(a[1]), a[0]))},
    {"StudentTGreater", PEER(cdf(complement(StudentT(a[1]), a[0])))},
    {"InvStudentTLess", PEER(quantile(StudentT(a[1]), a[0]))},
    {"InvStudentTGreater", PEER(quantile(complement(StudentT(a[1]), a[0])))},
    {"StudentTPDF", PEER(pdf(StudentT(a[1]), a[0]))},
    {"ExponentialLess", PEER(cdf(Expo(1 / a[0]), a[1]))},
    {"ExponentialGreater", PEER(cdf(complement(Expo(1 / a[0]), a[1])))},
    {"ExponentialPDF", PEER(pdf(Expo(1 / a[1]), a[0]))},
    {"BetaDistLess", PEER(a[3] == a[4] ? cdf(BetaDist(a[1], a[2]), a[0]) : NAN)},
    {"BetaDistGreater", PEER(a[3] == a[4] ? cdf(complement(BetaDist(a[1], a[2]), a[0])) : NAN)},
    {"InvBetaDistLess", PEER(quantile(BetaDist(a[1], a[2]), a[0]))},
    {"InvBetaDistGreater", PEER(quantile(complement(BetaDist(a[1], a[2]), a[0])))},
    {"BetaPDF", PEER(a[3] == a[4] ? pdf(BetaDist(a[1], a[2]), a[0]) : NAN)},
    {"BinomialEq", PEER(pdf(Binomial(a[1], a[0]), a[2]))},
    {"BinomialLess", PEER(a[2] == 0 ? 0 : cdf(Binomial(a[1], a[0]), a[2] - 1))},
    {"BinomialGreater", PEER(cdf(complement(Binomial(a[1], a[0]), a[2])))},
    {"HyperGeometricEq", PEER(pdf(Hyper(static_cast<unsigned>(a[2]), static_cast<unsigned>(a[1]),
                                        static_cast<unsigned>(a[0])),
                                  static_cast<unsigned>(a[3])))},
    {"HyperGeometricLess",
     PEER(a[3] == 0 ? 0
                    : cdf(Hyper(static_cast<unsigned>(a[2]), static_cast<unsigned>(a[1]),
                                static_cast<unsigned>(a[0])),
                          static_cast<unsigned>(a[3]) - 1))},
    {"HyperGeometricGreater",
     PEER(cdf(complement(Hyper(static_cast<unsigned>(a[2]), static_cast<unsigned>(a[1]),
                               static_cast<unsigned>(a[0])),
                         static_cast<unsigned>(a[3]))))},
    {"PoissonEq", PEER(pdf(Poisson(a[0]), a[1]))},
    {"PoissonLess", PEER(a[1] == 0 ? 0 : cdf(Poisson(a[0]), a[1] - 1))},
    {"PoissonGreater", PEER(cdf(complement(Poisson(a[0]), a[1])))},
};

PreciseCall FindPeer(std::string_view name) {
  for (const NamedPeer& p : kPeers) {
    if (p.name == name) return p.call;
  }
  return nullptr;
}

// A Boost call that raises (a few argument sets lie outside what its distributions accept)
// counts as NaN.
Extended CallPeer(PreciseCall peer, const Extended* args) {
  try {
    return peer(args);
  } catch (...) {
    return NAN;
  }
}
#endif

std::vector<const PreciseRow*> RowsOf(std::string_view name) {
  std::vector<const PreciseRow*> rows;
  for (const PreciseRow& r : kPreciseReference) {
    if (name == r.name) rows.push_back(&r);
  }
  return rows;
}

Extended RelativeError(Extended value, Extended expected) {
  if (std::isnan(value)) return INFINITY;
  if (std::fabs(expected) < 3.4e-4932L) return std::fabs(value - expected);
  return std::fabs(value / expected - 1);
}

void RunRows(benchmark::State& state, PreciseCall call, const std::vector<const PreciseRow*>& rows,
             bool guarded) {
  for (auto _ : state) {
    for (const PreciseRow* r : rows) {
      Extended v;
#ifdef TOVRIN_HAVE_BOOST
      v = guarded ? CallPeer(call, r->args) : call(r->args);
#else
      (void)guarded;
      v = call(r->args);
#endif
      benchmark::DoNotOptimize(v);
    }
  }
  state.counters["per_call"] = benchmark::Counter(
      static_cast<double>(rows.size()),
      benchmark::Counter::kIsIterationInvariantRate | benchmark::Counter::kInvert);
}

void RegisterAll() {
  for (const auto& c : kPreciseCalls) {
    const auto rows = RowsOf(c.name);
    if (rows.empty()) continue;
    benchmark::RegisterBenchmark(
        ("Precise/" + std::string(c.name)).c_str(),
        [call = c.call, rows](benchmark::State& s) { RunRows(s, call, rows, false); });
#ifdef TOVRIN_HAVE_BOOST
    if (const PreciseCall peer = FindPeer(c.name)) {
      benchmark::RegisterBenchmark(
          ("Boost/" + std::string(c.name)).c_str(),
          [peer, rows](benchmark::State& s) { RunRows(s, peer, rows, true); });
    }
#endif
  }
}

// The cost against the size of the count: the binomial and Poisson Less at the mean, for
// N (or the mean) 10^3, 10^6 and 10^9.
void RegisterScaling() {
  for (const Extended n : {1e3L, 1e6L, 1e9L}) {
    const auto count = static_cast<tovrin::LongWord>(n);
    const auto cut = static_cast<tovrin::LongWord>(0.3L * n);
    const std::string size = std::to_string(count);
    benchmark::RegisterBenchmark(
        ("Scaling/Precise/BinomialLess/" + size).c_str(), [count, cut](benchmark::State& s) {
          for (auto _ : s) {
            benchmark::DoNotOptimize(tovrin::precise::BinomialLess(0.3L, count, cut));
          }
        });
    benchmark::RegisterBenchmark(
        ("Scaling/Precise/PoissonLess/" + size).c_str(), [n, count](benchmark::State& s) {
          for (auto _ : s) {
            benchmark::DoNotOptimize(tovrin::precise::PoissonLess(n, count));
          }
        });
#ifdef TOVRIN_HAVE_BOOST
    benchmark::RegisterBenchmark(("Scaling/Boost/BinomialLess/" + size).c_str(),
                                 [n, cut](benchmark::State& s) {
                                   for (auto _ : s) {
                                     benchmark::DoNotOptimize(cdf(Binomial(n, 0.3L), cut - 1.0L));
                                   }
                                 });
    benchmark::RegisterBenchmark(("Scaling/Boost/PoissonLess/" + size).c_str(),
                                 [n](benchmark::State& s) {
                                   for (auto _ : s) {
                                     benchmark::DoNotOptimize(cdf(Poisson(n), n - 1));
                                   }
                                 });
#endif
  }
}

// One Markdown row per function: rows, tovrin's and Boost's largest relative error, and how
// many rows each gets within 1e-17 (1e-16 for the inverses). Boost is not asked for the beta
// rows on an interval.
void PrintAccuracy() {
  std::printf(
      "| Function | Rows | tovrin max rel. error | within goal | Boost max rel. error | "
      "within goal |\n|---|---:|---:|---:|---:|---:|\n");
  for (const auto& c : kPreciseCalls) {
    const auto rows = RowsOf(c.name);
    if (rows.empty()) continue;
    const Extended goal = tovrin::testing_precise::IsInverse(c.name) ? 1e-16L : 1e-17L;
    Extended ours = 0, peer = 0;
    int ours_ok = 0, peer_ok = 0, peer_rows = 0;
    for (const PreciseRow* r : rows) {
      const Extended e = RelativeError(c.call(r->args), r->expected);
      ours = std::fmax(ours, e);
      ours_ok += e <= goal;
#ifdef TOVRIN_HAVE_BOOST
      // The beta on an interval: tovrin only.
      const bool interval = c.name.starts_with("Beta") && r->args[3] != r->args[4];
      if (const PreciseCall p = FindPeer(c.name); p != nullptr && !interval) {
        const Extended pe = RelativeError(CallPeer(p, r->args), r->expected);
        peer = std::fmax(peer, pe);
        peer_ok += pe <= goal;
        ++peer_rows;
      }
#endif
    }
    std::printf("| `%s` | %zu | %.1Le | %d | %.1Le | %d of %d |\n", std::string(c.name).c_str(),
                rows.size(), ours, ours_ok, peer_rows ? peer : static_cast<Extended>(NAN), peer_ok,
                peer_rows);
  }
}

}  // namespace

int main(int argc, char** argv) {
  if (argc > 1 && std::string_view(argv[1]) == "--accuracy") {
    PrintAccuracy();
    return 0;
  }
  RegisterAll();
  RegisterScaling();
  benchmark::Initialize(&argc, argv);
  benchmark::RunSpecifiedBenchmarks();
  benchmark::Shutdown();
  return 0;
}
