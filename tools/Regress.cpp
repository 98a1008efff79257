// tovrin regress: correlation and regression of paired data.
#include <array>
#include <string>
#include <string_view>

#include "tools/CommandLine.h"
#include "tools/NumberReader.h"
#include "tools/Subcommands.h"
#include "tovrin/statistics/TOVRINPairStats.h"
#include "tovrin/statistics/TOVRINStatistics_Sample.h"
#include "tovrin/statistics/TOVRIN_RS_DescStats.h"

namespace tovrin::cli {
namespace {

constexpr std::string_view kHelp =
    "Usage: tovrin regress [--decimals N] [FILE...]\n"
    "\n"
    "Reads pairs 'x y', two numbers per line, from the FILEs (standard input when none is\n"
    "named, or for '-') and prints the paired-data report: number of pairs, mean and\n"
    "standard deviation of X and of Y, sample covariance, coefficients of correlation and\n"
    "of determination, the least-squares line y = a + b x with its sum of squares error,\n"
    "and the least-squares parabola y = a + b x + c x^2. Standard deviations and the\n"
    "covariance divide by n - 1, so at least two pairs are needed.\n"
    "\n"
    "Options:\n"
    "  --decimals N   decimal places, 0 to 20 (default 4)\n"
    "  --help         show this help\n";

// A signed term of a polynomial as text: " + 2.0000x" or " - 2.0000x".
std::string Term(Extended Coefficient, Byte Decimals, const char* Power) {
  const bool negative = Coefficient < 0;
  return std::string(negative ? " - " : " + ") +
         Float2EStr(negative ? -Coefficient : Coefficient, Decimals) + Power;
}

}  // namespace

int RunRegress(std::span<const std::string> Words) {
  static constexpr std::array<std::string_view, 0> kFlags{};
  static constexpr std::array<std::string_view, 1> kValues{"--decimals"};
  const Arguments args(Words, kFlags, kValues);
  if (args.Help()) {
    WriteOut(std::string(kHelp));
    return kExitOk;
  }
  const Byte decimals = ParseDecimals(args);
  TQENFloatVector x, y;
  ReadPairs(args.Operands(), x, y);
  if (x.size() < 2) {
    throw InputError("regress needs at least two pairs, got " + std::to_string(x.size()));
  }
  const std::size_t n = x.size();
  const Extended mean_x = QENMean(x), mean_y = QENMean(y);
  const Extended sd_x = SampleStdDev(x), sd_y = SampleStdDev(y);
  Extended products = 0;
  for (std::size_t i = 0; i < n; ++i) {
    products += (Extended(x[i]) - mean_x) * (Extended(y[i]) - mean_y);
  }
  const Extended covariance = products / static_cast<Extended>(n - 1);
  const Extended r = CoeffCorrelation(x, y);
  const Extended r2 = CoeffDetermination(x, y);

  const auto line = [&](TResStringId Label, const std::string& Value) {
    return LoadResString(Label) + "\t" + Value + "\n";
  };
  const auto number = [&](Extended X) { return Float2EStr(X, decimals); };
  std::string text = "Number of Pairs:\t" + std::to_string(n) + "\n";
  text += line(rsDSMeanX, number(mean_x));
  text += line(rsDSStdDevX, number(sd_x));
  text += line(rsDSMeanY, number(mean_y));
  text += line(rsDSStdDevY, number(sd_y));
  text += line(rsDSCovar, number(covariance));
  text += line(rsDSCoeffCor, number(r));
  text += line(rsDSCoeffDet, number(r2));
  // A line needs two distinct x values and a parabola three; where they are missing the
  // report says so in place of the coefficients.
  Extended intercept = 0, slope = 0;
  bool have_line = false;
  for (std::size_t i = 1; i < n && !have_line; ++i) have_line = Extended(x[i]) != Extended(x[0]);
  if (have_line) {
    GetRegressionLine(x, y, intercept, slope);
    text += line(rsDSRegressionLine, "y = " + number(intercept) + Term(slope, decimals, "x"));
    text += "Intercept:\t" + number(intercept) + "\n";
    text += "Slope:\t" + number(slope) + "\n";
    text += line(rsDSSSE, number(GetSSE(x, y, intercept, slope)));
  } else {
    text += line(rsDSRegressionLine, "none (all x values are equal)");
  }
  try {
    Extended a = 0, b = 0, c = 0;
    GetQuadraticCurve(x, y, a, b, c);
    text += "Quadratic Curve:\ty = " + number(a) + Term(b, decimals, "x") +
            Term(c, decimals, "x^2") + "\n";
    text += "Quadratic A:\t" + number(a) + "\n";
    text += "Quadratic B:\t" + number(b) + "\n";
    text += "Quadratic C:\t" + number(c) + "\n";
  } catch (const EMathError& e) {
    text += std::string("Quadratic Curve:\tnone (") + e.what() + ")\n";
  }
  WriteOut(text);
  return kExitOk;
}

}  // namespace tovrin::cli
