// Paired data: correlation and regression.
#pragma once

#include "tovrin/foundation/TOVRINFoundation.h"
