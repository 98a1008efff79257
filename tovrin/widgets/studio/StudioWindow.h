// The tovrin-studio window: a vector edit with its live statistics report, and a fraction
// matrix edit with its commands, determinant and rank.
#pragma once

#include <QLabel>
#include <QPlainTextEdit>
#include <QWidget>

#include "tovrin/statistics/TOVRINDescStats.h"
#include "tovrin/widgets/TOVRINWidgets.h"

namespace tovrin {

class StudioWindow : public QWidget {
  Q_OBJECT

 public:
  explicit StudioWindow(QWidget* parent = nullptr);

 private:
  void UpdateReport();
  void UpdateMatrixFacts();
  void ShowError(const QString& message, int ident);

  TQENLabelledVectorEdit* vector_;
  QPlainTextEdit* report_;
  TQENMatrixFractEdit* matrix_;
  TQENMathLabel* facts_;
  QLabel* status_;
  TQENDescStats stats_;
};

}  // namespace tovrin
