#include "tovrin/widgets/TOVRINVectorEdit.h"

#include <QHeaderView>
#include <QKeyEvent>
#include <QScrollBar>
#include <algorithm>
#include <cmath>
#include <numeric>

#include "tovrin/vector/TOVRINVector.h"
#include "tovrin/widgets/detail/GridCells.h"

namespace tovrin {
namespace detail {

// The values as one TQENFloatVector (a null cell holds 0), a null mask, and for the labelled
// grid one label per row (a null QString when the row has none).
class VectorEditModel : public GridModel {
 public:
  VectorEditModel(bool Labelled, QObject* parent) : GridModel(parent), labelled_(Labelled) {}

  const TQENFloatVector& Values() const { return values_; }
  bool IsLabelled() const { return labelled_; }
  int Count() const { return static_cast<int>(values_.size()); }
  bool HasNulls() const { return nullCount_ > 0; }
  bool IsNull(int Row) const {
    return Row >= 0 && Row < Count() && null_[static_cast<std::size_t>(Row)];
  }

  QStringList Labels() const {
    QStringList list;
    for (const QString& label : labels_) list.append(label.isNull() ? QString("") : label);
    while (!list.isEmpty() && labels_[static_cast<std::size_t>(list.size() - 1)].isNull())
      list.removeLast();
    return list;
  }

  void SetLabels(const QStringList& Labels) {
    labels_.assign(Labels.begin(), Labels.end());
    // An empty entry is an empty label; only rows past the list have none.
    for (QString& label : labels_)
      if (label.isNull()) label = QString("");
    EnsureLabels(values_.size());
    if (labelled_ && Count() > 0) emit dataChanged(index(0, 0), index(Count() - 1, 0));
  }

  void ReplaceValues(const TQENFloatVector& V) {
    // Everything is allocated before the views are told, so a failure leaves them consistent.
    TQENFloatVector values = V;
    std::vector<bool> null(values.size(), false);
    EnsureLabels(values.size());
    beginResetModel();
    values_ = std::move(values);
    null_ = std::move(null);
    nullCount_ = 0;
    endResetModel();
    ReportChanged();
  }

  void Resize(std::size_t N) {
    const std::size_t old = values_.size();
    if (N == old) return;
    if (N > old) {
      values_.reserve(N), null_.reserve(N);
      EnsureLabels(N);
      beginInsertRows(QModelIndex(), static_cast<int>(old), static_cast<int>(N - 1));
      values_.resize(N);
      null_.resize(N, true);
      nullCount_ += N - old;
      endInsertRows();
    } else {
      beginRemoveRows(QModelIndex(), static_cast<int>(N), static_cast<int>(old - 1));
      nullCount_ -= static_cast<std::size_t>(std::count(null_.begin() + N, null_.end(), true));
      values_.resize(N), null_.resize(N);
      endRemoveRows();
    }
    ReportChanged();
  }

  void MakeAllNull() {
    std::fill(values_.begin(), values_.end(), PackedExtended(0));
    null_.assign(values_.size(), true);
    nullCount_ = values_.size();
    AllCellsChanged();
    ReportChanged();
  }

  // The values become Work, none null; Order, when given, is the old row of each new row and
  // carries the labels along.
  void Commit(TQENFloatVector Work, const std::vector<std::size_t>& Order = {}) {
    // Everything is allocated before the views are told, so a failure leaves them consistent.
    std::vector<bool> null(Work.size(), false);
    EnsureLabels(Work.size());
    std::vector<QString> labels;
    if (!Order.empty()) {
      labels = labels_;
      for (std::size_t row = 0; row < Order.size(); ++row) labels[row] = labels_[Order[row]];
    }
    const bool sameCount = Work.size() == values_.size();
    if (!sameCount) beginResetModel();
    values_ = std::move(Work);
    null_ = std::move(null);
    nullCount_ = 0;
    if (!Order.empty()) labels_ = std::move(labels);
    if (sameCount) {
      AllCellsChanged();
    } else {
      endResetModel();
    }
    ReportChanged();
  }

  // AddValue2Vector's rule: an Index that is not a position appends.
  void InsertRow(int Index, Extended Value) {
    const std::size_t n = values_.size();
    const std::size_t row =
        Index >= 0 && static_cast<std::size_t>(Index) < n ? static_cast<std::size_t>(Index) : n;
    // Reserved first, so that nothing can fail between beginInsertRows and endInsertRows.
    values_.reserve(n + 1), null_.reserve(n + 1);
    EnsureLabels(n);
    labels_.reserve(labels_.size() + 1);
    beginInsertRows(QModelIndex(), static_cast<int>(row), static_cast<int>(row));
    AddValue2Vector(values_, Value, Index);
    null_.insert(null_.begin() + static_cast<std::ptrdiff_t>(row), false);
    labels_.insert(labels_.begin() + static_cast<std::ptrdiff_t>(row), QString());
    endInsertRows();
    ReportChanged();
  }

