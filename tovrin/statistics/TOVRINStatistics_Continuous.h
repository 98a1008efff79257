// Continuous distributions.
#pragma once

#include "tovrin/foundation/TOVRINFoundation.h"
