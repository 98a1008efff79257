#include "tovrin/statistics/TOVRINDescStats.h"

#include <cmath>
#include <istream>
#include <limits>
#include <ostream>
#include <utility>

#include "tovrin/statistics/TOVRINStatistics_Sample.h"
#include "tovrin/vector/TOVRINVector.h"

namespace tovrin {
namespace {

constexpr const char* kVersion = "6.14.2";
constexpr const char* kStreamTag = "TQENDescStats";

// Round to the nearest integer, halves to even, as the x87 FIST does: a value outside Int64
// (or a NaN) gives the integer indefinite.
Int64 RoundToInt64(Extended X) {
  const Extended r = std::nearbyint(X);
  constexpr Extended kLimit = 9223372036854775808.0L;  // 2^63
  if (!(r >= -kLimit && r < kLimit)) return std::numeric_limits<Int64>::min();
  return static_cast<Int64>(r);
}

std::string Labelled(TDescStatsStringId Label, const std::string& Value) {
  std::string line = LoadResString(Label);
  line += '\t';
  line += Value;
  return line;
}

// An Items line as a value: Str2Float, or one of the spellings Float2EStr gives the values
// Str2Float refuses (AddValue writes them, so they must read back).
Extended ItemValue(const std::string& Line) {
  if (Line == "INF") return std::numeric_limits<Extended>::infinity();
  if (Line == "-INF") return -std::numeric_limits<Extended>::infinity();
  if (Line == "NAN") return std::numeric_limits<Extended>::quiet_NaN();
  return Str2Float(Line);
}

// Every line converted with ItemValue, into a fresh vector (the caller's values are left
// alone when a line is not a number).
TQENFloatVector ConvertLines(const std::vector<std::string>& Lines) {
  TQENFloatVector values;
  values.reserve(Lines.size());
  for (const std::string& line : Lines) values.push_back(ItemValue(line));
  return values;
}

[[noreturn]] void StreamError(std::size_t Line, const std::string& Message) {
  throw EConvertError(std::string(kStreamTag) + " stream, line " + std::to_string(Line) + ": " +
                      Message);
}

}  // namespace

TQENDescStats::TQENDescStats() { UpdateStats(); }

void TQENDescStats::AddValue(Extended Value) {
  std::string line = StripTChStr(Float2EStr(Value, 20), '0');
  FItems.reserve(FItems.size() + 1);
  AppendValue2Vector(FValues, Value);
  FItems.push_back(std::move(line));
  UpdateStats();
}

void TQENDescStats::DeleteValue(LongInt Index) {
  if (Index < 0 || static_cast<std::size_t>(Index) >= FValues.size()) return;
  DeleteValueFromVector(FValues, Index);
  // The numeric setters leave Items as they were, so the two lists may differ in length; a
  // line is removed only where there is one.
  if (static_cast<std::size_t>(Index) < FItems.size()) FItems.erase(FItems.begin() + Index);
  UpdateStats();
}

void TQENDescStats::DeleteLast() { DeleteValue(static_cast<LongInt>(FValues.size()) - 1); }

void TQENDescStats::Clear() {
  TQENFloatVector().swap(FValues);
  FItems.clear();
  FInUpdate = false;
  UpdateStats();
}

void TQENDescStats::BeginUpdate() { FInUpdate = true; }

void TQENDescStats::EndUpdate() {
  FInUpdate = false;
  UpdateStats();
}

void TQENDescStats::Loaded() {
  ConvertItems();
  UpdateStats();
}

void TQENDescStats::ConvertItems() {
  TQENFloatVector values = ConvertLines(FItems);
  FValues.swap(values);
}

void TQENDescStats::SetItems(const std::vector<std::string>& Lines) {
  TQENFloatVector values = ConvertLines(Lines);
  std::vector<std::string> items = Lines;
  FItems.swap(items);
  FValues.swap(values);
  UpdateStats();
}

void TQENDescStats::SetPopulation(bool Value) {
  if (Value == FPopulation) return;
  FPopulation = Value;
  UpdateStats();
}

std::string TQENDescStats::Version() const { return kVersion; }

void TQENDescStats::SetVersion(const std::string& /*Value*/) {}

void TQENDescStats::SetValues(const TQENFloatVector& V) {
  TQENFloatVector values(V.begin(), V.end());
  FValues.swap(values);
  UpdateStats();
}

void TQENDescStats::SetValues(TQENFloatVector&& V) {
  TQENFloatVector values(std::move(V));
  FValues.swap(values);
  UpdateStats();
}

namespace {
template <typename Vector>
TQENFloatVector IntegersToFloat(const Vector& V) {
  TQENFloatVector values(V.size());
  for (std::size_t i = 0; i < V.size(); ++i) values[i] = static_cast<Extended>(V[i]);
  return values;
}
}  // namespace

void TQENDescStats::SetInt64Values(const TQENInt64Vector& V) { SetValues(IntegersToFloat(V)); }
void TQENDescStats::SetLIntValues(const TQENLIntVector& V) { SetValues(IntegersToFloat(V)); }
void TQENDescStats::SetLWordValues(const TQENLWordVector& V) { SetValues(IntegersToFloat(V)); }

TQENInt64Vector TQENDescStats::Int64Values() const {
  TQENInt64Vector result(FValues.size());
  for (std::size_t i = 0; i < FValues.size(); ++i) result[i] = RoundToInt64(FValues[i]);
  return result;
}

TQENLIntVector TQENDescStats::LIntValues() const {
  TQENLIntVector result(FValues.size());
  for (std::size_t i = 0; i < FValues.size(); ++i) {
    const auto low =
        static_cast<std::uint32_t>(static_cast<std::uint64_t>(RoundToInt64(FValues[i])));
    result[i] = static_cast<LongInt>(low);
  }
  return result;
}

TQENLWordVector TQENDescStats::LWordValues() const {
  TQENLWordVector result(FValues.size());
  for (std::size_t i = 0; i < FValues.size(); ++i) {
    result[i] = static_cast<LongWord>(static_cast<std::uint64_t>(RoundToInt64(FValues[i])));
  }
  return result;
}

void TQENDescStats::UpdateStats() {
  if (FInUpdate) return;
  const std::size_t n = FValues.size();
  // The old sorted copy goes before the new one is made, so at most two copies of the data
  // are held at once.
  TQENFloatVector().swap(FSortedValues);
  if (n == 0) {
    fMax = FMean = FRange = FMedian = fMin = FMode = 0;
    FStdDev = FSum = FSumSq = FVariance = FSkew = FKurtosis = 0;
    FQtr1 = FQtr3 = FIQR = FFenceLower = FFenceUpper = 0;
    FModeExists = false;
    return;
  }
  const Extended count = static_cast<Extended>(n);
  FSortedValues = Vector2FloatVector(FValues);
  QSortVector(FSortedValues, true);

  FSum = SumVector(FValues);
  FSumSq = SumSqVector(FValues);
  FMean = FSum / count;
  const Extended ss = SumSqDiffVector(FValues, FMean);
  if (FPopulation) {
    FVariance = ss / count;
  } else {
    FVariance = n > 1 ? ss / (count - 1) : 0;
  }
  FStdDev = std::sqrt(FVariance);

  FMedian = GetMedian(FSortedValues);
  FModeExists = GetMode(FSortedValues, FMode);

  fMin = FSortedValues[0];
  fMax = FSortedValues[n - 1];
  FRange = fMax - fMin;

  if (n > 3 && FloatIsNotZero(FStdDev)) {
    FKurtosis = FPopulation ? GetPopulationKurtosis(FValues, FMean, FStdDev)
                            : GetSampleKurtosis(FValues, FMean, FStdDev);
  } else {
    FKurtosis = 0;
  }
  if (n > 2 && FloatIsNotZero(FStdDev)) {
    FSkew = FPopulation ? GetPopulationSkew(FValues, FMean, FStdDev)
                        : GetSampleSkew(FValues, FMean, FStdDev);
  } else {
    FSkew = 0;
  }

  GetQuartiles(FSortedValues, FQtr1, FQtr3);
  FIQR = FQtr3 - FQtr1;
  FFenceLower = FQtr1 - 1.5L * FIQR;
  FFenceUpper = FQtr3 + 1.5L * FIQR;
}

std::vector<std::string> TQENDescStats::DescStats() {
  if (FInUpdate) EndUpdate();
  std::vector<std::string> report;
  const std::size_t n = FValues.size();
  if (n == 0) {
    report.push_back(LoadResString(rsVectorIsEmpty));
    return report;
  }
  const auto value = [this](Extended X) { return Float2EStr(X, fDecimals); };
  report.push_back(Labelled(rsDSNoOfValues, Int2EStr(NoOfValues())));
  report.push_back(Labelled(rsDSMaximum, value(fMax)));
  report.push_back(Labelled(rsDSMinimum, value(fMin)));
  report.push_back(Labelled(rsDSRange, value(FRange)));
  report.push_back(Labelled(rsDSSum, value(FSum)));
  report.push_back(Labelled(rsDSSumSQ, value(FSumSq)));
  report.push_back(Labelled(rsDSMean, value(FMean)));
  report.push_back(FModeExists ? Labelled(rsDSMode, value(FMode)) : LoadResString(rsDSNoMode));
  report.push_back(Labelled(rsDSMedian, value(FMedian)));
  if (!FPopulation && n == 1) {
    report.push_back(LoadResString(rsDSNEVariance));
    report.push_back(LoadResString(rsDSNEStdDev));
  } else {
    report.push_back(Labelled(rsDSVariance, value(FVariance)));
    report.push_back(Labelled(rsDSStdDev, value(FStdDev)));
  }
  // Kurtosis and skew need a few values (whether or not the data are a population) and a spread.
  const auto shape = [&](std::size_t least, TDescStatsStringId too_few, TDescStatsStringId flat,
                         TDescStatsStringId label, Extended x) {
    if (n < least) return LoadResString(too_few);
    if (FloatIsZero(FStdDev)) return LoadResString(flat);
    return Labelled(label, value(x));
  };
  report.push_back(shape(4, rsDSNEKurtosis, rsDSSDKurtosis, rsDSKurtosis, FKurtosis));
  report.push_back(shape(3, rsDSNESkew, rsDSSDSkew, rsDSSkew, FSkew));
  report.push_back(Labelled(rsDSQtr1, value(FQtr1)));
  report.push_back(Labelled(rsDSQtr3, value(FQtr3)));
  report.push_back(Labelled(rsDSIQR, value(FIQR)));
  report.push_back(Labelled(rsDSLowerFence, value(FFenceLower)));
  report.push_back(Labelled(rsDSUpperFence, value(FFenceUpper)));
  return report;
}

void TQENDescStats::SaveToStream(std::ostream& Stream) const {
  Stream << kStreamTag << '\n'
         << "DecimalPlaces " << static_cast<unsigned>(fDecimals) << '\n'
         << "Population " << (FPopulation ? "True" : "False") << '\n'
         << "Version " << kVersion << '\n'
         << "Items " << FItems.size() << '\n';
  for (const std::string& line : FItems) Stream << line << '\n';
  Stream << "End\n";
}

void TQENDescStats::LoadFromStream(std::istream& Stream) {
  std::size_t line_number = 0;
  std::string line;
  const auto next_line = [&](const char* expected) {
    if (!std::getline(Stream, line))
      StreamError(line_number + 1, std::string("missing ") + expected);
    ++line_number;
    if (!line.empty() && line.back() == '\r') line.pop_back();
  };
  // "Name Value" with a single space; Value may be empty.
  const auto split = [&](std::string& name, std::string& text) {
    const std::size_t space = line.find(' ');
    name = line.substr(0, space);
    text = space == std::string::npos ? std::string() : line.substr(space + 1);
  };

  next_line(kStreamTag);
  if (line != kStreamTag) StreamError(line_number, std::string("expected '") + kStreamTag + "'");

  // Everything is read into temporaries; the component changes only once all of it is good.
  Byte decimals = fDecimals;  // what the stream does not say stays as it is
  bool population = FPopulation;
  bool seen_decimals = false, seen_population = false, seen_version = false;
  std::string name, text;
  for (;;) {
    next_line("'Items n'");
    split(name, text);
    if (name == "Items") break;
    if (name == "DecimalPlaces" && !seen_decimals) {
      seen_decimals = true;
      unsigned parsed = 0;
      std::size_t used = 0;
      bool ok = !text.empty() && text.size() <= 3 &&
                text.find_first_not_of("0123456789") == std::string::npos;
      if (ok) {
        parsed = static_cast<unsigned>(std::stoul(text, &used));
        ok = parsed <= std::numeric_limits<Byte>::max();
      }
      if (!ok) StreamError(line_number, "DecimalPlaces must be a whole number from 0 to 255");
      decimals = static_cast<Byte>(parsed);
    } else if (name == "Population" && !seen_population) {
      seen_population = true;
      if (text == "True")
        population = true;
      else if (text == "False")
        population = false;
      else
        StreamError(line_number, "Population must be True or False");
    } else if (name == "Version" && !seen_version) {
      seen_version = true;  // accepted and ignored, as SetVersion does
    } else {
      StreamError(line_number, "unexpected line '" + line + "'");
    }
  }
  if (text.empty() || text.size() > 10 ||
      text.find_first_not_of("0123456789") != std::string::npos) {
    StreamError(line_number, "Items must be followed by the number of lines");
  }
  const unsigned long long count = std::stoull(text);
  std::vector<std::string> items;
  TQENFloatVector values;
  for (unsigned long long i = 0; i < count; ++i) {
    next_line("item line");
    try {
      values.push_back(ItemValue(line));
    } catch (const EConvertError& e) {
      StreamError(line_number, e.what());
    }
    items.push_back(line);
  }
  next_line("'End'");
  if (line != "End") StreamError(line_number, "expected 'End'");

  fDecimals = decimals;
  FPopulation = population;
  FItems.swap(items);
  Loaded();
}

}  // namespace tovrin
