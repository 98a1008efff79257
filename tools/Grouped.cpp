// tovrin grouped: statistics of grouped data.
#include <array>
#include <cstdint>
#include <limits>
#include <string>
#include <string_view>

#include "tools/CommandLine.h"
#include "tools/Subcommands.h"
#include "tovrin/statistics/TOVRINStatistics_Grouped.h"
#include "tovrin/statistics/TOVRIN_RS_DescStats.h"

namespace tovrin::cli {
namespace {

constexpr std::string_view kHelp =
    "Usage: tovrin grouped --start S --width W [--decimals N] FREQ...\n"
    "\n"
    "Statistics of grouped data: FREQ are the frequencies of adjacent classes of equal\n"
    "width W, the first starting at S (class i covers [S + i W, S + (i + 1) W)). Prints the\n"
    "mean, median, mode (or that there is none), quartiles, deciles, and the sample and\n"
    "population variance and standard deviation.\n"
    "\n"
    "Example:\n"
    "  tovrin grouped --start 0 --width 10 1 2 1\n"
    "\n"
    "Options:\n"
    "  --start S      lower boundary of the first class\n"
    "  --width W      class width\n"
    "  --decimals N   decimal places, 0 to 20 (default 4)\n"
    "  --help         show this help\n";

}  // namespace

int RunGrouped(std::span<const std::string> Words) {
  static constexpr std::array<std::string_view, 0> kFlags{};
  static constexpr std::array<std::string_view, 3> kValues{"--start", "--width", "--decimals"};
  const Arguments args(Words, kFlags, kValues);
  if (args.Help()) {
    WriteOut(std::string(kHelp));
    return kExitOk;
  }
  const auto start_text = args.Value("--start");
  const auto width_text = args.Value("--width");
  if (!start_text) throw UsageError("grouped needs --start S");
  if (!width_text) throw UsageError("grouped needs --width W");
  const Extended start = ParseRealArgument(*start_text, "--start");
  const Extended width = ParseRealArgument(*width_text, "--width");
  const Byte decimals = ParseDecimals(args);
  if (args.Operands().empty()) throw UsageError("grouped needs the class frequencies FREQ...");
  TQENLWordVector freqs;
  for (const std::string& word : args.Operands()) {
    freqs.push_back(static_cast<LongWord>(
        ParseUnsignedArgument(word, "a frequency", std::numeric_limits<LongWord>::max())));
  }

  // Everything is computed before anything is printed, so an error leaves no half report.
  const Extended mean = GroupedMean(freqs, start, width);
  const Extended median = GroupedMedian(freqs, start, width);
  Extended mode = 0;
  const bool has_mode = GroupedMode(freqs, start, width, mode);
  Extended q1 = 0, q3 = 0;
  GroupedQuartiles(freqs, start, width, q1, q3);
  std::array<Extended, 9> deciles{};
  GetGroupedDeciles(freqs, start, width, deciles);
  const Extended sample_variance = GroupedSampleVariance(freqs, start, width);
  const Extended sample_sd = GroupedSampleStdDev(freqs, start, width);
  const Extended population_variance = GroupedPopulationVariance(freqs, start, width);
  const Extended population_sd = GroupedPopulationStdDev(freqs, start, width);

  const auto number = [&](Extended X) { return Float2EStr(X, decimals); };
  const auto line = [&](TDescStatsStringId Label, Extended X) {
    return LoadResString(Label) + "\t" + number(X) + "\n";
  };
  std::string text = "Number of Classes:\t" + std::to_string(freqs.size()) + "\n";
  text += line(rsDSMean, mean);
  text += line(rsDSMedian, median);
  text += has_mode ? line(rsDSMode, mode) : LoadResString(rsDSNoMode) + "\n";
  text += line(rsDSQtr1, q1);
  text += line(rsDSQtr3, q3);
  for (std::size_t j = 0; j < deciles.size(); ++j) {
    text += "Decile " + std::to_string(j + 1) + ":\t" + number(deciles[j]) + "\n";
  }
  text += "Sample Variance:\t" + number(sample_variance) + "\n";
  text += "Sample Standard Deviation:\t" + number(sample_sd) + "\n";
  text += "Population Variance:\t" + number(population_variance) + "\n";
  text += "Population Standard Deviation:\t" + number(population_sd) + "\n";
  WriteOut(text);
  return kExitOk;
}

}  // namespace tovrin::cli
