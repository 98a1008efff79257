#include "tovrin/widgets/TOVRINMatrixFractEdit.h"

#include "tovrin/widgets/detail/MatrixEditModel.h"

namespace tovrin {

namespace {
constexpr int DefaultMaxDenominator = 1000;
}

TQENMatrixFractEdit::TQENMatrixFractEdit(QWidget* parent) : TQENMatrixEdit(parent) {
  setAccessibleName(tr("Fraction matrix"));
  Model().SetMaxDenominator(DefaultMaxDenominator);
}

TQENMatrixFractEdit::~TQENMatrixFractEdit() = default;

int TQENMatrixFractEdit::MaxDenominator() const {
  return static_cast<int>(Model().MaxDenominator());
}

void TQENMatrixFractEdit::SetMaxDenominator(int Value) {
  Model().SetMaxDenominator(std::max(Value, 1));
}

}  // namespace tovrin
