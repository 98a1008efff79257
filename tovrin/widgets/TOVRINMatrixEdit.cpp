#include "tovrin/widgets/TOVRINMatrixEdit.h"

#include <QHeaderView>
#include <QKeyEvent>
#include <QScrollBar>
#include <algorithm>

#include "tovrin/matrix/TOVRINMatrix.h"
#include "tovrin/widgets/detail/MatrixEditModel.h"

namespace tovrin {
namespace detail {

bool MatrixEditModel::IsNull(int Row, int Col) const {
  if (Row < 0 || Row >= Rows() || Col < 0 || Col >= Cols()) return false;
  return null_[static_cast<std::size_t>(Row) * cols_ + static_cast<std::size_t>(Col)];
}

void MatrixEditModel::Install(TQENFloatMatrix M, bool PaddingIsNull) {
  std::size_t cols = 0;
  for (const auto& row : M) cols = std::max(cols, row.size());
  std::vector<bool> null(M.size() * cols, false);
  std::size_t nulls = 0;
  for (std::size_t r = 0; r < M.size(); ++r) {
    if (PaddingIsNull) {
      std::fill(null.begin() + static_cast<std::ptrdiff_t>(r * cols + M[r].size()),
                null.begin() + static_cast<std::ptrdiff_t>((r + 1) * cols), true);
      nulls += cols - M[r].size();
    }
    M[r].resize(cols);
  }
  const bool sameShape = M.size() == values_.size() && cols == cols_;
  if (!sameShape) beginResetModel();
  values_ = std::move(M);
  cols_ = cols;
  null_ = std::move(null);
  nullCount_ = nulls;
  if (sameShape) {
    AllCellsChanged();
  } else {
    endResetModel();
  }
  ReportChanged();
}

void MatrixEditModel::ReplaceValues(const TQENFloatMatrix& M) { Install(M, true); }

void MatrixEditModel::Commit(TQENFloatMatrix Work) { Install(std::move(Work), false); }

void MatrixEditModel::Resize(std::size_t Rows, std::size_t Cols) {
  if (Rows == values_.size() && Cols == cols_) return;
  TQENFloatMatrix values(Rows, TQENFloatVector(Cols));
  std::vector<bool> null(Rows * Cols, true);
  std::size_t nulls = Rows * Cols;
  for (std::size_t r = 0; r < std::min(Rows, values_.size()); ++r) {
    for (std::size_t c = 0; c < std::min(Cols, cols_); ++c) {
      values[r][c] = values_[r][c];
      null[r * Cols + c] = null_[r * cols_ + c];
      if (!null[r * Cols + c]) --nulls;
    }
  }
  beginResetModel();
  values_ = std::move(values);
  cols_ = Cols;
  null_ = std::move(null);
  nullCount_ = nulls;
  endResetModel();
  ReportChanged();
}

int MatrixEditModel::rowCount(const QModelIndex& parent) const {
  return parent.isValid() ? 0 : Rows();
}

int MatrixEditModel::columnCount(const QModelIndex& parent) const {
  return parent.isValid() ? 0 : Cols();
}

QVariant MatrixEditModel::headerData(int section, Qt::Orientation, int role) const {
  if (role != Qt::DisplayRole) return {};
  return QString::number(section);
}

Extended MatrixEditModel::CellValue(const QModelIndex& index) const {
  return values_[static_cast<std::size_t>(index.row())][static_cast<std::size_t>(index.column())];
}

bool MatrixEditModel::CellIsNull(const QModelIndex& index) const {
  return IsNull(index.row(), index.column());
}

void MatrixEditModel::StoreCell(const QModelIndex& index, std::optional<Extended> Value) {
  const auto r = static_cast<std::size_t>(index.row());
  const auto c = static_cast<std::size_t>(index.column());
  values_[r][c] = Value.value_or(0);
  if (null_[r * cols_ + c] != !Value) {
    null_[r * cols_ + c] = !Value;
    Value ? --nullCount_ : ++nullCount_;
  }
}

}  // namespace detail

TQENMatrixEdit::TQENMatrixEdit(QWidget* parent)
    : QTableView(parent), model_(new detail::MatrixEditModel(this)) {
  model_->OnChanged = [this] { emit Changed(); };
  model_->OnError = [this](const QString& message, int ident) { ReportError(message, ident); };
  setModel(model_);
  setAccessibleName(tr("Matrix"));
  setWordWrap(false);
  verticalHeader()->setSectionResizeMode(QHeaderView::Fixed);
  verticalHeader()->setDefaultSectionSize(fontMetrics().height() + 6);
  horizontalHeader()->setDefaultSectionSize(fontMetrics().horizontalAdvance(QString(10, '8')));
}

TQENMatrixEdit::~TQENMatrixEdit() = default;

TQENFloatMatrix TQENMatrixEdit::Matrix() const { return model_->Values(); }
void TQENMatrixEdit::SetMatrix(const TQENFloatMatrix& M) {
  Guard([&] { model_->ReplaceValues(M); });
}

void TQENMatrixEdit::SetDimensions(int Rows, int Cols) {
  Guard([&] {
    model_->Resize(static_cast<std::size_t>(std::max(Rows, 0)),
                   static_cast<std::size_t>(std::max(Cols, 0)));
  });
}

int TQENMatrixEdit::Rows() const { return model_->Rows(); }
int TQENMatrixEdit::Cols() const { return model_->Cols(); }
bool TQENMatrixEdit::HasNulls() const { return model_->HasNulls(); }
bool TQENMatrixEdit::IsNull(int Row, int Col) const { return model_->IsNull(Row, Col); }
int TQENMatrixEdit::Decimals() const { return model_->Decimals(); }

void TQENMatrixEdit::SetDecimals(int Value) {
  model_->SetDecimals(Value);
  updateGeometry();
}

bool TQENMatrixEdit::ReadOnly() const { return model_->ReadOnly(); }
void TQENMatrixEdit::SetReadOnly(bool Value) { model_->SetReadOnly(Value); }

std::optional<Extended> TQENMatrixEdit::Determinant() const {
  std::optional<Extended> result;
  Guard([&] {
    TQENFloatMatrix work = model_->Values();
    result = MatrixDeterminant(work);
  });
  return result;
}

int TQENMatrixEdit::Rank() const {
  int result = -1;
  Guard([&] {
    TQENFloatMatrix work = model_->Values();
    LongWord rank = 0;
    RowEchelonFormRank(work, rank);
    result = static_cast<int>(rank);
  });
  return result;
}

QSize TQENMatrixEdit::sizeHint() const {
  // Room for up to eight rows and columns; larger matrices scroll.
  const int rows = std::clamp(model_->Rows(), 2, 8);
  const int cols = std::clamp(model_->Cols(), 2, 8);
  const int frame = 2 * frameWidth();
  return {verticalHeader()->sizeHint().width() + cols * horizontalHeader()->defaultSectionSize() +
              frame + 2,
          horizontalHeader()->sizeHint().height() + rows * verticalHeader()->defaultSectionSize() +
              frame + 2};
}

void TQENMatrixEdit::keyPressEvent(QKeyEvent* event) {
  if (state() != EditingState && !ReadOnly() &&
      (event->key() == Qt::Key_Delete || event->key() == Qt::Key_Backspace)) {
    model_->MakeNull(selectionModel()->selectedIndexes());
    event->accept();
    return;
  }
  QTableView::keyPressEvent(event);
}

void TQENMatrixEdit::ReportError(const QString& message, int ident) const {
  // A query reports through the signal too; emitting changes nothing the caller can see.
  emit const_cast<TQENMatrixEdit*>(this)->MathErrorRaised(message, ident);
}

bool TQENMatrixEdit::Guard(const std::function<void()>& Command) const {
  return detail::RunGuarded(
      Command, [this](const QString& message, int ident) { ReportError(message, ident); });
}

bool TQENMatrixEdit::Transform(const std::function<void(TQENFloatMatrix&)>& Function) {
  return Guard([&] {
    TQENFloatMatrix work = model_->Values();
    Function(work);
    model_->Commit(std::move(work));
  });
}

bool TQENMatrixEdit::Sqr() {
  return Transform([](TQENFloatMatrix& m) { SquareMatrix(m); });
}
bool TQENMatrixEdit::Sqrt() {
  return Transform([](TQENFloatMatrix& m) { SqrtMatrix(m); });
}
bool TQENMatrixEdit::Invert() {
  return Transform([](TQENFloatMatrix& m) { InvMatrix(m); });
}
bool TQENMatrixEdit::Ln() {
  return Transform([](TQENFloatMatrix& m) { LnMatrix(m); });
}
bool TQENMatrixEdit::Log10() {
  return Transform([](TQENFloatMatrix& m) { Log10Matrix(m); });
}
bool TQENMatrixEdit::LinearTransform(Extended A, Extended B) {
  return Transform([=](TQENFloatMatrix& m) { LinearTransformMatrix(m, A, B); });
}

bool TQENMatrixEdit::Transpose() {
  return Guard([&] { model_->Commit(TransposeMatrix(model_->Values())); });
}

// Negative indices become indices past any matrix, which the library refuses by name.
bool TQENMatrixEdit::SwapRows(int Row1, int Row2) {
  return Transform([=](TQENFloatMatrix& m) {
    SwapMatrixRows(m, static_cast<LongWord>(Row1), static_cast<LongWord>(Row2));
  });
}
bool TQENMatrixEdit::SwapCols(int Col1, int Col2) {
  return Transform([=](TQENFloatMatrix& m) {
    SwapMatrixCols(m, static_cast<LongWord>(Col1), static_cast<LongWord>(Col2));
  });
}
bool TQENMatrixEdit::ScaleRow(int Row, Extended K) {
  return Transform([=](TQENFloatMatrix& m) { ScaleMatrixRow(m, static_cast<LongWord>(Row), K); });
}
bool TQENMatrixEdit::AddRows(int Target, int Source, Extended K) {
  return Transform([=](TQENFloatMatrix& m) {
    AddMatrixRows(m, static_cast<LongWord>(Target), static_cast<LongWord>(Source), K);
  });
}

bool TQENMatrixEdit::RowReduce() {
  return Transform([](TQENFloatMatrix& m) { RowEchelonForm(m); });
}

bool TQENMatrixEdit::Inverse() {
  return Guard([&] {
    TQENFloatMatrix work = model_->Values();
    TQENFloatMatrix inverse;
    if (!MatrixInverse(work, inverse)) detail::RaiseMathError(rsNoInvert);
    model_->Commit(std::move(inverse));
  });
}

bool TQENMatrixEdit::Identity(int N) {
  return Guard([&] {
    if (N < 0) detail::RaiseMathError(rsInvalidValue);
    model_->Commit(CreateFloatIdentityMatrix(static_cast<LongWord>(N)));
  });
}

}  // namespace tovrin