  void RemoveRow(int Index) {
    if (Index < 0 || Index >= Count()) detail::RaiseMathError(rsInvalidValue);
    const auto row = static_cast<std::size_t>(Index);
    beginRemoveRows(QModelIndex(), Index, Index);
    if (null_[row]) --nullCount_;
    DeleteValueFromVector(values_, Index);
    null_.erase(null_.begin() + static_cast<std::ptrdiff_t>(row));
    labels_.erase(labels_.begin() + static_cast<std::ptrdiff_t>(row));
    endRemoveRows();
    ReportChanged();
  }

  int rowCount(const QModelIndex& parent = QModelIndex()) const override {
    return parent.isValid() ? 0 : Count();
  }
  int columnCount(const QModelIndex& parent = QModelIndex()) const override {
    return parent.isValid() ? 0 : (labelled_ ? 2 : 1);
  }

  QVariant headerData(int section, Qt::Orientation orientation, int role) const override {
    if (role != Qt::DisplayRole) return {};
    if (orientation == Qt::Vertical) return QString::number(section);
    if (labelled_ && section == 0) return QObject::tr("Label");
    return QObject::tr("Value");
  }

 protected:
  bool IsValueCell(const QModelIndex& index) const override {
    return index.column() == (labelled_ ? 1 : 0);
  }
  Extended CellValue(const QModelIndex& index) const override {
    return values_[static_cast<std::size_t>(index.row())];
  }
  bool CellIsNull(const QModelIndex& index) const override {
    return null_[static_cast<std::size_t>(index.row())];
  }
  void StoreCell(const QModelIndex& index, std::optional<Extended> Value) override {
    const auto row = static_cast<std::size_t>(index.row());
    values_[row] = Value.value_or(0);
    if (null_[row] != !Value) {
      null_[row] = !Value;
      Value ? --nullCount_ : ++nullCount_;
    }
  }

  QVariant OtherCellData(const QModelIndex& index, int role) const override {
    const QString& label = labels_[static_cast<std::size_t>(index.row())];
    switch (role) {
      case Qt::DisplayRole:
      case Qt::AccessibleTextRole:
        return label.isNull() ? QString::fromStdString(LoadResString(rsNA)) : label;
      case Qt::EditRole:
        return label.isNull() ? QString("") : label;
      default:
        return {};
    }
  }

  bool SetOtherCell(const QModelIndex& index, const QVariant& value) override {
    labels_[static_cast<std::size_t>(index.row())] = value.toString();
    emit dataChanged(index, index);
    return true;
  }

 private:
  // Labels are kept for every row and also past the last one, for rows added later.
  void EnsureLabels(std::size_t Rows) {
    if (labels_.size() < Rows) labels_.resize(Rows);
  }

