// The byte reader, the failure signal and the call wrappers shared by the fuzz targets.
#pragma once

#include <cstdint>
#include <cstdlib>

#include "tovrin/foundation/TOVRINErrors.h"

namespace tovrin::fuzzing {

// Reads the input front to back; once exhausted every read gives zeros.
class Input {
 public:
  Input(const std::uint8_t* data, std::size_t size) : p_(data), end_(data + size) {}
  bool Empty() const { return p_ == end_; }
  std::uint8_t Next() { return p_ != end_ ? *p_++ : 0; }
  void Bytes(void* out, std::size_t n) {
    auto* b = static_cast<unsigned char*>(out);
    for (std::size_t i = 0; i < n; ++i) b[i] = Next();
  }
  template <class T>
  T Raw() {
    T v{};
    Bytes(&v, sizeof v);
    return v;
  }

 private:
  const std::uint8_t* p_;
  const std::uint8_t* end_;
};

[[noreturn]] void Fail() { std::abort(); }
void Expect(bool ok) {
  if (!ok) Fail();
}

// Runs a call that may raise EMathError; returns whether it returned. Anything else escapes
// and ends the run as a finding.
template <class F>
bool MayRaise(F&& f) {
  try {
    f();
  } catch (const EMathError&) {
    return false;
  }
  return true;
}

// Runs a call documented never to raise.
template <class F>
void NoRaise(F&& f) {
  try {
    f();
  } catch (...) {
    Fail();
  }
}

}  // namespace tovrin::fuzzing
