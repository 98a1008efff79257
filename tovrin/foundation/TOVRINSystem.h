// Exchanging and clearing storage.
#pragma once

#include <utility>

#include "tovrin/foundation/TOVRINGlobals.h"

namespace tovrin {

inline void SwapXY(Extended& X, Extended& Y) { std::swap(X, Y); }
inline void SwapXY(PackedExtended& X, PackedExtended& Y) { std::swap(X, Y); }
inline void SwapXY(Double& X, Double& Y) { std::swap(X, Y); }
inline void SwapXY(Single& X, Single& Y) { std::swap(X, Y); }
inline void SwapXY(Int64& X, Int64& Y) { std::swap(X, Y); }
inline void SwapXY(LongWord& X, LongWord& Y) { std::swap(X, Y); }
inline void SwapXY(LongInt& X, LongInt& Y) { std::swap(X, Y); }
inline void SwapXY(Word& X, Word& Y) { std::swap(X, Y); }
inline void SwapXY(SmallInt& X, SmallInt& Y) { std::swap(X, Y); }
inline void SwapXY(Byte& X, Byte& Y) { std::swap(X, Y); }
inline void SwapXY(ShortInt& X, ShortInt& Y) { std::swap(X, Y); }

// Zero-fills Size bytes at P (nothing for Size 0; P may then be null).
inline void QENClear(void* P, LongWord Size) {
  if (Size != 0) std::memset(P, 0, Size);
}

}  // namespace tovrin
