#include "tovrin/widgets/detail/GridCells.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <string>

namespace tovrin::detail {

QString CellText(Extended Value, bool IsNull, int Decimals) {
  if (IsNull) return QString::fromLatin1(QENNullStr);
  return QString::fromStdString(Float2EStr(Value, static_cast<Byte>(Decimals)));
}

QString CellEditText(Extended Value, bool IsNull) {
  if (IsNull) return QString();
  char buffer[64];
  const auto [end, error] = std::to_chars(buffer, buffer + sizeof buffer, Value);
  if (error != std::errc()) return QString::fromStdString(Float2EStr(Value, MaxGridDecimals));
  return QString::fromLatin1(buffer, static_cast<qsizetype>(end - buffer));
}

namespace {

// Str2Float's verdict on the whole text, for the message of a refused cell.
QString ConversionMessage(const QString& Text) {
  try {
    (void)Str2Float(Text.toStdString());
  } catch (const EConvertError& e) {
    return QString::fromUtf8(e.what());
  }
  return QStringLiteral("'%1' is not a number").arg(Text);
}

}  // namespace

CellInput ParseDecimalCell(const QString& Text) {
  if (Text.trimmed().isEmpty()) return {};
  try {
    return {Str2Float(Text.toStdString()), QString()};
  } catch (const EConvertError& e) {
    return {std::nullopt, QString::fromUtf8(e.what())};
  }
}

CellInput ParseFractionCell(const QString& Text) {
  const qsizetype slash = Text.indexOf(QLatin1Char('/'));
  if (slash < 0) return ParseDecimalCell(Text);
  try {
    if (Text.indexOf(QLatin1Char('/'), slash + 1) >= 0) throw EConvertError("two slashes");
    const Extended numerator = Str2Float(Text.left(slash).toStdString());
    const Extended denominator = Str2Float(Text.mid(slash + 1).toStdString());
    if (denominator == 0) throw EConvertError("zero denominator");
    return {numerator / denominator, QString()};
  } catch (const EConvertError&) {
    return {std::nullopt, ConversionMessage(Text)};
  }
}

std::optional<Fraction> BestFraction(Extended X, Int64 MaxDenominator) {
  // Past 2^62 a whole part no longer leaves room for the convergents' arithmetic.
  constexpr Extended Limit = 4611686018427387904.0L;
  if (!std::isfinite(X) || std::fabs(X) >= Limit) return std::nullopt;
  if (MaxDenominator < 1) MaxDenominator = 1;
  const bool negative = X < 0;
  const Extended target = std::fabs(X);
  // Convergents p0/q0, p1/q1 of the continued fraction of target, held in 128 bits so that
  // the step that would pass the bounds can be seen before it is taken.
  __int128 p0 = 0, q0 = 1, p1 = 1, q1 = 0;
  Extended rest = target;
  for (int term = 0; term < 80; ++term) {
    const Extended whole = std::floor(rest);
    if (whole >= Limit) break;
    const auto a = static_cast<__int128>(whole);
    if (q1 != 0 && q0 + a * q1 > MaxDenominator) {
      // The best approximation is the last convergent or the largest semiconvergent that
      // still fits, whichever lies nearer.
      const __int128 k = (MaxDenominator - q0) / q1;
      const __int128 ps = p0 + k * p1, qs = q0 + k * q1;
      const Extended semi = static_cast<Extended>(ps) / static_cast<Extended>(qs);
      const Extended last = static_cast<Extended>(p1) / static_cast<Extended>(q1);
      if (std::fabs(semi - target) < std::fabs(last - target)) p1 = ps, q1 = qs;
      break;
    }
    const __int128 p2 = p0 + a * p1, q2 = q0 + a * q1;
    if (p2 >= static_cast<__int128>(Limit)) break;
    p0 = p1, q0 = q1, p1 = p2, q1 = q2;
    const Extended fraction = rest - whole;
    if (fraction == 0) break;
    rest = 1 / fraction;
  }
  if (q1 == 0) return std::nullopt;
  const auto numerator = static_cast<Int64>(p1);
  return Fraction{negative ? -numerator : numerator, static_cast<Int64>(q1)};
}

}  // namespace tovrin::detail

