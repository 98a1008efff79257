// Vector building, aggregates, arithmetic, transforms, sorting and ranking.
#pragma once

#include "tovrin/foundation/TOVRINFoundation.h"
