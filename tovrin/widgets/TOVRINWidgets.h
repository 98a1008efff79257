// The Qt 6 data-entry controls of tovrin (link tovrin::widgets).
#pragma once

#include "tovrin/widgets/TOVRINMathLabel.h"
#include "tovrin/widgets/TOVRINMatrixEdit.h"
#include "tovrin/widgets/TOVRINMatrixFractEdit.h"
#include "tovrin/widgets/TOVRINVectorEdit.h"
