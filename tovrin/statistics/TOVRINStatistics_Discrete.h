// Discrete distributions and combinatorics.
#pragma once

#include "tovrin/foundation/TOVRINFoundation.h"
