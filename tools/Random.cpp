// tovrin random: variates of the library's random generators.
#include <array>
#include <cstdint>
#include <limits>
#include <string>
#include <string_view>

#include "tools/CommandLine.h"
#include "tools/Registry.h"
#include "tools/Subcommands.h"
#include "tovrin/tovrin.h"

namespace tovrin::cli {
namespace {

using E = Extended;

constexpr std::string_view kHelp =
    "Usage: tovrin random GENERATOR [PARAM...] [--count N] [--seed S]\n"
    "       tovrin random --list\n"
    "\n"
    "Prints N variates (default 1) of the library's generator GENERATOR (its exact name),\n"
    "one per line; real values with 21 significant digits. The same seed gives the same\n"
    "output; without --seed the source is seeded from the clock.\n"
    "\n"
    "Examples:\n"
    "  tovrin random Random_Normal --count 3 --seed 42\n"
    "  tovrin random Random_Gamma 2.5\n"
    "  tovrin random Random_Binomial2 100 0.3 --count 10\n"
    "  tovrin random Random_MVNorm 0 0 1 0.5 1 --count 2\n"
    "    (n means, then the n(n+1)/2 upper-triangle covariances packed column by column;\n"
    "     each variate is one line of n values)\n"
    "\n"
    "Options:\n"
    "  --count N   number of variates (default 1)\n"
    "  --seed S    seed of the uniform source, 0 to 18446744073709551615\n"
    "  --list      list the generators with their parameter names\n"
    "  --help      show this help\n";

// The n with n + n(n + 1)/2 = Count (means and packed covariance), or 0 when none fits.
std::size_t MVNormDimension(std::size_t Count) {
  for (std::size_t n = 1; n + n * (n + 1) / 2 <= Count; ++n) {
    if (n + n * (n + 1) / 2 == Count) return n;
  }
  return 0;
}

void AddMVNorm(CallableTable& t) {
  auto generate = [](auto& means, auto& covariance, auto& factor, auto& variate,
                     auto& error_code) -> decltype(Random_MVNorm(means, covariance, factor, variate,
                                                                 error_code)) {
    return Random_MVNorm(means, covariance, factor, variate, error_code);
  };
  using V = TQENFloatVector;
  if constexpr (std::is_invocable_v<decltype(generate), const V&, const V&, V&, V&, LongInt&>) {
    AddVariadic(t, "Random_MVNorm", {"Means", "Covariance"},
                [generate](std::span<const std::string> text) -> std::function<std::string()> {
                  const std::size_t n = MVNormDimension(text.size());
                  if (n == 0) {
                    throw UsageError(
                        "Random_MVNorm takes n means and then n(n+1)/2 covariances "
                        "(2, 5, 9, 14, ... parameters)");
                  }
                  V means(n), covariance(text.size() - n);
                  for (std::size_t i = 0; i < text.size(); ++i) {
                    const Extended value = ParseRealArgument(
                        text[i], i < n ? "mean " + std::to_string(i + 1)
                                       : "covariance " + std::to_string(i - n + 1));
                    (i < n ? means[i] : covariance[i - n]) = value;
                  }
                  return [generate, means, covariance]() {
                    V factor, variate;
                    LongInt error_code = 0;
                    generate(means, covariance, factor, variate, error_code);
                    if (error_code != 0) {
                      throw InputError("Random_MVNorm: the covariance is not positive definite");
                    }
                    std::string line;
                    for (std::size_t i = 0; i < variate.size(); ++i) {
                      if (i != 0) line += ' ';
                      line += FormatSignificant(variate[i]);
                    }
                    return line;
                  };
                });
  }
}

const CallableTable& RandomTable() {
  static const CallableTable table = [] {
    CallableTable t;
    AddScalar<>(t, "VerdanRandom", {}, TOVRIN_CALLABLE(VerdanRandom));
    AddScalar<>(t, "Random_Normal", {}, TOVRIN_CALLABLE(Random_Normal));
    AddScalar<E, E>(t, "Random_Normal", {"Mean", "StdDev"}, TOVRIN_CALLABLE(Random_Normal));
    AddScalar<E, E>(t, "Random_LogNormal", {"Mean", "StdDev"}, TOVRIN_CALLABLE(Random_LogNormal));
    AddScalar<E>(t, "Random_Gamma", {"Shape"}, TOVRIN_CALLABLE(Random_Gamma));
    AddScalar<LongInt>(t, "Random_ChiSq", {"DF"}, TOVRIN_CALLABLE(Random_ChiSq));
    AddScalar<>(t, "Random_Exponential", {}, TOVRIN_CALLABLE(Random_Exponential));
    AddScalar<E>(t, "Random_Weibull", {"Shape"}, TOVRIN_CALLABLE(Random_Weibull));
    AddScalar<E, E>(t, "Random_Beta", {"A", "B"}, TOVRIN_CALLABLE(Random_Beta));
    AddScalar<LongInt>(t, "Random_T", {"DF"}, TOVRIN_CALLABLE(Random_T));
    AddMVNorm(t);
    AddScalar<E, E>(t, "Random_Inv_Gauss", {"Lambda", "Omega"}, TOVRIN_CALLABLE(Random_Inv_Gauss));
    AddScalar<LongInt, E>(t, "Random_Binomial1", {"N", "P"}, TOVRIN_CALLABLE(Random_Binomial1));
    AddScalar<Int64, E>(t, "Random_Binomial2", {"N", "P"}, TOVRIN_CALLABLE(Random_Binomial2));
    AddScalar<E, E>(t, "Random_Neg_Binomial", {"R", "P"}, TOVRIN_CALLABLE(Random_Neg_Binomial));
    AddScalar<E>(t, "Random_von_Mises", {"K"}, TOVRIN_CALLABLE(Random_von_Mises));
    AddScalar<>(t, "Random_Cauchy", {}, TOVRIN_CALLABLE(Random_Cauchy));
    AddScalar<E>(t, "Random_Poisson", {"Mu"}, TOVRIN_CALLABLE(Random_Poisson));
    return t;
  }();
  return table;
}

void SeedSource(const std::optional<std::uint64_t>& Seed) {
  auto seed = [](auto s) -> decltype(SetRandSeed(s)) { return SetRandSeed(s); };
  auto randomize = [](auto... none) -> decltype(Randomize(none...)) { return Randomize(none...); };
  if constexpr (std::is_invocable_v<decltype(seed), std::uint64_t> &&
                std::is_invocable_v<decltype(randomize)>) {
    if (Seed)
      seed(*Seed);
    else
      randomize();
  } else {
    throw InputError("this build of the library has no seedable uniform source");
  }
}

}  // namespace

int RunRandom(std::span<const std::string> Words) {
  static constexpr std::array<std::string_view, 1> kFlags{"--list"};
  static constexpr std::array<std::string_view, 2> kValues{"--count", "--seed"};
  const Arguments args(Words, kFlags, kValues);
  if (args.Help()) {
    WriteOut(std::string(kHelp));
    return kExitOk;
  }
  if (args.Has("--list")) {
    if (!args.Operands().empty()) throw UsageError("--list takes no arguments");
    WriteOut(ListCallables(RandomTable()));
    return kExitOk;
  }
  const std::vector<std::string>& operands = args.Operands();
  if (operands.empty())
    throw UsageError("random needs a GENERATOR name (random --list shows them)");
  std::uint64_t count = 1;
  if (const auto text = args.Value("--count")) {
    count = ParseUnsignedArgument(*text, "--count", std::numeric_limits<std::uint32_t>::max());
  }
  std::optional<std::uint64_t> seed;
  if (const auto text = args.Value("--seed")) {
    seed = ParseUnsignedArgument(*text, "--seed", std::numeric_limits<std::uint64_t>::max());
  }
  const auto draw = BindByName(RandomTable(), "generator", operands[0],
                               std::span<const std::string>(operands).subspan(1));
  SeedSource(seed);
  // Output goes out in pieces of about 64 KiB, so that a large count needs no large buffer;
  // an error raised by the generator ends the run before its own line is written.
  std::string text;
  for (std::uint64_t i = 0; i < count; ++i) {
    text += draw();
    text += '\n';
    if (text.size() >= (1 << 16)) {
      WriteOut(text);
      text.clear();
    }
  }
  WriteOut(text);
  return kExitOk;
}

}  // namespace tovrin::cli
