// The matrix edit control: a grid over a TQENFloatMatrix.
//
// The cells are a model of the control's own over the matrix (model() gives it). A cell shows
// Float2EStr(value, Decimals()); a null (empty) cell shows QENNullStr and reads as 0 in
// Matrix(), Determinant(), Rank() and every command. Typing a number into a cell, or
// model()->setData(index, "text"), stores it; text Str2Float refuses is not stored
// (MathErrorRaised carries the conversion's message and ident -1); blank text, or the Delete
// key on selected cells, makes them null.
//
// Commands are slots returning bool; indices are 0-based. Each runs the matrix unit's
// function on a copy of the whole contents, which replaces them only when the function
// returns: the element-wise functions, which stop part-way through when an element fails,
// never leave a half-changed grid. On EMathError the command returns false and emits
// MathErrorRaised(what(), Ident()); no exception leaves a command or an edit. A successful
// command leaves no null cells and emits Changed() once, as does every edit.
#pragma once

#include <QTableView>
#include <functional>
#include <optional>

#include "tovrin/foundation/TOVRINFoundation.h"

namespace tovrin {

namespace detail {
class MatrixEditModel;
}

class TQENMatrixEdit : public QTableView {
  Q_OBJECT
  Q_PROPERTY(int Rows READ Rows NOTIFY Changed)
  Q_PROPERTY(int Cols READ Cols NOTIFY Changed)
  Q_PROPERTY(int Decimals READ Decimals WRITE SetDecimals)
  Q_PROPERTY(bool ReadOnly READ ReadOnly WRITE SetReadOnly)
  Q_PROPERTY(bool HasNulls READ HasNulls NOTIFY Changed)

 public:
  explicit TQENMatrixEdit(QWidget* parent = nullptr);
  ~TQENMatrixEdit() override;

  // --- Contents -----------------------------------------------------------------------------
  // Rows() x Cols() values, a null cell read as 0.
  TQENFloatMatrix Matrix() const;
  // Replaces every cell; a ragged M is shown padded to its longest row with null cells.
  // Emits Changed().
  void SetMatrix(const TQENFloatMatrix& M);
  // Keeps the cells that stay inside; new cells are null. Negative counts count as 0.
  void SetDimensions(int Rows, int Cols);
  int Rows() const;
  int Cols() const;
  // Whether some cell, or the cell at (Row, Col), is null.
  bool HasNulls() const;
  bool IsNull(int Row, int Col) const;

  // --- Presentation -------------------------------------------------------------------------
  // Decimals shown per cell, 0..20 (values outside are clamped); default 4.
  int Decimals() const;
  void SetDecimals(int Value);
  // No cell can be edited; commands still run.
  bool ReadOnly() const;
  void SetReadOnly(bool Value);

  // --- Queries (no change) ------------------------------------------------------------------
  // MatrixDeterminant and the rank from RowEchelonFormRank, of a copy. When the library
  // raises (rsMatrixIsEmpty, rsMatrixSqr) MathErrorRaised is emitted and the result is empty
  // (or -1).
  std::optional<Extended> Determinant() const;
  int Rank() const;

  QSize sizeHint() const override;

 public slots:
  // SquareMatrix, SqrtMatrix (rsMatrixNeg), InvMatrix (rsMatrixZero), LnMatrix and Log10Matrix
  // (rsMatrixNotPos), LinearTransformMatrix (element := A x element + B); each raises
  // rsMatrixIsEmpty for a matrix with no rows.
  bool Sqr();
  bool Sqrt();
  bool Invert();
  bool Ln();
  bool Log10();
  bool LinearTransform(tovrin::Extended A, tovrin::Extended B);
  // TransposeMatrix; SwapMatrixRows, SwapMatrixCols, ScaleMatrixRow, AddMatrixRows (row
  // Target += K x row Source), with rsMatrixIsEmpty, rsInvalidRow and rsInvalidCol.
  bool Transpose();
  bool SwapRows(int Row1, int Row2);
  bool SwapCols(int Col1, int Col2);
  bool ScaleRow(int Row, tovrin::Extended K);
  bool AddRows(int Target, int Source, tovrin::Extended K);
  // RowEchelonForm (rsMatrixIsEmpty); the inverse from MatrixInverse (rsMatrixIsEmpty,
  // rsMatrixSqr, and rsNoInvert for a singular matrix); the N x N identity (N >= 0, else
  // rsInvalidValue).
  bool RowReduce();
  bool Inverse();
  bool Identity(int N);

 signals:
  void Changed();
  void MathErrorRaised(QString message, int ident);

 protected:
  void keyPressEvent(QKeyEvent* event) override;
  detail::MatrixEditModel& Model() const { return *model_; }

 private:
  void ReportError(const QString& message, int ident) const;
  // Runs a command, routing an exception to MathErrorRaised.
  bool Guard(const std::function<void()>& Command) const;
  // Runs an in-place matrix function on a copy and commits the copy when it returns.
  bool Transform(const std::function<void(TQENFloatMatrix&)>& Function);

  detail::MatrixEditModel* model_;
};

}  // namespace tovrin
