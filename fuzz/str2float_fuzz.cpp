// Str2Float either returns a value or raises EConvertError; an accepted text must survive a
// round trip through Float2EStr with enough decimals to keep its value.
#include <cmath>
#include <cstdint>
#include <cstdlib>
#include <string>

#include "tovrin/foundation/TOVRINConvert.h"
#include "tovrin/foundation/TOVRINErrors.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  const std::string text(reinterpret_cast<const char*>(data), size);
  tovrin::Extended value;
  try {
    value = tovrin::Str2Float(text);
  } catch (const tovrin::EConvertError&) {
    return 0;
  }
  if (std::isnan(value) || std::isinf(value)) std::abort();
  if (std::fabs(value) >= 1e-4000L) {
    const std::string printed = tovrin::Float2EStr(value, 255);
    // 255 decimals do not always hold all digits of tiny values; large ones round trip.
    if (std::fabs(value) >= 1e-200L && tovrin::Str2Float(printed) != value) std::abort();
  }
  return 0;
}
