// The model behind the matrix grids: the values as a rectangular TQENFloatMatrix (a null cell
// holds 0) and a null mask in row order.
#pragma once

#include <vector>

#include "tovrin/widgets/detail/GridCells.h"

namespace tovrin::detail {

class MatrixEditModel : public GridModel {
 public:
  explicit MatrixEditModel(QObject* parent) : GridModel(parent) {}

  const TQENFloatMatrix& Values() const { return values_; }
  int Rows() const { return static_cast<int>(values_.size()); }
  int Cols() const { return static_cast<int>(cols_); }
  bool HasNulls() const { return nullCount_ > 0; }
  bool IsNull(int Row, int Col) const;

  // Changes of contents; each reports once.
  // Every cell replaced; rows shorter than the longest are padded with null cells.
  void ReplaceValues(const TQENFloatMatrix& M);
  // Cells inside both shapes kept, new cells null.
  void Resize(std::size_t Rows, std::size_t Cols);
  // The values become Work (which a library function produced), none null.
  void Commit(TQENFloatMatrix Work);

  int rowCount(const QModelIndex& parent = QModelIndex()) const override;
  int columnCount(const QModelIndex& parent = QModelIndex()) const override;
  QVariant headerData(int section, Qt::Orientation orientation,
                      int role = Qt::DisplayRole) const override;

 protected:
  bool IsValueCell(const QModelIndex&) const override { return true; }
  Extended CellValue(const QModelIndex& index) const override;
  bool CellIsNull(const QModelIndex& index) const override;
  void StoreCell(const QModelIndex& index, std::optional<Extended> Value) override;

 private:
  // Installs new values of any shape, padding short rows; Null tells what the padding is.
  void Install(TQENFloatMatrix M, bool PaddingIsNull);

  TQENFloatMatrix values_;
  std::size_t cols_ = 0;
  std::vector<bool> null_;  // row-major, Rows() x Cols()
  std::size_t nullCount_ = 0;
};

}  // namespace tovrin::detail
