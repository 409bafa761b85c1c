#include "records/value_plots.h"

#include <algorithm>
#include <cmath>
#include <optional>

#include "records/html.h"
#include "records/plot.h"
#include "results/utc_time.h"

namespace factory_test {

namespace {

constexpr std::size_t kMostColumns = 160;  // of a trend
constexpr int kLeastBins = 5;
constexpr int kMostBins = 40;
constexpr auto kTooWide =
    "<figure><figcaption>The values are too far apart, or too close, to be drawn."
    "</figcaption></figure>\n";

bool isNear(double limit, const Range& values) {
  const double extent = values.to - values.from;
  return limit >= values.from - 2 * extent && limit <= values.to + 2 * extent;
}

// All values, with some room where they are all the same.
Range rangeOf(const Spread& spread) {
  Range range = {spread.least, spread.most};
  if (range.from < range.to) return range;
  const double room = std::max(std::abs(range.from), 1.0) / 2;
  return {range.from - room, range.to + room};
}

// The limits that a plot of the values shows.
std::vector<double> limitsNear(const Measure& limits, const Range& values) {
  std::vector<double> near;
  for (const auto& limit : {limits.least, limits.most}) {
    if (limit && isNear(*limit, values)) near.push_back(*limit);
  }
  return near;
}

std::string nameOf(const ValueSeries& series) { return series.test + ", " + series.newest.name; }

std::string figureOf(const Plot& plot, const std::string& caption) {
  return "<figure>" + plot.svg() + "<figcaption>" + htmlText(caption) + "</figcaption></figure>\n";
}

std::vector<int> countBins(const ValueSeries& series, const Range& values) {
  const double root = std::sqrt(static_cast<double>(series.points.size()));
  const int bins = std::clamp(static_cast<int>(std::ceil(root)), kLeastBins, kMostBins);
  std::vector<int> counts(static_cast<std::size_t>(bins));
  for (const ValuePoint& each : series.points) {
    const double part = (each.value - values.from) / (values.to - values.from);
    const int bin = std::clamp(static_cast<int>(part * bins), 0, bins - 1);
    ++counts[static_cast<std::size_t>(bin)];
  }
  return counts;
}

double secondsOf(const ValuePoint& point) {
  return static_cast<double>(point.time.time_since_epoch().count());
}

// Neighbours in time, as few as make kMostColumns of all.
void addColumns(Plot& plot, const std::vector<ValuePoint>& points) {
  const std::size_t share = (points.size() + kMostColumns - 1) / kMostColumns;
  std::vector<PlotPoint> medians;
  for (std::size_t begin = 0; begin < points.size(); begin += share) {
    const std::size_t end = std::min(begin + share, points.size());
    std::vector<double> values;
    for (std::size_t i = begin; i < end; ++i) values.push_back(points[i].value);
    std::ranges::sort(values);
    const double x = secondsOf(points[(begin + end) / 2]);
    if (values.size() > 1) plot.spread(x, {values.front(), values.back()});
    medians.emplace_back(x, values[values.size() / 2]);
  }
  plot.dots(medians);
}

}  // namespace

std::string distributionFigure(const ValueSeries& series, const Spread& spread) {
  const Range values = rangeOf(spread);
  Range across = values;
  const std::vector<double> limits = limitsNear(series.newest, values);
  for (const double limit : limits) across.include(limit);
  if (!values.isDrawable() || !across.isDrawable()) return kTooWide;
  const std::vector<int> counts = countBins(series, values);
  const int highest = *std::ranges::max_element(counts);
  Plot plot("Distribution of " + nameOf(series), across, {0, static_cast<double>(highest)});
  const double width = (values.to - values.from) / static_cast<double>(counts.size());
  for (std::size_t bin = 0; bin < counts.size(); ++bin) {
    const double from = values.from + width * static_cast<double>(bin);
    plot.bar({from, from + width}, counts[bin],
             shortNumber(from) + " to " + shortNumber(from + width) + ": " +
                 std::to_string(counts[bin]));
  }
  for (const double limit : limits) plot.limitAtX(limit);
  plot.label(across.from, shortNumber(across.from));
  plot.label(across.to, shortNumber(across.to));
  return figureOf(plot, "How often which value came; dashed: the limits");
}

std::string trendFigure(const ValueSeries& series, const Spread& spread) {
  Range up = rangeOf(spread);
  const std::vector<double> limits = limitsNear(series.newest, up);
  for (const double limit : limits) up.include(limit);
  Range across = {secondsOf(series.points.front()), secondsOf(series.points.back())};
  if (across.from >= across.to) across.to = across.from + 1;
  if (!up.isDrawable()) return kTooWide;
  Plot plot("Trend of " + nameOf(series), across, up);
  addColumns(plot, series.points);
  for (const double limit : limits) plot.limitAtY(limit);
  plot.label(across.from, utcText(series.points.front().time));
  plot.label(across.to, utcText(series.points.back().time));
  return figureOf(plot,
                  "Over time, each or as median and extent of neighbours; dashed: the limits");
}

}  // namespace factory_test
