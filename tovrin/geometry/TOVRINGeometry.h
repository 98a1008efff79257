// Plane and solid geometry formulas.
#pragma once

#include "tovrin/foundation/TOVRINFoundation.h"
