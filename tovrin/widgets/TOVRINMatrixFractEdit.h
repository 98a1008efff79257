// The fraction matrix edit: a TQENMatrixEdit that shows each value as a fraction when one
// with a denominator up to MaxDenominator() lies within QENTolerance of it ("1/3", "-5/2", "7"
// for whole numbers; the best rational approximation with that bound), and other values as
// decimals. Typing "2/3", "-1/4" or a decimal stores the value. Row reduction of a matrix of
// small integers thus reads as exact fractions.
#pragma once

#include "tovrin/widgets/TOVRINMatrixEdit.h"

namespace tovrin {

class TQENMatrixFractEdit : public TQENMatrixEdit {
  Q_OBJECT
  Q_PROPERTY(int MaxDenominator READ MaxDenominator WRITE SetMaxDenominator)

 public:
  explicit TQENMatrixFractEdit(QWidget* parent = nullptr);
  ~TQENMatrixFractEdit() override;

  // The largest denominator shown, at least 1; default 1000.
  int MaxDenominator() const;
  void SetMaxDenominator(int Value);
};

}  // namespace tovrin
