/// Plots as inline SVG, in the colours of html.h.
#pragma once

#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace factory_test {

struct Range {
  double from = 0;
  double to = 1;

  /// Makes room for `value`.
  void include(double value);
  /// A plot needs an extent that is a number and not 0.
  bool isDrawable() const;
};

using PlotPoint = std::pair<double, double>;

/// Axes, and what stands between them. Both ranges are drawable.
class Plot {
 public:
  /// `name` is what a screen reader says. The y axis gets round numbers.
  Plot(std::string_view name, Range horizontal, Range vertical);

  /// A text under the x axis, in its middle at `x`.
  void label(double x, std::string_view text);
  /// `style` is a class of html.h's style sheet.
  void line(const std::vector<PlotPoint>& points, std::string_view style);
  void dots(const std::vector<PlotPoint>& points);
  /// The extent of values at `x`.
  void spread(double x, Range range);
  void bar(Range horizontal, double height, std::string_view tip);
  /// A limit across the plot.
  void limitAtX(double x);
  void limitAtY(double y);

  std::string svg() const;

 private:
  double left(double x) const;
  double top(double y) const;
  void path(const std::string& steps, std::string_view style);
  void addScale();

  std::string title;
  Range across;
  Range up;
  std::string content;
};

/// Some digits of a figure, for people: "0.3333", "12", "1.2e+06".
std::string shortNumber(double number);

}  // namespace factory_test
