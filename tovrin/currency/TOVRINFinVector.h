// Money vectors.
#pragma once

#include "tovrin/foundation/TOVRINFoundation.h"
