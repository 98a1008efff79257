// The labels of the statistics reports (rsDSMean, rsDSNoMode, ...). They are resource
// strings like every message of the library: LoadResString(rsDSMean) reads the text in force.
#pragma once

#include "tovrin/foundation/TOVRINErrors.h"
