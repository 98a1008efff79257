#include "tovrin/widgets/studio/StudioWindow.h"

#include <QFontDatabase>
#include <QGridLayout>
#include <QGroupBox>
#include <QHBoxLayout>
#include <QPushButton>
#include <QVBoxLayout>
#include <functional>

namespace tovrin {

namespace {

// Sample rows of a small shop's monthly sales, and a matrix of fractions (determinant 64/3).
const TQENFloatVector kSales{412.5L, 398.0L, 455.25L, 431.0L, 502.75L, 478.5L, 466.0L, 521.25L};
const QStringList kMonths{"Jan", "Feb", "Mar", "Apr", "May", "Jun", "Jul", "Aug"};
const TQENFloatMatrix kMatrix{{2, 0.5L, 1}, {1.0L / 3, 3, 2}, {1, 0, 4}};

// The determinant as markup: a whole number, a fraction or a decimal.
QString ValueMarkup(Extended value) {
  for (Int64 q = 1; q <= 1000; ++q) {
    const Extended p = std::round(value * q);
    if (std::fabs(p) < 1e15L && FloatIsZero(value - p / q)) {
      const auto n = static_cast<Int64>(p);
      if (q == 1) return QString::number(n);
      return QStringLiteral("%1\\frac{%2}{%3}").arg(n < 0 ? "-" : "").arg(std::abs(n)).arg(q);
    }
  }
  return QString::fromStdString(Float2EStr(value, 6));
}

}  // namespace

StudioWindow::StudioWindow(QWidget* parent) : QWidget(parent) {
  setWindowTitle(tr("tovrin studio"));

  auto* sample = new QGroupBox(tr("Sample"));
  vector_ = new TQENLabelledVectorEdit;
  vector_->SetVector(kSales);
  vector_->SetLabels(kMonths);
  vector_->SetDecimals(2);
  report_ = new QPlainTextEdit;
  report_->setReadOnly(true);
  report_->setFont(QFontDatabase::systemFont(QFontDatabase::FixedFont));
  report_->setTabStopDistance(report_->fontMetrics().horizontalAdvance(QString(28, 'x')));
  report_->setAccessibleName(tr("Statistics report"));
  report_->setMinimumHeight(report_->fontMetrics().lineSpacing() * 22);
  auto* vectorButtons = new QHBoxLayout;
  const std::pair<QString, std::function<bool()>> vectorCommands[] = {
      {tr("Sort"), [this] { return vector_->Sort(); }},
      {tr("Reverse"), [this] { return vector_->Reverse(); }},
      {tr("Sqrt"), [this] { return vector_->Sqrt(); }},
      {tr("Ln"), [this] { return vector_->Ln(); }},
      {tr("Append 0"), [this] { return vector_->Append(0); }},
  };
  for (const auto& [name, command] : vectorCommands) {
    auto* button = new QPushButton(name);
    connect(button, &QPushButton::clicked, this, [run = command] { run(); });
    vectorButtons->addWidget(button);
  }
  auto* sampleLayout = new QVBoxLayout(sample);
  sampleLayout->addWidget(vector_, 1);
  sampleLayout->addLayout(vectorButtons);
  sampleLayout->addWidget(report_, 1);

  auto* matrixBox = new QGroupBox(tr("Matrix"));
  matrix_ = new TQENMatrixFractEdit;
  matrix_->SetMatrix(kMatrix);
  facts_ = new TQENMathLabel;
  QFont factsFont = facts_->font();
  factsFont.setPointSizeF(factsFont.pointSizeF() * 1.3);
  facts_->setFont(factsFont);
  auto* matrixButtons = new QGridLayout;
  const std::pair<QString, std::function<bool()>> matrixCommands[] = {
      {tr("Row reduce"), [this] { return matrix_->RowReduce(); }},
      {tr("Inverse"), [this] { return matrix_->Inverse(); }},
      {tr("Transpose"), [this] { return matrix_->Transpose(); }},
      {tr("Swap rows 0, 1"), [this] { return matrix_->SwapRows(0, 1); }},
      {tr("Square"), [this] { return matrix_->Sqr(); }},
      {tr("Sqrt"), [this] { return matrix_->Sqrt(); }},
      {tr("Reciprocal"), [this] { return matrix_->Invert(); }},
      {tr("Ln"), [this] { return matrix_->Ln(); }},
      {tr("Log10"), [this] { return matrix_->Log10(); }},
      {tr("Identity 3"), [this] { return matrix_->Identity(3); }},
      {tr("Reset"),
       [this] {
         matrix_->SetMatrix(kMatrix);
         return true;
       }},
  };
  int slot = 0;
  for (const auto& [name, command] : matrixCommands) {
    auto* button = new QPushButton(name);
    connect(button, &QPushButton::clicked, this, [run = command] { run(); });
    matrixButtons->addWidget(button, slot / 3, slot % 3);
    ++slot;
  }
  auto* matrixLayout = new QVBoxLayout(matrixBox);
  matrixLayout->addWidget(matrix_, 1);
  matrixLayout->addLayout(matrixButtons);
  matrixLayout->addWidget(facts_);
  matrixLayout->addWidget(new TQENMathLabel(
      QStringLiteral("s^2 = \\frac{1}{n-1} \\sum_{i=1}^{n} (x_i - m)^2,   \\sigma \\approx s")));
  matrixLayout->addStretch();

  status_ = new QLabel;
  status_->setAccessibleName(tr("Last error"));
  auto* panes = new QHBoxLayout;
  panes->addWidget(sample, 1);
  panes->addWidget(matrixBox, 1);
  auto* layout = new QVBoxLayout(this);
  layout->addLayout(panes, 1);
  layout->addWidget(status_);

  connect(vector_, &TQENVectorEdit::Changed, this, &StudioWindow::UpdateReport);
  connect(matrix_, &TQENMatrixEdit::Changed, this, &StudioWindow::UpdateMatrixFacts);
  connect(vector_, &TQENVectorEdit::MathErrorRaised, this, &StudioWindow::ShowError);
  connect(matrix_, &TQENMatrixEdit::MathErrorRaised, this, &StudioWindow::ShowError);
  UpdateReport();
  UpdateMatrixFacts();
}

void StudioWindow::UpdateReport() {
  stats_.SetDecimalPlaces(static_cast<Byte>(vector_->Decimals()));
  stats_.SetValues(vector_->Vector());
  QStringList lines;
  for (const std::string& line : stats_.DescStats()) lines.append(QString::fromStdString(line));
  report_->setPlainText(lines.join('\n'));
}

void StudioWindow::UpdateMatrixFacts() {
  QStringList facts;
  if (const auto det = matrix_->Determinant()) facts.append("det A = " + ValueMarkup(*det));
  const int rank = matrix_->Rank();
  if (rank >= 0) facts.append(QStringLiteral("rank A = %1").arg(rank));
  facts_->SetText(facts.join(QStringLiteral(",   ")));
}

void StudioWindow::ShowError(const QString& message, int ident) {
  status_->setText(ident >= 0
                       ? tr("%1 (%2)").arg(message, ResStringName(static_cast<TResStringId>(ident)))
                       : message);
}

}  // namespace tovrin