namespace tovrin::detail {

std::optional<QString> ExactFractionText(Extended Value, Int64 MaxDenominator) {
  const auto f = BestFraction(Value, MaxDenominator);
  if (!f) return std::nullopt;
  const Extended approximation =
      static_cast<Extended>(f->Numerator) / static_cast<Extended>(f->Denominator);
  if (!FloatIsZero(Value - approximation)) return std::nullopt;
  if (f->Denominator == 1) return QString::number(f->Numerator);
  return QStringLiteral("%1/%2").arg(f->Numerator).arg(f->Denominator);
}

QString FractionCellText(Extended Value, bool IsNull, int Decimals, Int64 MaxDenominator) {
  if (!IsNull) {
    if (auto text = ExactFractionText(Value, MaxDenominator)) return *std::move(text);
  }
  return CellText(Value, IsNull, Decimals);
}

void GridModel::SetDecimals(int Value) {
  decimals_ = std::clamp(Value, 0, MaxGridDecimals);
  AllCellsChanged();
}

void GridModel::SetMaxDenominator(Int64 Value) {
  maxDenominator_ = std::max<Int64>(Value, 0);
  AllCellsChanged();
}

void GridModel::AllCellsChanged() {
  if (rowCount() > 0 && columnCount() > 0)
    emit dataChanged(index(0, 0), index(rowCount() - 1, columnCount() - 1));
}

void GridModel::MakeNull(const QModelIndexList& Cells) {
  bool changed = false;
  for (const QModelIndex& cell : Cells) {
    if (!checkIndex(cell, CheckIndexOption::IndexIsValid) || !IsValueCell(cell) ||
        CellIsNull(cell)) {
      continue;
    }
    StoreCell(cell, std::nullopt);
    emit dataChanged(cell, cell);
    changed = true;
  }
  if (changed) ReportChanged();
}

QString GridModel::DisplayText(const QModelIndex& index) const {
  if (maxDenominator_ > 0)
    return FractionCellText(CellValue(index), CellIsNull(index), decimals_, maxDenominator_);
  return CellText(CellValue(index), CellIsNull(index), decimals_);
}

QVariant GridModel::data(const QModelIndex& index, int role) const {
  if (!checkIndex(index, CheckIndexOption::IndexIsValid)) return {};
  if (!IsValueCell(index)) return OtherCellData(index, role);
  switch (role) {
    case Qt::DisplayRole:
    case Qt::AccessibleTextRole:
      return DisplayText(index);
    case Qt::EditRole:
      // A fraction grid opens its editor on the fraction it shows, if it shows one.
      if (maxDenominator_ > 0 && !CellIsNull(index)) {
        if (auto text = ExactFractionText(CellValue(index), maxDenominator_)) return *text;
      }
      return CellEditText(CellValue(index), CellIsNull(index));
    case Qt::TextAlignmentRole:
      return QVariant::fromValue(Qt::AlignRight | Qt::AlignVCenter);
    default:
      return {};
  }
}

bool GridModel::setData(const QModelIndex& index, const QVariant& value, int role) {
  if (role != Qt::EditRole || readOnly_ || !checkIndex(index, CheckIndexOption::IndexIsValid))
    return false;
  if (!IsValueCell(index)) return SetOtherCell(index, value);
  std::optional<Extended> stored;
  if (value.typeId() != QMetaType::QString && value.canConvert<double>()) {
    stored = static_cast<Extended>(value.toDouble());
  } else {
    const QString text = value.toString();
    // Confirming an editor without typing changes nothing.
    if (text == data(index, Qt::EditRole).toString()) return true;
    const CellInput input = maxDenominator_ > 0 ? ParseFractionCell(text) : ParseDecimalCell(text);
    if (!input.Error.isEmpty()) {
      if (OnError) OnError(input.Error, -1);
      return false;
    }
    stored = input.Value;
  }
  const bool wasNull = CellIsNull(index);
  const Extended old = CellValue(index);
  const bool unchanged =
      stored ? !wasNull && *stored == old && std::signbit(*stored) == std::signbit(old) : wasNull;
  if (unchanged) return true;
  StoreCell(index, stored);
  emit dataChanged(index, index);
  ReportChanged();
  return true;
}

Qt::ItemFlags GridModel::flags(const QModelIndex& index) const {
  if (!index.isValid()) return Qt::NoItemFlags;
  Qt::ItemFlags f = Qt::ItemIsSelectable | Qt::ItemIsEnabled | Qt::ItemNeverHasChildren;
  if (!readOnly_) f |= Qt::ItemIsEditable;
  return f;
}

QVariant GridModel::OtherCellData(const QModelIndex&, int) const { return {}; }

bool GridModel::SetOtherCell(const QModelIndex&, const QVariant&) { return false; }

}  // namespace tovrin::detail
