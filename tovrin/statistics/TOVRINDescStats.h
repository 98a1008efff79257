// The descriptive-statistics component TQENDescStats.
//
// The component holds a list of values, keeps a full set of descriptive statistics of them
// up to date after every change, and renders them as a labelled text report (DescStats).
// The values live twice: as numbers (Values) and as text lines (Items), one per value in the
// same order. AddValue, DeleteValue, DeleteLast, Clear and SetItems keep both in step; the
// numeric setters (SetValues, SetInt64Values, ...) replace the numbers only.
//
// Every change of the values or of Population recomputes every statistic at once, unless an
// update is open: between BeginUpdate and EndUpdate the statistics keep the values of the
// last recomputation. Updates do not nest; one EndUpdate ends any number of BeginUpdate calls.
//
// The component raises nothing of its own: an empty list, too few values and a zero spread
// are reported in the text of the report. A line of Items is read with Str2Float, except the
// three lines the component itself writes for values Str2Float refuses: "INF", "-INF" and
// "NAN" (Float2EStr's spellings), so every value AddValue accepts survives Items, SetItems and
// the stream. Any other line that is not a number raises EConvertError; SetItems and
// LoadFromStream then leave the component exactly as it was.
#pragma once

#include <iosfwd>
#include <string>
#include <vector>

#include "tovrin/foundation/TOVRINFoundation.h"
#include "tovrin/statistics/TOVRIN_RS_DescStats.h"

namespace tovrin {

class TQENDescStats {
 public:
  // An empty component: no values, every statistic 0, no mode, 4 decimal places, a sample.
  TQENDescStats();

  // --- Changing the values ------------------------------------------------------------------
  // Appends Value; its Items line is Value with 20 decimals and the trailing zeros removed.
  void AddValue(Extended Value);
  // Removes the value at Index (0-based) and its Items line; an Index outside the list is
  // ignored.
  void DeleteValue(LongInt Index);
  // Removes the last value; does nothing on an empty list.
  void DeleteLast();
  // Removes every value and cancels an open update.
  void Clear();
  void BeginUpdate();
  // Ends the update (however many BeginUpdate calls opened it) and recomputes.
  void EndUpdate();
  // Converts the Items lines to the values and recomputes: the last step of loading.
  void Loaded();

  // --- The report ---------------------------------------------------------------------------
  // One line per statistic: label, one TAB, value (Float2EStr with DecimalPlaces decimals;
  // the count with Int2EStr). Statistics that cannot be computed get a bare line instead
  // ("No Modal Value", "Not enough Values for Skew", ...). An empty list gives the single
  // line LoadResString(rsVectorIsEmpty). Ends an open update first.
  std::vector<std::string> DescStats();

  // --- Published, writable properties -------------------------------------------------------
  Byte DecimalPlaces() const { return fDecimals; }
  void SetDecimalPlaces(Byte Value) { fDecimals = Value; }
  const std::vector<std::string>& Items() const { return FItems; }
  // Replaces the lines, converts them (Str2Float) and recomputes. A line that is not a
  // number raises EConvertError and leaves the component unchanged.
  void SetItems(const std::vector<std::string>& Lines);
  bool Population() const { return FPopulation; }
  // True: the values are a whole population (divisor n); False: a sample (divisor n - 1).
  void SetPopulation(bool Value);
  // Always "6.14.2"; writing is accepted and ignored (the property exists to be streamed).
  std::string Version() const;
  void SetVersion(const std::string& Value);

  // --- Statistics (read-only) ---------------------------------------------------------------
  LongInt NoOfValues() const { return static_cast<LongInt>(FValues.size()); }
  Extended Maximum() const { return fMax; }
  Extended Minimum() const { return fMin; }
  Extended Range() const { return FRange; }
  Extended Sum() const { return FSum; }
  Extended SumSq() const { return FSumSq; }
  Extended Mean() const { return FMean; }
  Extended Median() const { return FMedian; }
  // The modal value when ModeExists; otherwise whatever GetMode left there.
  Extended Mode() const { return FMode; }
  bool ModeExists() const { return FModeExists; }
  Extended Variance() const { return FVariance; }
  Extended StdDev() const { return FStdDev; }
  Extended Kurtosis() const { return FKurtosis; }
  Extended Skew() const { return FSkew; }
  Extended Quartile1st() const { return FQtr1; }
  Extended Quartile3rd() const { return FQtr3; }
  Extended IQR() const { return FIQR; }
  Extended FenceLower() const { return FFenceLower; }
  Extended FenceUpper() const { return FFenceUpper; }

  // --- Public properties --------------------------------------------------------------------
  // The values sorted ascending, as of the last recomputation.
  const TQENFloatVector& SortedValues() const { return FSortedValues; }
  const TQENFloatVector& Values() const { return FValues; }
  // The setters replace the values (not the Items lines) and recompute. The rvalue form
  // takes the vector over without a copy, for large data.
  void SetValues(const TQENFloatVector& V);
  void SetValues(TQENFloatVector&& V);
  void SetInt64Values(const TQENInt64Vector& V);
  void SetLIntValues(const TQENLIntVector& V);
  void SetLWordValues(const TQENLWordVector& V);
  // The values rounded to the nearest integer, halves to even. A value outside Int64 (or a
  // NaN) gives the integer indefinite, -2^63; the 32-bit forms keep the low 32 bits of the
  // 64-bit result.
  TQENInt64Vector Int64Values() const;
  TQENLIntVector LIntValues() const;
  TQENLWordVector LWordValues() const;

  // --- Streaming ----------------------------------------------------------------------------
  // The writable published properties as text, one per line:
  //
  //   TQENDescStats
  //   DecimalPlaces 4
  //   Population False
  //   Version 6.14.2
  //   Items 2
  //   1.5
  //   -3
  //   End
  //
  // "Items n" is followed by exactly n lines, each one Items line as it stands. Lines end with
  // '\n' (a '\r' before it is ignored on loading). A property line that is absent keeps the
  // component's current value of that property.
  void SaveToStream(std::ostream& Stream) const;
  // Reads what SaveToStream writes, then ends with Loaded. A malformed stream raises
  // EConvertError naming the line, and so does an item that is not a number; either way the
  // component is left exactly as it was.
  void LoadFromStream(std::istream& Stream);

 private:
  void UpdateStats();
  void ConvertItems();

  bool FInUpdate = false;
  Byte fDecimals = 4;
  bool FPopulation = false;
  std::vector<std::string> FItems;
  TQENFloatVector FValues;
  TQENFloatVector FSortedValues;
  // The statistics of the last update.
  Extended fMin = 0, fMax = 0, FRange = 0, FSum = 0, FSumSq = 0;
  Extended FMean = 0, FMedian = 0, FMode = 0, FVariance = 0, FStdDev = 0, FSkew = 0, FKurtosis = 0;
  Extended FQtr1 = 0, FQtr3 = 0, FIQR = 0, FFenceLower = 0, FFenceUpper = 0;
  bool FModeExists = false;
};

}  // namespace tovrin
