// One-line descriptions of the library's functions and generators, for the lists of eval and
// random.
#pragma once

#include <string_view>

namespace tovrin::cli {

// The description of the function or generator Name; empty when there is none.
std::string_view Description(std::string_view Name);

}  // namespace tovrin::cli
