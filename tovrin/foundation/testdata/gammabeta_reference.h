// The reference table of the gamma and beta family (gammabeta_reference.inc, written by
// gammabeta_reference.py), shared by the unit tests and the benchmark.
#pragma once

#include "tovrin/foundation/TOVRINGlobals.h"

namespace tovrin::testdata {

// {x, f(x), tolerance}
struct SpecialCase1 {
  Extended x;
  Extended expected;
  Extended tolerance;
};
// {a, b, f(a, b), tolerance}
struct SpecialCase2 {
  Extended a;
  Extended b;
  Extended expected;
  Extended tolerance;
};
// {x, a, b, f(x, a, b), tolerance}
struct SpecialCase3 {
  Extended x;
  Extended a;
  Extended b;
  Extended expected;
  Extended tolerance;
};

#include "tovrin/foundation/testdata/gammabeta_reference.inc"

}  // namespace tovrin::testdata
