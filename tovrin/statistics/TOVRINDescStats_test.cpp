// Tests of the TQENDescStats component. Expected report lines are exact arithmetic done by
// hand (small samples) or exact rational arithmetic (python3 fractions) for Michelson's 1879
// light-speed measurements, noted beside the table.
#include <algorithm>
#include <cmath>
#include <limits>
#include <sstream>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "tovrin/statistics/TOVRINDescStats.h"

namespace tovrin {
namespace {

using Lines = std::vector<std::string>;

TQENDescStats WithValues(std::initializer_list<long double> values, bool population = false) {
  TQENDescStats stats;
  stats.SetPopulation(population);
  for (const long double x : values) stats.AddValue(x);
  return stats;
}

std::vector<long double> Numbers(const TQENFloatVector& v) {
  return std::vector<long double>(v.begin(), v.end());
}

// Everything a caller can observe, for before/after comparisons.
struct Snapshot {
  Lines report, items;
  std::vector<long double> values;
  Byte decimals;
  bool population;
  long double mean;
  bool operator==(const Snapshot&) const = default;
};
Snapshot Take(TQENDescStats& stats) {
  return {stats.DescStats(),     stats.Items(),      Numbers(stats.Values()),
          stats.DecimalPlaces(), stats.Population(), stats.Mean()};
}

// ---------------------------------------------------------------------------------------------
// Construction and the empty list

TEST(DescStatsTest, NewComponentIsEmpty) {
  TQENDescStats stats;
  EXPECT_EQ(stats.DescStats(), Lines{"Vector is empty"});
  EXPECT_EQ(stats.NoOfValues(), 0);
  EXPECT_FALSE(stats.ModeExists());
  EXPECT_EQ(stats.DecimalPlaces(), 4);
  EXPECT_FALSE(stats.Population());
  EXPECT_EQ(stats.Version(), "6.14.2");
  EXPECT_TRUE(stats.Items().empty());
  EXPECT_TRUE(stats.SortedValues().empty());
  for (const long double x :
       {stats.Maximum(), stats.Minimum(), stats.Range(), stats.Sum(), stats.SumSq(), stats.Mean(),
        stats.Median(), stats.Mode(), stats.Variance(), stats.StdDev(), stats.Kurtosis(),
        stats.Skew(), stats.Quartile1st(), stats.Quartile3rd(), stats.IQR(), stats.FenceLower(),
        stats.FenceUpper()}) {
    EXPECT_EQ(x, 0.0L);
  }
}

TEST(DescStatsTest, EmptyReportFollowsTheResourceText) {
  SetResString(rsVectorIsEmpty, "Keine Werte");
  TQENDescStats stats;
  EXPECT_EQ(stats.DescStats(), Lines{"Keine Werte"});
  ResetResStrings();
}

TEST(DescStatsTest, ClearingEverythingReturnsToTheEmptyState) {
  TQENDescStats stats = WithValues({1, 2, 3, 4});
  stats.Clear();
  EXPECT_EQ(stats.DescStats(), Lines{"Vector is empty"});
  EXPECT_TRUE(stats.Items().empty());
  EXPECT_EQ(stats.Mean(), 0.0L);
  EXPECT_EQ(stats.Maximum(), 0.0L);
  EXPECT_TRUE(stats.SortedValues().empty());
}

// ---------------------------------------------------------------------------------------------
// The report

TEST(DescStatsTest, OneValueInSampleMode) {
  TQENDescStats stats = WithValues({2.5});
  EXPECT_EQ(stats.Items(), Lines{"2.5"});
  const Lines expected{"Number of Values:\t1",
                       "Maximum:\t2.5000",
                       "Minimum:\t2.5000",
                       "Range:\t0.0000",
                       "Sum:\t2.5000",
                       "Sum of Squares:\t6.2500",
                       "Mean:\t2.5000",
                       "Mode:\t2.5000",
                       "Median:\t2.5000",
                       "Not enough Values for Variance",
                       "Not enough Values for Standard Deviation",
                       "Not enough Values for Kurtosis",
                       "Not enough Values for Skew",
                       "First Quartile:\t2.5000",
                       "Third Quartile:\t2.5000",
                       "Inter-Quartile Range:\t0.0000",
                       "Lower Fence for Outliers:\t2.5000",
                       "Upper Fence for Outliers:\t2.5000"};
  EXPECT_EQ(stats.DescStats(), expected);
  EXPECT_EQ(stats.Variance(), 0.0L);
}

TEST(DescStatsTest, OneValueInPopulationMode) {
  TQENDescStats stats = WithValues({2.5}, true);
  const Lines report = stats.DescStats();
  ASSERT_EQ(report.size(), 18u);
  EXPECT_EQ(report[9], "Variance:\t0.0000");
  EXPECT_EQ(report[10], "Standard Deviation:\t0.0000");
  EXPECT_EQ(report[11], "Not enough Values for Kurtosis");
  EXPECT_EQ(report[12], "Not enough Values for Skew");
}

TEST(DescStatsTest, ZeroSpreadIsReportedForKurtosisAndSkew) {
  TQENDescStats stats = WithValues({3, 3, 3, 3});
  const Lines report = stats.DescStats();
  ASSERT_EQ(report.size(), 18u);
  EXPECT_EQ(report[7], "Mode:\t3.0000");
  EXPECT_EQ(report[9], "Variance:\t0.0000");
  EXPECT_EQ(report[11], "Standard Deviation needs to be > 0 for Kurtosis");
  EXPECT_EQ(report[12], "Standard Deviation needs to be > 0 for Skew");
  EXPECT_EQ(stats.Kurtosis(), 0.0L);
  EXPECT_EQ(stats.Skew(), 0.0L);
}

TEST(DescStatsTest, TwoAndThreeValuesReachVarianceThenSkew) {
  TQENDescStats two = WithValues({1, 3});
  Lines report = two.DescStats();
  EXPECT_EQ(report[9], "Variance:\t2.0000");  // ((1-2)^2 + (3-2)^2) / 1
  EXPECT_EQ(report[11], "Not enough Values for Kurtosis");
  EXPECT_EQ(report[12], "Not enough Values for Skew");
  TQENDescStats three = WithValues({1, 2, 6});
  report = three.DescStats();
  EXPECT_EQ(report[11], "Not enough Values for Kurtosis");
  // mean 3, S3 = -8 - 1 + 27 = 18, s^2 = 7, skew = 3 * 18 / (2 * 1 * 7^1.5) = 1.45786...
  EXPECT_EQ(report[12], "Skew:\t1.4579");
}

TEST(DescStatsTest, FullReportOfOneToFour) {
  // n = 4, sum 10, sum of squares 30, mean 2.5, SS = 5, sample variance 5/3.
  // S4 = 2 (1.5^4 + 0.5^4) = 10.25; sample kurtosis 4*5*10.25 / (3*2*1*(5/3)^2) - 3*9/2 = -1.2.
  // S3 = 0. Quartile positions 1.5 and 3.5.
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
  EXPECT_EQ(Numbers(stats.SortedValues()), (std::vector<long double>{1, 2, 3, 4}));
  EXPECT_EQ(Numbers(stats.Values()), (std::vector<long double>{4, 2, 1, 3}));
}

TEST(DescStatsTest, PopulationSwitchRecomputes) {
  TQENDescStats stats = WithValues({1, 2, 3, 4});
  stats.SetPopulation(true);
  // Variance 5/4; population kurtosis 10.25 / (4 * 1.5625) - 3 = -1.36.
  const Lines report = stats.DescStats();
  EXPECT_EQ(report[9], "Variance:\t1.2500");
  EXPECT_EQ(report[10], "Standard Deviation:\t1.1180");
  EXPECT_EQ(report[11], "Kurtosis:\t-1.3600");
  EXPECT_EQ(stats.Variance(), 1.25L);
  stats.SetPopulation(false);
  EXPECT_NEAR(static_cast<double>(stats.Variance()), 5.0 / 3.0, 1e-15);
}

TEST(DescStatsTest, CountLimitsHoldForAPopulationToo) {
  // Population of 1, 2, 6: mean 3, SS 14, variance 14/3, S3 18, skew 18 / (3 (14/3)^1.5)
  // = 0.59517... (exact fractions, then one square root). Three values are too few for
  // kurtosis whatever the divisor.
  TQENDescStats stats = WithValues({1, 2, 6}, true);
  const Lines report = stats.DescStats();
  ASSERT_EQ(report.size(), 18u);
  EXPECT_EQ(report[9], "Variance:\t4.6667");
  EXPECT_EQ(report[10], "Standard Deviation:\t2.1602");
  EXPECT_EQ(report[11], "Not enough Values for Kurtosis");
  EXPECT_EQ(report[12], "Skew:\t0.5952");
  EXPECT_EQ(stats.Kurtosis(), 0.0L);
  TQENDescStats two = WithValues({1, 3}, true);
  EXPECT_EQ(two.DescStats()[12], "Not enough Values for Skew");
  EXPECT_EQ(two.Skew(), 0.0L);
}

TEST(DescStatsTest, MichelsonLightSpeed1879) {
  // Offsets from 299000 km/s, 100 values. Reference (python3, exact fractions): sum 85240,
  // sum of squares 73276600, variance 6242.6666..., sd 79.01054781905177, sample skew
  // -0.018538863775218, sample kurtosis 0.339684598420114; the two most frequent values
  // (810 and 880) occur ten times each, so there is no mode.
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
  const Lines expected{"Number of Values:\t100",
                       "Maximum:\t1070.000000",
                       "Minimum:\t620.000000",
                       "Range:\t450.000000",
                       "Sum:\t85240.000000",
                       "Sum of Squares:\t73276600.000000",
                       "Mean:\t852.400000",
                       "No Modal Value",
                       "Median:\t850.000000",
                       "Variance:\t6242.666667",
                       "Standard Deviation:\t79.010548",
                       "Kurtosis:\t0.339685",
                       "Skew:\t-0.018539",
                       "First Quartile:\t805.000000",
                       "Third Quartile:\t895.000000",
                       "Inter-Quartile Range:\t90.000000",
                       "Lower Fence for Outliers:\t670.000000",
                       "Upper Fence for Outliers:\t1030.000000"};
  EXPECT_EQ(stats.DescStats(), expected);
}

TEST(DescStatsTest, ModeReportedOnlyForOneLongestRun) {
  TQENDescStats stats = WithValues({2, 1, 2, 1, 2});
  EXPECT_TRUE(stats.ModeExists());
  EXPECT_EQ(stats.Mode(), 2.0L);
  EXPECT_EQ(stats.DescStats()[7], "Mode:\t2.0000");
  stats.DeleteLast();
  EXPECT_FALSE(stats.ModeExists());
  EXPECT_EQ(stats.DescStats()[7], "No Modal Value");
}

TEST(DescStatsTest, DecimalPlacesShapeTheValues) {
  TQENDescStats stats = WithValues({1, 2});
  stats.SetDecimalPlaces(2);
  EXPECT_EQ(stats.DescStats()[6], "Mean:\t1.50");
  stats.SetDecimalPlaces(0);
  EXPECT_EQ(stats.DescStats()[6], "Mean:\t2");  // 1.5 to even
  EXPECT_EQ(stats.DescStats()[0], "Number of Values:\t2");
}

TEST(DescStatsTest, LabelsAreTheResourceStringsInForce) {
  SetResString(rsDSMean, "Average:");
  SetResString(rsDSNoMode, "Kein Modalwert");
  TQENDescStats stats = WithValues({1, 2});
  const Lines report = stats.DescStats();
  ResetResStrings();
  EXPECT_EQ(report[6], "Average:\t1.5000");
  EXPECT_EQ(report[7], "Kein Modalwert");
}

TEST(DescStatsTest, TheFortySevenLabelsAreDistinct) {
  std::vector<std::string> texts;
  for (int id = kFirstDescStatsString; id <= kLastDescStatsString; ++id) {
    texts.push_back(LoadResString(static_cast<TResStringId>(id)));
  }
  ASSERT_EQ(texts.size(), 47u);
  EXPECT_EQ(texts.front(), "Number of Values:");
  EXPECT_EQ(texts.back(), "Mean of Y Values:");
  std::sort(texts.begin(), texts.end());
  EXPECT_EQ(std::adjacent_find(texts.begin(), texts.end()), texts.end());
}

// ---------------------------------------------------------------------------------------------
// Changing the values

TEST(DescStatsTest, AddValueWritesTwentyDecimalsWithoutTrailingZeros) {
  TQENDescStats stats;
  stats.AddValue(2.5);
  stats.AddValue(-0.125);
  stats.AddValue(2);
  stats.AddValue(1e-25L);
  stats.AddValue(0.1L);  // the binary value nearest 0.1, rounded to 20 decimals
  EXPECT_EQ(stats.Items(), (Lines{"2.5", "-0.125", "2.", "0.", "0.1"}));
  EXPECT_EQ(stats.NoOfValues(), 5);
}

TEST(DescStatsTest, DeleteOutsideTheListChangesNothing) {
  TQENDescStats stats = WithValues({1, 2, 3});
  const Snapshot before = Take(stats);
  stats.DeleteValue(-1);
  stats.DeleteValue(3);
  stats.DeleteValue(std::numeric_limits<LongInt>::max());
  stats.DeleteValue(std::numeric_limits<LongInt>::min());
  EXPECT_EQ(Take(stats), before);
  TQENDescStats empty;
  empty.DeleteLast();
  empty.DeleteValue(0);
  EXPECT_EQ(empty.DescStats(), Lines{"Vector is empty"});
}

TEST(DescStatsTest, DeleteRemovesValueAndLine) {
  TQENDescStats stats = WithValues({1, 2, 6});
  stats.DeleteValue(1);
  EXPECT_EQ(stats.Items(), (Lines{"1.", "6."}));
  EXPECT_EQ(Numbers(stats.Values()), (std::vector<long double>{1, 6}));
  EXPECT_EQ(stats.Mean(), 3.5L);
  stats.DeleteLast();
  EXPECT_EQ(stats.Items(), Lines{"1."});
  EXPECT_EQ(stats.Mean(), 1.0L);
}

TEST(DescStatsTest, DeleteAfterNumericSetterKeepsItemsSafe) {
  // SetValues leaves Items alone, so the two lists may differ in length.
  TQENDescStats stats = WithValues({7});
  stats.SetValues(TQENFloatVector{1.0L, 2.0L, 3.0L});
  EXPECT_EQ(stats.Items(), Lines{"7."});
  stats.DeleteValue(2);
  EXPECT_EQ(Numbers(stats.Values()), (std::vector<long double>{1, 2}));
  EXPECT_EQ(stats.Items(), Lines{"7."});
  stats.DeleteValue(0);
  EXPECT_TRUE(stats.Items().empty());
  EXPECT_EQ(stats.Mean(), 2.0L);
}

TEST(DescStatsTest, UpdatesHoldTheStatisticsUntilTheyEnd) {
  TQENDescStats stats = WithValues({1, 2});
  stats.BeginUpdate();
  stats.BeginUpdate();  // does not nest
  stats.AddValue(10);
  stats.AddValue(20);
  stats.AddValue(30);
  EXPECT_EQ(stats.Mean(), 1.5L);
  EXPECT_EQ(stats.NoOfValues(), 5);
  EXPECT_EQ(stats.Items().size(), 5u);
  stats.SetPopulation(true);
  EXPECT_EQ(stats.Variance(), 0.5L);
  const Lines report = stats.DescStats();  // ends the update
  EXPECT_EQ(report[6], "Mean:\t12.6000");
  EXPECT_EQ(stats.Mean(), 12.6L);
  stats.AddValue(0);  // no update open any more
  EXPECT_EQ(stats.Mean(), 10.5L);
}

TEST(DescStatsTest, OneEndUpdateEndsAnyNumberOfBeginUpdates) {
  TQENDescStats stats;
  stats.BeginUpdate();
  stats.BeginUpdate();
  stats.AddValue(4);
  stats.EndUpdate();
  EXPECT_EQ(stats.Mean(), 4.0L);
}

TEST(DescStatsTest, ClearCancelsAnOpenUpdate) {
  TQENDescStats stats = WithValues({1, 2});
  stats.BeginUpdate();
  stats.Clear();
  stats.AddValue(5);
  EXPECT_EQ(stats.Mean(), 5.0L);
}

TEST(DescStatsTest, IntegerSettersConvertAndKeepItems) {
  TQENDescStats stats;
  stats.SetLIntValues(TQENLIntVector{-3, 5});
  EXPECT_EQ(stats.Mean(), 1.0L);
  stats.SetLWordValues(TQENLWordVector{4294967295u, 1u});
  EXPECT_EQ(stats.Sum(), 4294967296.0L);
  stats.SetInt64Values(TQENInt64Vector{std::numeric_limits<Int64>::max(), 0});
  EXPECT_EQ(stats.Maximum(), 9223372036854775807.0L);
  EXPECT_TRUE(stats.Items().empty());
  const TQENFloatVector source{1.0L, 2.0L};
  stats.SetValues(source);
  EXPECT_EQ(Numbers(source), (std::vector<long double>{1, 2}));
  EXPECT_EQ(stats.Sum(), 3.0L);
}

TEST(DescStatsTest, IntegerGettersRoundHalvesToEven) {
  TQENDescStats stats = WithValues({2.5, 3.5, -2.5, -0.5, 1.4999L});
  EXPECT_EQ(stats.LIntValues(), (TQENLIntVector{2, 4, -2, 0, 1}));
  EXPECT_EQ(stats.Int64Values(), (TQENInt64Vector{2, 4, -2, 0, 1}));
  EXPECT_EQ(stats.LWordValues(), (TQENLWordVector{2, 4, 4294967294u, 0, 1}));
}

TEST(DescStatsTest, IntegerGettersOutOfRange) {
  TQENDescStats stats;
  stats.SetValues(TQENFloatVector{4294967296.0L + 7, 1e30L, -1e30L});
  // 2^32 + 7 keeps its low 32 bits; beyond Int64 the result is the integer indefinite -2^63,
  // whose low 32 bits are 0.
  EXPECT_EQ(stats.Int64Values(), (TQENInt64Vector{4294967303LL, std::numeric_limits<Int64>::min(),
                                                  std::numeric_limits<Int64>::min()}));
  EXPECT_EQ(stats.LIntValues(), (TQENLIntVector{7, 0, 0}));
  EXPECT_EQ(stats.LWordValues(), (TQENLWordVector{7u, 0u, 0u}));
}

TEST(DescStatsTest, SetItemsConvertsTheLines) {
  TQENDescStats stats;
  stats.SetItems(Lines{"1", " 2.5 ", "-3e1", ".5"});
  EXPECT_EQ(Numbers(stats.Values()), (std::vector<long double>{1, 2.5, -30, 0.5}));
  EXPECT_EQ(stats.Items(), (Lines{"1", " 2.5 ", "-3e1", ".5"}));
  EXPECT_EQ(stats.Minimum(), -30.0L);
}

TEST(DescStatsTest, SetItemsWithABadLineChangesNothing) {
  TQENDescStats stats = WithValues({1, 2, 3});
  const Snapshot before = Take(stats);
  EXPECT_THROW(stats.SetItems(Lines{"4", "five"}), EConvertError);
  EXPECT_THROW(stats.SetItems(Lines{""}), EConvertError);
  EXPECT_EQ(Take(stats), before);
}

TEST(DescStatsTest, LoadedConvertsItems) {
  TQENDescStats stats = WithValues({1, 2});
  stats.SetValues(TQENFloatVector{9.0L});
  stats.Loaded();
  EXPECT_EQ(Numbers(stats.Values()), (std::vector<long double>{1, 2}));
  EXPECT_EQ(stats.Mean(), 1.5L);
}

TEST(DescStatsTest, VersionIgnoresWrites) {
  TQENDescStats stats;
  stats.SetVersion("1.0");
  EXPECT_EQ(stats.Version(), "6.14.2");
}

// ---------------------------------------------------------------------------------------------
// Streaming

TEST(DescStatsStreamTest, SavedFormIsDocumented) {
  TQENDescStats stats = WithValues({1.5, -3});
  std::ostringstream out;
  stats.SaveToStream(out);
  EXPECT_EQ(out.str(),
            "TQENDescStats\nDecimalPlaces 4\nPopulation False\nVersion 6.14.2\nItems 2\n1.5\n-3.\n"
            "End\n");
}

TEST(DescStatsStreamTest, RoundTripRestoresEverything) {
  TQENDescStats stats = WithValues({0.1L, 2, 2, -7.25, 1e10L}, true);
  stats.SetDecimalPlaces(7);
  std::stringstream stream;
  stats.SaveToStream(stream);
  TQENDescStats copy = WithValues({42});
  copy.LoadFromStream(stream);
  EXPECT_EQ(Take(copy), Take(stats));
  EXPECT_TRUE(copy.Population());
  EXPECT_EQ(copy.DecimalPlaces(), 7);
}

TEST(DescStatsStreamTest, EmptyComponentRoundTrips) {
  TQENDescStats stats;
  std::stringstream stream;
  stats.SaveToStream(stream);
  TQENDescStats copy = WithValues({1, 2});
  copy.LoadFromStream(stream);
  EXPECT_EQ(copy.DescStats(), Lines{"Vector is empty"});
  EXPECT_TRUE(copy.Items().empty());
}

TEST(DescStatsStreamTest, LoadingAcceptsCarriageReturnsAndKeepsAbsentProperties) {
  std::istringstream in("TQENDescStats\r\nItems 2\r\n3\r\n5\r\nEnd\r\n");
  TQENDescStats stats = WithValues({1}, true);
  stats.SetDecimalPlaces(9);
  stats.LoadFromStream(in);
  EXPECT_EQ(stats.Mean(), 4.0L);
  EXPECT_TRUE(stats.Population());  // absent properties keep their current values
  EXPECT_EQ(stats.DecimalPlaces(), 9);
}

TEST(DescStatsStreamTest, InfinitiesAndNaNSurviveEveryRoundTrip) {
  constexpr Extended kInf = std::numeric_limits<Extended>::infinity();
  TQENDescStats stats;
  for (Extended v : {kInf, -kInf, std::numeric_limits<Extended>::quiet_NaN(), 2.5L}) {
    stats.AddValue(v);
  }
  EXPECT_EQ(stats.Items(), (Lines{"INF", "-INF", "NAN", "2.5"}));
  const auto expectSame = [](const TQENDescStats& copy) {
    const TQENFloatVector v = copy.Values();
    ASSERT_EQ(v.size(), 4u);
    EXPECT_EQ(Extended(v[0]), std::numeric_limits<Extended>::infinity());
    EXPECT_EQ(Extended(v[1]), -std::numeric_limits<Extended>::infinity());
    EXPECT_TRUE(std::isnan(Extended(v[2])));
    EXPECT_EQ(Extended(v[3]), 2.5L);
  };
  std::stringstream stream;
  stats.SaveToStream(stream);
  TQENDescStats loaded;
  loaded.LoadFromStream(stream);
  expectSame(loaded);
  TQENDescStats set;
  set.SetItems(stats.Items());
  expectSame(set);
  stats.Loaded();
  expectSame(stats);
}

TEST(DescStatsStreamTest, FailedLoadLeavesTheComponentAsItWas) {
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
}

TEST(DescStatsStreamTest, LoadErrorNamesTheLine) {
  std::istringstream in("TQENDescStats\nItems 2\n1\nabc\nEnd\n");
  TQENDescStats stats;
  try {
    stats.LoadFromStream(in);
    FAIL() << "no error";
  } catch (const EConvertError& e) {
    EXPECT_NE(std::string(e.what()).find("line 4"), std::string::npos) << e.what();
    EXPECT_NE(std::string(e.what()).find("abc"), std::string::npos) << e.what();
  }
}

}  // namespace
}  // namespace tovrin
