// The vector edit controls: a one-column grid over a TQENFloatVector (TQENVectorEdit) and the
// same grid with a label column before the values (TQENLabelledVectorEdit).
//
// The cells are a model of the control's own over the vector (model() gives it; there is no
// item object per cell), so a vector of a million values opens, scrolls and sorts at the
// speed of the library call. A cell shows Float2EStr(value, Decimals()); a null (empty) cell
// shows QENNullStr and reads as 0 in Vector() and in every command. Typing a number into a
// cell, or model()->setData(index, "text"), stores it; text Str2Float refuses is not stored
// (MathErrorRaised carries the conversion's message and ident -1); blank text, or the Delete
// key on selected cells, makes them null.
//
// Commands are slots returning bool. Each runs the vector unit's function of its name on the
// whole contents; when that raises EMathError the contents stay exactly as they were, the
// command returns false and MathErrorRaised(what(), Ident()) is emitted. No exception leaves a
// command or an edit. A command that rewrites the values leaves real zeros where nulls were;
// Append, Insert and Delete keep the other cells as they are. Every change of contents (an
// edit or a successful command) emits Changed() once.
#pragma once

#include <QStringList>
#include <QTableView>
#include <functional>

#include "tovrin/foundation/TOVRINFoundation.h"

namespace tovrin {

namespace detail {
class VectorEditModel;
}

class TQENVectorEdit : public QTableView {
  Q_OBJECT
  Q_PROPERTY(int Count READ Count WRITE SetCount NOTIFY Changed)
  Q_PROPERTY(int Decimals READ Decimals WRITE SetDecimals)
  Q_PROPERTY(bool ReadOnly READ ReadOnly WRITE SetReadOnly)
  Q_PROPERTY(bool HasNulls READ HasNulls NOTIFY Changed)

 public:
  explicit TQENVectorEdit(QWidget* parent = nullptr);
  ~TQENVectorEdit() override;

  // --- Contents -----------------------------------------------------------------------------
  // The values, a null cell read as 0.
  TQENFloatVector Vector() const;
  // Replaces every cell (none null); emits Changed().
  void SetVector(const TQENFloatVector& V);
  int Count() const;
  // Grows with null cells or shrinks from the end; a negative N counts as 0.
  void SetCount(int N);
  // Whether some cell, or the cell at Index, is null.
  bool HasNulls() const;
  bool IsNull(int Index) const;

  // --- Presentation -------------------------------------------------------------------------
  // Decimals shown per cell, 0..20 (values outside are clamped); default 4.
  int Decimals() const;
  void SetDecimals(int Value);
  // No cell can be edited; commands still run.
  bool ReadOnly() const;
  void SetReadOnly(bool Value);

  QSize sizeHint() const override;

 public slots:
  // QSortVector, ReverseVector, every cell null, FillVector.
  bool Sort(bool Ascending = true);
  bool Reverse();
  bool Clear();
  bool Fill(tovrin::Extended Value);
  // SquareVector, SqrtVector (rsVectorNeg), InvVector (rsVectorZero), LnVector and
  // Log10Vector (rsVectorNotPos), LinearTransformVector (V[i] := A * V[i] + B); each raises
  // rsVectorIsEmpty for an empty vector.
  bool Sqr();
  bool Sqrt();
  bool Invert();
  bool Ln();
  bool Log10();
  bool LinearTransform(tovrin::Extended A, tovrin::Extended B);
  // AppendValue2Vector; AddValue2Vector (an Index that is not a position appends);
  // DeleteValueFromVector (an Index that is not a position fails with rsInvalidValue).
  bool Append(tovrin::Extended Value);
  bool Insert(int Index, tovrin::Extended Value);
  bool Delete(int Index);

 signals:
  void Changed();
  void MathErrorRaised(QString message, int ident);

 protected:
  // For TQENLabelledVectorEdit: a grid over a model with a label column.
  TQENVectorEdit(bool Labelled, QWidget* parent);
  void keyPressEvent(QKeyEvent* event) override;
  detail::VectorEditModel& Model() const { return *model_; }

 private:
  void ReportError(const QString& message, int ident);
  // Runs a command, routing an exception to MathErrorRaised.
  bool Guard(const std::function<void()>& Command);
  // Runs an in-place vector function on a copy and commits the copy when it returns.
  bool Transform(void (*Function)(TQENFloatVector&));

  detail::VectorEditModel* model_;
};

// The vector grid with a label column. Labels travel with their values through Sort,
// Reverse, Insert and Delete; a row without a label shows LoadResString(rsNA).
class TQENLabelledVectorEdit : public TQENVectorEdit {
  Q_OBJECT
  Q_PROPERTY(QStringList Labels READ Labels WRITE SetLabels)

 public:
  explicit TQENLabelledVectorEdit(QWidget* parent = nullptr);
  ~TQENLabelledVectorEdit() override;

  // One label per row; rows past the end of Labels have none, and labels past the last row
  // wait for rows added later (Labels may be set before the values). Setting them is not a
  // change of contents (no Changed()).
  QStringList Labels() const;
  void SetLabels(const QStringList& Labels);
};

}  // namespace tovrin
