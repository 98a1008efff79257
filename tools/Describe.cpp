// tovrin describe: the report of TQENDescStats over a column of numbers.
#include <array>
#include <string>
#include <string_view>

#include "tools/CommandLine.h"
#include "tools/NumberReader.h"
#include "tools/Subcommands.h"
#include "tovrin/statistics/TOVRINDescStats.h"

namespace tovrin::cli {
namespace {

constexpr std::string_view kHelp =
    "Usage: tovrin describe [--population] [--decimals N] [--json] [FILE...]\n"
    "\n"
    "Prints the descriptive statistics of the numbers in the FILEs (standard input when\n"
    "none is named, or for '-'): one line per statistic, label, TAB, value, exactly as the\n"
    "TQENDescStats component reports them.\n"
    "\n"
    "Numbers are separated by white space, commas or line ends; '#' starts a comment.\n"
    "With no numbers at all the report is the single line 'Vector is empty' (with --json,\n"
    "NoOfValues 0 and every statistic 0).\n"
    "\n"
    "Options:\n"
    "  --population   treat the numbers as a whole population (divisor n, not n - 1)\n"
    "  --decimals N   decimal places of the report, 0 to 20 (default 4)\n"
    "  --json         one JSON object with every statistic at full precision\n"
    "  --help         show this help\n";

// A JSON number, or null where JSON has no number (infinities, NaN).
std::string JsonNumber(Extended X) {
  if (X != X || X - X != 0) return "null";
  return FormatShortest(X);
}

std::string JsonReport(const TQENDescStats& Stats) {
  const std::array<std::pair<const char*, Extended>, 17> fields{{
      {"Maximum", Stats.Maximum()},
      {"Minimum", Stats.Minimum()},
      {"Range", Stats.Range()},
      {"Sum", Stats.Sum()},
      {"SumSq", Stats.SumSq()},
      {"Mean", Stats.Mean()},
      {"Mode", Stats.Mode()},
      {"Median", Stats.Median()},
      {"Variance", Stats.Variance()},
      {"StdDev", Stats.StdDev()},
      {"Kurtosis", Stats.Kurtosis()},
      {"Skew", Stats.Skew()},
      {"Quartile1st", Stats.Quartile1st()},
      {"Quartile3rd", Stats.Quartile3rd()},
      {"IQR", Stats.IQR()},
      {"FenceLower", Stats.FenceLower()},
      {"FenceUpper", Stats.FenceUpper()},
  }};
  std::string text = "{\"NoOfValues\": " + std::to_string(Stats.NoOfValues());
  for (const auto& [name, value] : fields) {
    text += ", \"";
    text += name;
    text += "\": ";
    const bool no_mode = std::string_view(name) == "Mode" && !Stats.ModeExists();
    text += no_mode ? "null" : JsonNumber(value);
  }
  return text + "}\n";
}

}  // namespace

int RunDescribe(std::span<const std::string> Words) {
  static constexpr std::array<std::string_view, 2> kFlags{"--population", "--json"};
  static constexpr std::array<std::string_view, 1> kValues{"--decimals"};
  const Arguments args(Words, kFlags, kValues);
  if (args.Help()) {
    WriteOut(std::string(kHelp));
    return kExitOk;
  }
  const Byte decimals = ParseDecimals(args);

  TQENDescStats stats;
  stats.BeginUpdate();
  stats.SetPopulation(args.Has("--population"));
  stats.SetDecimalPlaces(decimals);
  stats.SetValues(ReadNumbers(args.Operands()));
  stats.EndUpdate();

  if (args.Has("--json")) {
    WriteOut(JsonReport(stats));
    return kExitOk;
  }
  std::string text;
  for (const std::string& line : stats.DescStats()) {
    text += line;
    text += '\n';
  }
  WriteOut(text);
  return kExitOk;
}

}  // namespace tovrin::cli
