/// Plots of a measured value.
#pragma once

#include <string>

#include "records/statistics.h"

namespace factory_test {

/// How often which values came, with the newest limits that lie near them. A figure of HTML.
std::string distributionFigure(const ValueSeries& series, const Spread& spread);

/// The values over time; many that stand close become a median with its extent.
std::string trendFigure(const ValueSeries& series, const Spread& spread);

}  // namespace factory_test
