// What the grid controls share: how a cell's value becomes text and text a value, and the one
// route by which a command's failure reaches the MathErrorRaised signal instead of Qt's event
// loop.
#pragma once

#include <QAbstractTableModel>
#include <QString>
#include <exception>
#include <functional>
#include <optional>
#include <utility>

#include "tovrin/foundation/TOVRINFoundation.h"

namespace tovrin::detail {

// The most decimals a grid shows, and the default.
inline constexpr int MaxGridDecimals = 20;
inline constexpr int DefaultGridDecimals = 4;

// A cell's displayed text: Float2EStr(Value, Decimals), or QENNullStr for a null cell.
QString CellText(Extended Value, bool IsNull, int Decimals);

// The text an editor opens with: the shortest decimal that reads back as exactly Value, so
// that confirming an edit without typing keeps the value bit for bit. Empty for a null cell.
QString CellEditText(Extended Value, bool IsNull);

// The outcome of reading a cell's typed text: a value, a null (the text was blank) or a
// refusal carrying the conversion's message.
struct CellInput {
  std::optional<Extended> Value;  // empty: the cell becomes null (when Error is empty)
  QString Error;                  // not empty: the text was refused
};

// Reads decimal text with Str2Float; blank text means null.
CellInput ParseDecimalCell(const QString& Text);

// Reads a fraction "p/q" (each part as Str2Float reads it, q not zero) or a decimal.
CellInput ParseFractionCell(const QString& Text);

// The fraction p/q with 1 <= q <= MaxDenominator nearest to X (the best rational
// approximation, found through X's continued fraction and its semiconvergents), or nothing
// when X is not finite or its whole part does not fit in 64 bits.
struct Fraction {
  Int64 Numerator;
  Int64 Denominator;
};
std::optional<Fraction> BestFraction(Extended X, Int64 MaxDenominator);

// "p/q", or "p" for a whole number, when the best fraction with a denominator up to
// MaxDenominator lies within QENTolerance of Value; otherwise nothing.
std::optional<QString> ExactFractionText(Extended Value, Int64 MaxDenominator);

// A cell's displayed text in a fraction grid: ExactFractionText, else CellText.
QString FractionCellText(Extended Value, bool IsNull, int Decimals, Int64 MaxDenominator);

// The part of a grid's model that concerns one value cell: how it is shown, edited and
// stored, for vector and matrix grids alike. A derived model says which cells hold values and
// how they are kept; this class turns edits into stored values, refusals and change reports.
class GridModel : public QAbstractTableModel {
 public:
  explicit GridModel(QObject* parent) : QAbstractTableModel(parent) {}

  // Told once after every change of contents, and of every refused cell text.
  std::function<void()> OnChanged;
  std::function<void(const QString&, int)> OnError;

  int Decimals() const { return decimals_; }
  void SetDecimals(int Value);
  bool ReadOnly() const { return readOnly_; }
  void SetReadOnly(bool Value) { readOnly_ = Value; }
  // 0: values shown as decimals; otherwise as fractions with denominators up to this.
  Int64 MaxDenominator() const { return maxDenominator_; }
  void SetMaxDenominator(Int64 Value);

  QVariant data(const QModelIndex& index, int role = Qt::DisplayRole) const override;
  bool setData(const QModelIndex& index, const QVariant& value, int role = Qt::EditRole) override;
  Qt::ItemFlags flags(const QModelIndex& index) const override;

  // Every cell whose text may have changed (all of them) is repainted.
  void AllCellsChanged();
  // The Delete key: the selected value cells become null, one change in all.
  void MakeNull(const QModelIndexList& Cells);

 protected:
  virtual bool IsValueCell(const QModelIndex& index) const = 0;
  virtual Extended CellValue(const QModelIndex& index) const = 0;
  virtual bool CellIsNull(const QModelIndex& index) const = 0;
  // Stores a value, or a null for an empty optional, in a valid value cell.
  virtual void StoreCell(const QModelIndex& index, std::optional<Extended> Value) = 0;
  // Cells that hold no value (a label column).
  virtual QVariant OtherCellData(const QModelIndex& index, int role) const;
  virtual bool SetOtherCell(const QModelIndex& index, const QVariant& value);

  void ReportChanged() {
    if (OnChanged) OnChanged();
  }

 private:
  QString DisplayText(const QModelIndex& index) const;

  int decimals_ = DefaultGridDecimals;
  bool readOnly_ = false;
  Int64 maxDenominator_ = 0;
};

// Runs Command, which changes nothing outside itself until it succeeds. An EMathError is
// handed to Report as its what() and Ident(); any other exception (memory exhausted, a
// conversion error) as its what() and -1. Returns whether Command completed.
template <class Command, class Reporter>
bool RunGuarded(Command&& command, Reporter&& Report) {
  try {
    std::forward<Command>(command)();
    return true;
  } catch (const EMathError& e) {
    Report(QString::fromUtf8(e.what()), static_cast<int>(e.Ident()));
  } catch (const std::exception& e) {
    Report(QString::fromUtf8(e.what()), -1);
  } catch (...) {
    Report(QStringLiteral("unknown error"), -1);
  }
  return false;
}

}  // namespace tovrin::detail
