#include "records/plot.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <cstdio>

#include "records/html.h"

namespace factory_test {

namespace {

constexpr double kWidth = 640;
constexpr double kHeight = 240;
constexpr double kLeft = 64;  // the y axis' numbers
constexpr double kRight = 16;
constexpr double kTop = 12;
constexpr double kBottom = 28;  // the x axis' labels
constexpr double kScaleSteps = 4;

std::string at(double number) {
  std::array<char, 32> text = {};
  std::snprintf(text.data(), text.size(), "%.1f", number);
  return text.data();
}

// A step of a path: its letter and where it leads.
std::string to(std::string_view letter, double x, double y) {
  return std::string(letter).append(at(x)).append(" ").append(at(y));
}
std::string to(std::string_view letter, double where) {
  return std::string(letter).append(at(where));
}

// 1, 2 or 5 times a power of ten: about a fifth of the extent.
double stepFor(double extent) {
  const double rough = extent / kScaleSteps;
  const double power = std::pow(10, std::floor(std::log10(rough)));
  for (const double factor : {1.0, 2.0, 5.0}) {
    if (factor * power >= rough) return factor * power;
  }
  return 10 * power;
}

}  // namespace

std::string shortNumber(double number) {
  std::array<char, 32> text = {};
  std::snprintf(text.data(), text.size(), "%.4g", number);
  return text.data();
}

void Range::include(double value) {
  from = std::min(from, value);
  to = std::max(to, value);
}

bool Range::isDrawable() const {
  const double extent = to - from;
  // Near the ends of what a number can be, places between its ends cannot be told apart.
  return std::isfinite(extent) && extent > 0 && from + extent / kWidth > from &&
         to - extent / kWidth < to && extent > 1e-300;
}

Plot::Plot(std::string_view name, Range horizontal, Range vertical)
    : title(name), across(horizontal), up(vertical) {
  addScale();
}

double Plot::left(double x) const {
  return kLeft + (x - across.from) / (across.to - across.from) * (kWidth - kLeft - kRight);
}

double Plot::top(double y) const {
  return kHeight - kBottom - (y - up.from) / (up.to - up.from) * (kHeight - kTop - kBottom);
}

void Plot::path(const std::string& steps, std::string_view style) {
  content.append("<path class=\"").append(style).append("\" d=\"").append(steps).append("\"/>\n");
}

void Plot::addScale() {
  const double step = stepFor(up.to - up.from);
  std::string lines;
  // Counted, not added up: a step that is too small for the numbers must not hold it up.
  const double first = std::ceil(up.from / step);
  for (int i = 0; i <= 2 * static_cast<int>(kScaleSteps); ++i) {
    const double y = (first + i) * step;
    if (y > up.to) break;
    lines += to("M", kLeft, top(y)) + to("H", kWidth - kRight);
    content.append(R"(<text text-anchor="end" x=")").append(at(kLeft - 8)).append("\" y=\"");
    content.append(at(top(y) + 4)).append("\">").append(shortNumber(y)).append("</text>\n");
  }
  path(lines, "axis");
}

void Plot::label(double x, std::string_view text) {
  const char* const anchor = x <= across.from ? "start" : x >= across.to ? "end" : "middle";
  content.append("<text text-anchor=\"").append(anchor).append("\" x=\"").append(at(left(x)));
  content.append("\" y=\"").append(at(kHeight - 8)).append("\">").append(htmlText(text));
  content.append("</text>\n");
}

void Plot::line(const std::vector<PlotPoint>& points, std::string_view style) {
  std::string steps;
  for (const auto& [x, y] : points) steps += to(steps.empty() ? "M" : "L", left(x), top(y));
  path(steps, style);
}

void Plot::dots(const std::vector<PlotPoint>& points) {
  std::string steps;
  for (const auto& [x, y] : points) steps += to("M", left(x), top(y)) + to("h", 0);
  path(steps, "dots");
}

void Plot::spread(double x, Range range) {
  path(to("M", left(x), top(range.from)) + to("V", top(range.to)), "spread");
}

void Plot::bar(Range horizontal, double height, std::string_view tip) {
  const double x = left(horizontal.from);
  const double width = std::max(left(horizontal.to) - x - 1, 1.0);
  content.append(R"(<rect class="bar" x=")").append(at(x)).append("\" y=\"");
  content.append(at(top(height)));
  content.append("\" width=\"").append(at(width)).append("\" height=\"");
  content.append(at(top(0) - top(height))).append("\"><title>").append(htmlText(tip));
  content.append("</title></rect>\n");
}

void Plot::limitAtX(double x) {
  path(to("M", left(x), kTop) + to("V", kHeight - kBottom), "limit");
}

void Plot::limitAtY(double y) { path(to("M", kLeft, top(y)) + to("H", kWidth - kRight), "limit"); }

std::string Plot::svg() const {
  std::string text = R"(<svg role="img" viewBox=")";
  text.append(to("0 0 ", kWidth, kHeight)).append("\" aria-label=\"").append(htmlText(title));
  return text.append("\">\n").append(content).append("</svg>\n");
}

}  // namespace factory_test
