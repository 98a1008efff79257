// The descriptive-statistics component TQENDescStats.
#pragma once

#include "tovrin/foundation/TOVRINFoundation.h"