  bool labelled_;
  TQENFloatVector values_;
  std::vector<bool> null_;
  std::size_t nullCount_ = 0;
  std::vector<QString> labels_;
};

}  // namespace detail

namespace {

// The order that sorts V stably, NaNs last: the labelled grid moves labels with their values.
std::vector<std::size_t> SortingOrder(const TQENFloatVector& V, bool Ascending) {
  std::vector<std::size_t> order(V.size());
  std::iota(order.begin(), order.end(), std::size_t{0});
  std::stable_sort(order.begin(), order.end(), [&](std::size_t a, std::size_t b) {
    const Extended x = V[a], y = V[b];
    if (std::isnan(x) || std::isnan(y)) return !std::isnan(x) && std::isnan(y);
    return Ascending ? x < y : y < x;
  });
  return order;
}

}  // namespace

TQENVectorEdit::TQENVectorEdit(QWidget* parent) : TQENVectorEdit(false, parent) {}

TQENVectorEdit::TQENVectorEdit(bool Labelled, QWidget* parent)
    : QTableView(parent), model_(new detail::VectorEditModel(Labelled, this)) {
  model_->OnChanged = [this] { emit Changed(); };
  model_->OnError = [this](const QString& message, int ident) { ReportError(message, ident); };
  setModel(model_);
  setAccessibleName(Labelled ? tr("Labelled vector") : tr("Vector"));
  setWordWrap(false);
  horizontalHeader()->setStretchLastSection(true);
  // Uniform row heights keep a million rows as cheap as ten.
  verticalHeader()->setSectionResizeMode(QHeaderView::Fixed);
  verticalHeader()->setDefaultSectionSize(fontMetrics().height() + 6);
}

TQENVectorEdit::~TQENVectorEdit() = default;

TQENFloatVector TQENVectorEdit::Vector() const { return model_->Values(); }
void TQENVectorEdit::SetVector(const TQENFloatVector& V) {
  Guard([&] { model_->ReplaceValues(V); });
}
int TQENVectorEdit::Count() const { return model_->Count(); }

void TQENVectorEdit::SetCount(int N) {
  Guard([&] { model_->Resize(static_cast<std::size_t>(std::max(N, 0))); });
}

bool TQENVectorEdit::HasNulls() const { return model_->HasNulls(); }
bool TQENVectorEdit::IsNull(int Index) const { return model_->IsNull(Index); }
int TQENVectorEdit::Decimals() const { return model_->Decimals(); }

void TQENVectorEdit::SetDecimals(int Value) {
  model_->SetDecimals(Value);
  updateGeometry();
}

bool TQENVectorEdit::ReadOnly() const { return model_->ReadOnly(); }

void TQENVectorEdit::SetReadOnly(bool Value) { model_->SetReadOnly(Value); }

QSize TQENVectorEdit::sizeHint() const {
  // Wide enough for a six-digit whole part at the chosen decimals, tall enough for ten rows.
  const QFontMetrics metrics(font());
  const int valueWidth =
      metrics.horizontalAdvance(QString(7 + model_->Decimals(), QLatin1Char('8'))) + 16;
  const int labelWidth = model_->IsLabelled() ? metrics.horizontalAdvance(QString(12, 'M')) : 0;
  const int rows = std::clamp(model_->Count(), 3, 10);
  const int frame = 2 * frameWidth();
  return {verticalHeader()->sizeHint().width() + labelWidth + valueWidth +
              verticalScrollBar()->sizeHint().width() + frame,
          horizontalHeader()->sizeHint().height() + rows * verticalHeader()->defaultSectionSize() +
              frame};
}

void TQENVectorEdit::keyPressEvent(QKeyEvent* event) {
  if (state() != EditingState && !ReadOnly() &&
      (event->key() == Qt::Key_Delete || event->key() == Qt::Key_Backspace)) {
    model_->MakeNull(selectionModel()->selectedIndexes());
    event->accept();
    return;
  }
  QTableView::keyPressEvent(event);
}

void TQENVectorEdit::ReportError(const QString& message, int ident) {
  emit MathErrorRaised(message, ident);
}

// Each command works on a copy of the values, which replaces them only when the library
// function returns.
bool TQENVectorEdit::Guard(const std::function<void()>& Command) {
  return detail::RunGuarded(
      Command, [this](const QString& message, int ident) { ReportError(message, ident); });
}

bool TQENVectorEdit::Sort(bool Ascending) {
  return Guard([&] {
    if (model_->IsLabelled()) {
      const auto order = SortingOrder(model_->Values(), Ascending);
      TQENFloatVector sorted(order.size());
      for (std::size_t i = 0; i < order.size(); ++i) sorted[i] = model_->Values()[order[i]];
      model_->Commit(std::move(sorted), order);
    } else {
      TQENFloatVector work = model_->Values();
      QSortVector(work, Ascending);
      model_->Commit(std::move(work));
    }
  });
}

bool TQENVectorEdit::Reverse() {
  return Guard([&] {
    std::vector<std::size_t> order(model_->Values().size());
    for (std::size_t i = 0; i < order.size(); ++i) order[i] = order.size() - 1 - i;
    model_->Commit(ReverseVector(model_->Values()), order);
  });
}

bool TQENVectorEdit::Clear() {
  return Guard([&] { model_->MakeAllNull(); });
}

bool TQENVectorEdit::Transform(void (*Function)(TQENFloatVector&)) {
  return Guard([&] {
    TQENFloatVector work = model_->Values();
    Function(work);
    model_->Commit(std::move(work));
  });
}

bool TQENVectorEdit::Fill(Extended Value) {
  return Guard([&] {
    TQENFloatVector work = model_->Values();
    FillVector(work, Value);
    model_->Commit(std::move(work));
  });
}

bool TQENVectorEdit::Sqr() { return Transform(SquareVector); }
bool TQENVectorEdit::Sqrt() { return Transform(SqrtVector); }
bool TQENVectorEdit::Invert() { return Transform(InvVector); }
bool TQENVectorEdit::Ln() { return Transform(LnVector); }
bool TQENVectorEdit::Log10() { return Transform(Log10Vector); }

bool TQENVectorEdit::LinearTransform(Extended A, Extended B) {
  return Guard([&] {
    TQENFloatVector work = model_->Values();
    LinearTransformVector(work, A, B);
    model_->Commit(std::move(work));
  });
}

bool TQENVectorEdit::Append(Extended Value) {
  return Guard([&] { model_->InsertRow(-1, Value); });
}

bool TQENVectorEdit::Insert(int Index, Extended Value) {
  return Guard([&] { model_->InsertRow(Index, Value); });
}

bool TQENVectorEdit::Delete(int Index) {
  return Guard([&] { model_->RemoveRow(Index); });
}

TQENLabelledVectorEdit::TQENLabelledVectorEdit(QWidget* parent) : TQENVectorEdit(true, parent) {}
TQENLabelledVectorEdit::~TQENLabelledVectorEdit() = default;
QStringList TQENLabelledVectorEdit::Labels() const { return Model().Labels(); }
void TQENLabelledVectorEdit::SetLabels(const QStringList& Labels) { Model().SetLabels(Labels); }

}  // namespace tovrin
