// Descriptive statistics of a sample.
#pragma once

#include "tovrin/foundation/TOVRINFoundation.h"
