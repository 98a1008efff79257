// Money conversions.
#pragma once

#include "tovrin/foundation/TOVRINFoundation.h"
