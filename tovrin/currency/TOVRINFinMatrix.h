// Money matrices.
#pragma once

#include "tovrin/foundation/TOVRINFoundation.h"
