// Tests of the TQENDescStats component. Expected report lines are exact arithmetic done by
// hand (small samples) or exact rational arithmetic (python3 fractions) for Michelson's 1879
// light-speed measurements, noted beside the table.
#include <cmath>
#include <limits>
#include <set>
#include <sstream>
#include <stdexcept>
#include <string>
#include <vector>

#include "tovrin/statistics/TOVRINDescStats.h"
#include "tovrin/testing/TOVRIN_testing.h"

namespace tovrin {
namespace {

using Lines = std::vector<std::string>;
using testing::Values;
using L = std::vector<Extended>;
constexpr Extended kInf = std::numeric_limits<Extended>::infinity();

TQENDescStats WithValues(std::initializer_list<long double> values, bool population = false) {
  TQENDescStats stats;
  stats.SetPopulation(population);
  for (const long double x : values) stats.AddValue(x);
  return stats;
}

// Everything a caller can observe, for before/after comparisons.
struct Snapshot {
  Lines report, items;
  L values;
  Byte decimals;
  bool population;
  long double mean;
  bool operator==(const Snapshot&) const = default;
};
Snapshot Take(TQENDescStats& stats) {
  return {stats.DescStats(),     stats.Items(),      Values(stats.Values()),
          stats.DecimalPlaces(), stats.Population(), stats.Mean()};
}

// Lines of the report by their position (0 is the count, 9 the variance, ...).
void ExpectLines(TQENDescStats& stats, const std::vector<std::pair<int, std::string>>& lines) {
  const Lines report = stats.DescStats();
  ASSERT_EQ(report.size(), 18u);
  for (const auto& [i, text] : lines) EXPECT_EQ(report[static_cast<std::size_t>(i)], text) << i;
}

TEST(DescStats, EmptyComponent) {
  TQENDescStats stats;
  EXPECT_EQ(stats.DescStats(), Lines{"Vector is empty"});
  EXPECT_EQ(stats.NoOfValues(), 0);
  EXPECT_FALSE(stats.ModeExists() || stats.Population());
  EXPECT_EQ(stats.DecimalPlaces(), 4);
  stats.SetVersion("1.0");  // ignored
  EXPECT_EQ(stats.Version(), "6.14.2");
  for (const long double x :
       {stats.Maximum(), stats.Minimum(), stats.Range(), stats.Sum(), stats.SumSq(), stats.Mean(),
        stats.Median(), stats.Mode(), stats.Variance(), stats.StdDev(), stats.Kurtosis(),
        stats.Skew(), stats.Quartile1st(), stats.Quartile3rd(), stats.IQR(), stats.FenceLower(),
        stats.FenceUpper()}) {
    EXPECT_EQ(x, 0.0L);
  }
  TQENDescStats cleared = WithValues({1, 2, 3, 4});
  cleared.BeginUpdate();
  cleared.Clear();  // also cancels the open update
  EXPECT_EQ(Take(cleared), Take(stats));
  EXPECT_TRUE(cleared.SortedValues().empty());
  cleared.AddValue(5);
  EXPECT_EQ(cleared.Mean(), 5.0L);
  SetResString(rsVectorIsEmpty, "Keine Werte");
  EXPECT_EQ(stats.DescStats(), Lines{"Keine Werte"});
  ResetResStrings();
}

TEST(DescStats, FullReportOfOneToFour) {
  // n = 4, sum 10, sum of squares 30, mean 2.5, SS = 5, sample variance 5/3, S3 = 0,
  // S4 = 10.25: kurtosis 4 x 5 x 10.25 / (3 x 2 x 1 x (5/3)^2) - 3 x 9/2 = -1.2. Quartile
  // positions 1.5 and 3.5.
  TQENDescStats stats = WithValues({4, 2, 1, 3});
  const Lines expected{"Number of Values:\t4",
                       "Maximum:\t4.0000",
                       "Minimum:\t1.0000",
                       "Range:\t3.0000",
                       "Sum:\t10.0000",
                       "Sum of Squares:\t30.0000",
                       "Mean:\t2.5000",
                       "No Modal Value",
                       "Median:\t2.5000",
                       "Variance:\t1.6667",
                       "Standard Deviation:\t1.2910",
                       "Kurtosis:\t-1.2000",
                       "Skew:\t0.0000",
                       "First Quartile:\t1.5000",
                       "Third Quartile:\t3.5000",
                       "Inter-Quartile Range:\t2.0000",
                       "Lower Fence for Outliers:\t-1.5000",
                       "Upper Fence for Outliers:\t6.5000"};
  EXPECT_EQ(stats.DescStats(), expected);
  EXPECT_EQ(Values(stats.SortedValues()), (L{1, 2, 3, 4}));
  EXPECT_EQ(Values(stats.Values()), (L{4, 2, 1, 3}));
  // The population form: variance 5/4, kurtosis 10.25 / (4 x 1.5625) - 3.
  stats.SetPopulation(true);
  ExpectLines(
      stats,
      {{9, "Variance:\t1.2500"}, {10, "Standard Deviation:\t1.1180"}, {11, "Kurtosis:\t-1.3600"}});
  stats.SetPopulation(false);
  EXPECT_TRUE(testing::RelNear(stats.Variance(), 5.0L / 3, 1e-18L));
}

TEST(DescStats, TooFewValuesOrNoSpread) {
  TQENDescStats one = WithValues({2.5});
  ExpectLines(one, {{7, "Mode:\t2.5000"},
                    {9, "Not enough Values for Variance"},
                    {10, "Not enough Values for Standard Deviation"},
                    {11, "Not enough Values for Kurtosis"},
                    {12, "Not enough Values for Skew"},
                    {13, "First Quartile:\t2.5000"},
                    {17, "Upper Fence for Outliers:\t2.5000"}});
  TQENDescStats onePopulation = WithValues({2.5}, true);
  ExpectLines(onePopulation, {{9, "Variance:\t0.0000"},
                              {10, "Standard Deviation:\t0.0000"},
                              {11, "Not enough Values for Kurtosis"}});
  TQENDescStats flat = WithValues({3, 3, 3, 3});
  ExpectLines(flat, {{7, "Mode:\t3.0000"},
                     {11, "Standard Deviation needs to be > 0 for Kurtosis"},
                     {12, "Standard Deviation needs to be > 0 for Skew"}});
  EXPECT_EQ(flat.Kurtosis() + flat.Skew(), 0.0L);
  // [1, 3]: variance 2, no skew; [1, 2, 6]: mean 3, S3 = 18, s^2 = 7, skew 3 x 18 / (2 x 7^1.5)
  // = 1.45786...; as a population s^2 = 14/3 and skew 18 / (3 (14/3)^1.5) = 0.59517...
  TQENDescStats two = WithValues({1, 3}, true);
  ExpectLines(two, {{12, "Not enough Values for Skew"}});
  TQENDescStats three = WithValues({1, 2, 6});
  ExpectLines(three, {{11, "Not enough Values for Kurtosis"}, {12, "Skew:\t1.4579"}});
  three.SetPopulation(true);
  ExpectLines(
      three,
      {{9, "Variance:\t4.6667"}, {11, "Not enough Values for Kurtosis"}, {12, "Skew:\t0.5952"}});
  EXPECT_EQ(three.Kurtosis(), 0.0L);
}

TEST(DescStats, MichelsonLightSpeed1879) {
  // Offsets from 299000 km/s, 100 values. Reference (python3, exact fractions): sum 85240,
  // sum of squares 73276600, variance 6242.6666..., sd 79.01054781905177, sample skew
  // -0.018538863775218, sample kurtosis 0.339684598420114; 810 and 880 occur ten times each.
  TQENDescStats stats;
  stats.BeginUpdate();
  for (const int x :
       {850,  740, 900, 1070, 930, 850, 950, 980, 980, 880, 1000, 980, 930, 650, 760, 810, 1000,
        1000, 960, 960, 960,  940, 960, 940, 880, 800, 850, 880,  900, 840, 830, 790, 810, 880,
        880,  830, 800, 790,  760, 800, 880, 880, 880, 860, 720,  720, 620, 860, 970, 950, 880,
        910,  850, 870, 840,  840, 850, 840, 840, 840, 890, 810,  810, 820, 800, 770, 760, 740,
        750,  760, 910, 920,  890, 860, 880, 720, 840, 850, 850,  780, 890, 840, 780, 810, 760,
        810,  790, 810, 820,  850, 870, 870, 810, 740, 810, 940,  950, 800, 810, 870}) {
    stats.AddValue(x);
  }
  stats.SetDecimalPlaces(6);
  ExpectLines(stats, {{0, "Number of Values:\t100"},
                      {3, "Range:\t450.000000"},
                      {5, "Sum of Squares:\t73276600.000000"},
                      {6, "Mean:\t852.400000"},
                      {7, "No Modal Value"},
                      {8, "Median:\t850.000000"},
                      {9, "Variance:\t6242.666667"},
                      {10, "Standard Deviation:\t79.010548"},
                      {11, "Kurtosis:\t0.339685"},
                      {12, "Skew:\t-0.018539"},
                      {13, "First Quartile:\t805.000000"},
                      {14, "Third Quartile:\t895.000000"},
                      {16, "Lower Fence for Outliers:\t670.000000"},
                      {17, "Upper Fence for Outliers:\t1030.000000"}});
}

TEST(DescStats, ModeDecimalsAndLabels) {
  TQENDescStats stats = WithValues({2, 1, 2, 1, 2});
  EXPECT_TRUE(stats.ModeExists());
  EXPECT_EQ(stats.Mode(), 2.0L);
  stats.DeleteLast();
  EXPECT_FALSE(stats.ModeExists());
  TQENDescStats half = WithValues({1, 2});
  half.SetDecimalPlaces(2);
  ExpectLines(half, {{6, "Mean:\t1.50"}});
  half.SetDecimalPlaces(0);
  ExpectLines(half, {{6, "Mean:\t2"}, {0, "Number of Values:\t2"}});  // 1.5 to even
  SetResString(rsDSMean, "Average:");
  SetResString(rsDSNoMode, "Kein Modalwert");
  half.SetDecimalPlaces(4);
  const Lines report = half.DescStats();
  ResetDescStatsStrings();
  EXPECT_EQ(report[6], "Average:\t1.5000");
  EXPECT_EQ(report[7], "Kein Modalwert");
  EXPECT_EQ(half.DescStats()[6], "Mean:\t1.5000");
}

// The labels' table: its own texts and names, none shared with another label or with an error
// message of the foundation's table.
TEST(DescStats, LabelsHaveTheirPublishedTextsAndNames) {
  ASSERT_EQ(kLastDescStatsString - kFirstDescStatsString + 1, 47);
  std::set<std::string> texts, names;
  for (int id = kFirstDescStatsString; id <= kLastDescStatsString; ++id) {
    const auto label = static_cast<TDescStatsStringId>(id);
    EXPECT_TRUE(texts.insert(LoadResString(label)).second) << ResStringName(label);
    EXPECT_TRUE(names.insert(ResStringName(label)).second) << ResStringName(label);
  }
  for (int id = 0; id < rsResStringCount; ++id) {
    const auto message = static_cast<TResStringId>(id);
    EXPECT_EQ(texts.count(LoadResString(message)), 0u) << ResStringName(message);
  }
  EXPECT_EQ(LoadResString(rsDSNoOfValues), "Number of Values:");
  EXPECT_EQ(LoadResString(rsDSSumSQ), "Sum of Squares:");
  EXPECT_EQ(LoadResString(rsDSSDKurtosis), "Standard Deviation needs to be > 0 for Kurtosis");
  EXPECT_EQ(LoadResString(rsDSUpperFence), "Upper Fence for Outliers:");
  EXPECT_EQ(LoadResString(rsPValue), "p-Value:");
  EXPECT_EQ(LoadResString(rsDSCoeffCor), "Coefficient of Correlation");
  EXPECT_EQ(LoadResString(rsDSMeanY), "Mean of Y Values:");
  EXPECT_STREQ(ResStringName(rsDSNoMode), "rsDSNoMode");
  EXPECT_THROW(LoadResString(rsDescStatsStringCount), std::out_of_range);
  EXPECT_THROW(SetResString(rsDescStatsStringCount, "x"), std::out_of_range);
}

TEST(DescStats, AddingAndDeleting) {
  TQENDescStats stats;
  for (const long double x : {2.5L, -0.125L, 2.0L, 1e-25L, 0.1L}) stats.AddValue(x);
  // Twenty decimals without trailing zeros; 0.1 is the binary value nearest it.
  EXPECT_EQ(stats.Items(), (Lines{"2.5", "-0.125", "2.", "0.", "0.1"}));
  TQENDescStats three = WithValues({1, 2, 6});
  const Snapshot before = Take(three);
  for (LongInt index :
       {-1, 3, std::numeric_limits<LongInt>::max(), std::numeric_limits<LongInt>::min()}) {
    three.DeleteValue(index);  // outside the list: nothing changes
  }
  EXPECT_EQ(Take(three), before);
  three.DeleteValue(1);
  EXPECT_EQ(three.Items(), (Lines{"1.", "6."}));
  EXPECT_EQ(three.Mean(), 3.5L);
  three.DeleteLast();
  EXPECT_EQ(Values(three.Values()), (L{1}));
  TQENDescStats empty;
  empty.DeleteLast();
  empty.DeleteValue(0);
  EXPECT_EQ(empty.NoOfValues(), 0);
  // SetValues leaves Items alone, so the two lists may differ in length.
  TQENDescStats mixed = WithValues({7});
  mixed.SetValues(TQENFloatVector{1.0L, 2.0L, 3.0L});
  mixed.DeleteValue(2);
  EXPECT_EQ(mixed.Items(), Lines{"7."});
  mixed.DeleteValue(0);
  EXPECT_TRUE(mixed.Items().empty());
  EXPECT_EQ(mixed.Mean(), 2.0L);
}

TEST(DescStats, UpdatesHoldTheStatisticsUntilTheyEnd) {
  TQENDescStats stats = WithValues({1, 2});
  stats.BeginUpdate();
  stats.BeginUpdate();  // does not nest
  for (const int x : {10, 20, 30}) stats.AddValue(x);
  EXPECT_EQ(stats.Mean(), 1.5L);
  EXPECT_EQ(stats.NoOfValues(), 5);
  stats.SetPopulation(true);
  EXPECT_EQ(stats.Variance(), 0.5L);
  ExpectLines(stats, {{6, "Mean:\t12.6000"}});  // the report ends the update
  stats.AddValue(0);
  EXPECT_EQ(stats.Mean(), 10.5L);
  TQENDescStats ended;
  ended.BeginUpdate();
  ended.BeginUpdate();
  ended.AddValue(4);
  ended.EndUpdate();
  EXPECT_EQ(ended.Mean(), 4.0L);
}

TEST(DescStats, IntegerSettersAndGetters) {
  TQENDescStats stats;
  stats.SetLIntValues(TQENLIntVector{-3, 5});
  EXPECT_EQ(stats.Mean(), 1.0L);
  stats.SetLWordValues(TQENLWordVector{4294967295u, 1u});
  EXPECT_EQ(stats.Sum(), 4294967296.0L);
  stats.SetInt64Values(TQENInt64Vector{std::numeric_limits<Int64>::max(), 0});
  EXPECT_EQ(stats.Maximum(), 9223372036854775807.0L);
  EXPECT_TRUE(stats.Items().empty());
  // Halves round to even; 2^32 + 7 keeps its low 32 bits; beyond Int64 the result is -2^63.
  stats.SetValues(TQENFloatVector{2.5L, 3.5L, -2.5L, -0.5L, 1.4999L, 4294967296.0L + 7, 1e30L});
  const Int64 indefinite = std::numeric_limits<Int64>::min();
  EXPECT_EQ(stats.LIntValues(), (TQENLIntVector{2, 4, -2, 0, 1, 7, 0}));
  EXPECT_EQ(stats.Int64Values(), (TQENInt64Vector{2, 4, -2, 0, 1, 4294967303LL, indefinite}));
  EXPECT_EQ(stats.LWordValues(), (TQENLWordVector{2, 4, 4294967294u, 0, 1, 7u, 0u}));
}

TEST(DescStats, ItemsConvertOrChangeNothing) {
  TQENDescStats stats;
  stats.SetItems(Lines{"1", " 2.5 ", "-3e1", ".5"});
  EXPECT_EQ(Values(stats.Values()), (L{1, 2.5, -30, 0.5}));
  EXPECT_EQ(stats.Items(), (Lines{"1", " 2.5 ", "-3e1", ".5"}));
  const Snapshot before = Take(stats);
  EXPECT_THROW(stats.SetItems(Lines{"4", "five"}), EConvertError);
  EXPECT_THROW(stats.SetItems(Lines{""}), EConvertError);
  EXPECT_EQ(Take(stats), before);
  stats.SetValues(TQENFloatVector{9.0L});
  stats.Loaded();  // the items win
  EXPECT_EQ(stats.Mean(), -6.5L);
}

TEST(DescStatsStream, SavedFormAndRoundTrips) {
  TQENDescStats stats = WithValues({1.5, -3});
  std::ostringstream out;
  stats.SaveToStream(out);
  EXPECT_EQ(out.str(),
            "TQENDescStats\nDecimalPlaces 4\nPopulation False\nVersion 6.14.2\nItems 2\n1.5\n-3.\n"
            "End\n");
  for (const bool full : {true, false}) {
    TQENDescStats original = full ? WithValues({0.1L, 2, 2, -7.25, 1e10L}, true) : WithValues({});
    original.SetDecimalPlaces(7);
    std::stringstream stream;
    original.SaveToStream(stream);
    TQENDescStats copy = WithValues({42});
    copy.LoadFromStream(stream);
    EXPECT_EQ(Take(copy), Take(original));
  }
  // Carriage returns are accepted; absent properties keep their current values.
  std::istringstream in("TQENDescStats\r\nItems 2\r\n3\r\n5\r\nEnd\r\n");
  TQENDescStats loaded = WithValues({1}, true);
  loaded.SetDecimalPlaces(9);
  loaded.LoadFromStream(in);
  EXPECT_EQ(loaded.Mean(), 4.0L);
  EXPECT_TRUE(loaded.Population());
  EXPECT_EQ(loaded.DecimalPlaces(), 9);
}

TEST(DescStatsStream, InfinitiesAndNaNSurviveEveryRoundTrip) {
  TQENDescStats stats = WithValues({kInf, -kInf, std::numeric_limits<Extended>::quiet_NaN(), 2.5L});
  EXPECT_EQ(stats.Items(), (Lines{"INF", "-INF", "NAN", "2.5"}));
  const auto same = [](const TQENDescStats& copy) {
    const L v = Values(copy.Values());
    return v.size() == 4 && v[0] == kInf && v[1] == -kInf && std::isnan(v[2]) && v[3] == 2.5L;
  };
  std::stringstream stream;
  stats.SaveToStream(stream);
  TQENDescStats loaded, set;
  loaded.LoadFromStream(stream);
  set.SetItems(stats.Items());
  stats.Loaded();
  EXPECT_TRUE(same(loaded) && same(set) && same(stats));
}

TEST(DescStatsStream, FailedLoadLeavesTheComponentAsItWas) {
  const std::vector<std::string> broken{
      "",                                                            // nothing at all
      "TQENDesc\nItems 0\nEnd\n",                                    // wrong tag
      "TQENDescStats\nDecimalPlaces 256\nItems 0\nEnd\n",            // out of range
      "TQENDescStats\nDecimalPlaces -1\nItems 0\nEnd\n",             // not a count
      "TQENDescStats\nPopulation yes\nItems 0\nEnd\n",               // not a Boolean
      "TQENDescStats\nColour red\nItems 0\nEnd\n",                   // unknown property
      "TQENDescStats\nPopulation True\nPopulation True\nItems 0\n",  // repeated property
      "TQENDescStats\nItems x\nEnd\n",                               // count missing
      "TQENDescStats\nItems 3\n1\n2\n",                              // too few lines
      "TQENDescStats\nItems 2\n1\nnan\nEnd\n",                       // item not a number
      "TQENDescStats\nItems 1\n1\n2\nEnd\n",                         // too many lines
      "TQENDescStats\nItems 1\n1\n",                                 // no End
  };
  for (const std::string& text : broken) {
    TQENDescStats stats = WithValues({1, 2, 4});
    stats.SetDecimalPlaces(3);
    const Snapshot before = Take(stats);
    std::istringstream in(text);
    EXPECT_THROW(stats.LoadFromStream(in), EConvertError) << text;
    EXPECT_EQ(Take(stats), before) << text;
  }
  std::istringstream in("TQENDescStats\nItems 2\n1\nabc\nEnd\n");
  try {
    TQENDescStats().LoadFromStream(in);
    FAIL() << "no error";
  } catch (const EConvertError& e) {
    EXPECT_NE(std::string(e.what()).find("line 4"), std::string::npos) << e.what();
    EXPECT_NE(std::string(e.what()).find("abc"), std::string::npos) << e.what();
  }
}

}  // namespace
}  // namespace tovrin
