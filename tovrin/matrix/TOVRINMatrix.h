// Matrix creation, shape queries, arithmetic, row and column operations, row reduction.
#pragma once

#include "tovrin/foundation/TOVRINFoundation.h"
