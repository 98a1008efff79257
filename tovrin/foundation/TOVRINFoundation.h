// The whole foundation: types, constants, failures, predicates, conversions.
#pragma once

#include "tovrin/foundation/TOVRINConvert.h"
#include "tovrin/foundation/TOVRINErrors.h"
#include "tovrin/foundation/TOVRINGlobals.h"
#include "tovrin/foundation/TOVRINMath.h"
#include "tovrin/foundation/TOVRINSystem.h"
