// The uniform source and the random-variate generators.
#pragma once

#include "tovrin/foundation/TOVRINFoundation.h"
