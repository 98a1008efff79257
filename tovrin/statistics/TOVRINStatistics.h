// Unit TOVRINStatistics: sample statistics, grouped data and the distributions, one family
// header each.
#pragma once

#include "tovrin/statistics/TOVRINStatistics_Continuous.h"
#include "tovrin/statistics/TOVRINStatistics_Discrete.h"
#include "tovrin/statistics/TOVRINStatistics_Grouped.h"
#include "tovrin/statistics/TOVRINStatistics_Sample.h"
