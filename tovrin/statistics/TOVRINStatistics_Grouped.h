// Statistics of grouped frequency data.
#pragma once

#include "tovrin/foundation/TOVRINFoundation.h"
