// The unchecked exchanges of row and column elements, shared by the row and column operations
// and the row reduction. Elements are exchanged whole, as SwapXY does, for the numeric and the
// money types alike.
#pragma once

#include <cstddef>
#include <utility>
#include <vector>

#include "tovrin/foundation/TOVRINElementTypes.h"

namespace tovrin::detail {

// Exchanges rows Row1 and Row2 element by element over the first Cols columns (the row
// storage stays where it is). No checks.
template <typename T>
void SwapRowElements(MatrixOf<T>& M, std::size_t Row1, std::size_t Row2, std::size_t Cols) {
  T* a = M[Row1].data();
  T* b = M[Row2].data();
  for (std::size_t j = 0; j < Cols; ++j) std::swap(a[j], b[j]);
}

// Exchanges columns Col1 and Col2 in every row. No checks.
template <typename T>
void SwapColElements(MatrixOf<T>& M, std::size_t Col1, std::size_t Col2) {
  for (auto& row : M) std::swap(row[Col1], row[Col2]);
}

}  // namespace tovrin::detail
