// tovrin regress: correlation and regression of paired data.
#include <array>
#include <string>
#include <string_view>

#include "tools/CommandLine.h"
#include "tools/NumberReader.h"
#include "tools/Subcommands.h"
#include "tools/Table.h"
#include "tovrin/statistics/TOVRINPairStats.h"
#include "tovrin/statistics/TOVRINStatistics_Sample.h"
#include "tovrin/statistics/TOVRIN_RS_DescStats.h"

namespace tovrin::cli {
namespace {

constexpr std::string_view kHelp =
    "Usage: tovrin regress [--decimals N] [TABLE OPTION...] [FILE...]\n"
    "\n"
    "Reads pairs 'x y', two numbers per line, from the FILEs (standard input when none is\n"
    "named, or for '-') and prints the paired-data report: number of pairs, mean and\n"
    "standard deviation of X and of Y, sample covariance, coefficients of correlation and\n"
    "of determination, the least-squares line y = a + b x with its sum of squares error,\n"
    "and the least-squares parabola y = a + b x + c x^2. Standard deviations and the\n"
    "covariance divide by n - 1, so at least two pairs are needed.\n"
    "\n"
    "\n"
    "Tables: with -t C (fields separated by the character C, quoted with \" as in CSV) or\n"
    "-W (runs of blanks), -H (the first line names the fields) and -f X,Y (the two fields,\n"
    "by number from 1 or by name; default 1,2), X and Y come from those fields of every line.\n"
    "A line where either is missing (--na LIST, default 'NA,NaN,') is skipped and counted.\n"
    "\n"
    "Options:\n"
    "  -t C, --delimiter C   fields are separated by the character C ('tab' for TAB)\n"
    "  -W, --whitespace      fields are separated by runs of blanks\n"
    "  -H, --header          the first line names the fields\n"
    "  -f X,Y, --field X,Y   the fields of x and of y\n"
    "  --na LIST             field texts that mean a missing value\n"
    "  --decimals N          decimal places, 0 to 20 (default 4)\n"
    "  --help                show this help\n";

// A signed term of a polynomial as text: " + 2.0000x" or " - 2.0000x".
std::string Term(Extended Coefficient, Byte Decimals, const char* Power) {
  const bool negative = Coefficient < 0;
  return std::string(negative ? " - " : " + ") +
         Float2EStr(negative ? -Coefficient : Coefficient, Decimals) + Power;
}

}  // namespace

int RunRegress(std::span<const std::string> Words) {
  const std::vector<std::string_view> flags(std::begin(kTableFlags), std::end(kTableFlags));
  std::vector<std::string_view> values{"--decimals"};
  values.insert(values.end(), std::begin(kTableValues), std::end(kTableValues));
  const Arguments args(Words, flags, values);
  if (args.Help()) {
    WriteOut(std::string(kHelp));
    return kExitOk;
  }
  const Byte decimals = ParseDecimals(args);
  if (args.Value("-g") || args.Value("--group")) {
    throw UsageError("-g/--group: regress has no groups");
  }
  TQENFloatVector x, y;
  std::size_t skipped = 0;
  if (const std::optional<TableOptions> table = ReadTableOptions(args, "1,2")) {
    const MissingTexts missing(args.Value("--na").value_or("NA,NaN,"));
    std::vector<TableField> fields;
    ScanTable(
        args.Operands(), *table,
        [&](const std::vector<std::string>& names, std::size_t count) {
          fields = ResolveFields(table->fields, "-f/--field", names, count, table->header);
          if (fields.size() != 2) {
            throw UsageError("-f/--field: regress takes two fields, x and y, not '" +
                             table->fields + "'");
          }
        },
        [&](const RecordReader& reader) {
          const std::optional<Extended> vx =
              FieldValue(reader, fields[0], FieldOf(reader, fields[0]), missing);
          const std::optional<Extended> vy =
              FieldValue(reader, fields[1], FieldOf(reader, fields[1]), missing);
          if (vx && vy) {
            x.push_back(*vx);
            y.push_back(*vy);
          } else {
            ++skipped;
          }
        });
  } else {
    if (args.Value("--na")) throw UsageError("--na applies to tables (with -t, -W or -f)");
    ReadPairs(args.Operands(), x, y);
  }
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

  const auto line = [&](TDescStatsStringId Label, const std::string& Value) {
    return LoadResString(Label) + "\t" + Value + "\n";
  };
  const auto number = [&](Extended X) { return Float2EStr(X, decimals); };
  std::string text = "Number of Pairs:\t" + std::to_string(n) + "\n";
  if (skipped > 0) text += "Lines Skipped (missing values):\t" + std::to_string(skipped) + "\n";
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
