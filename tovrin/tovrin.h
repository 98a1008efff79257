// The whole public interface of tovrin.
#pragma once

#include "tovrin/currency/TOVRINFinMatrix.h"
#include "tovrin/currency/TOVRINFinVector.h"
#include "tovrin/currency/TOVRINFinancials.h"
#include "tovrin/foundation/TOVRINFoundation.h"
#include "tovrin/geometry/TOVRINGeometry.h"
#include "tovrin/matrix/TOVRINMatrix.h"
#include "tovrin/random/TOVRINRandom.h"
#include "tovrin/statistics/TOVRINDescStats.h"
#include "tovrin/statistics/TOVRINPairStats.h"
#include "tovrin/statistics/TOVRINPrecise.h"
#include "tovrin/statistics/TOVRINStatistics.h"
#include "tovrin/statistics/TOVRIN_RS_DescStats.h"
#include "tovrin/vector/TOVRINVector.h"
