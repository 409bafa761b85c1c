// How far the panel's reports lie from lines that a finger follows.
#include <algorithm>
#include <array>
#include <cmath>
#include <memory>
#include <optional>
#include <utility>
#include <vector>

#include "language/language.h"
#include "layout.h"
#include "measure_page.h"
#include "pages/table.h"

namespace factory_test {

namespace {

constexpr double kEndMm = 8;  // how near to an end a finger begins and ends a line
constexpr uint32_t kLineColor = 0xFFE8C040;
constexpr uint32_t kTraceColor = 0xFF7FD4FF;

struct Point {
  int x;
  int y;
};

struct Line {
  Point from;
  Point to;
  bool isFollowed;
};

double distance(Point one, Point other) { return std::hypot(one.x - other.x, one.y - other.y); }

// From a point to the nearest one of the line.
double distance(Point point, const Line& line) {
  const double across = line.to.x - line.from.x;
  const double down = line.to.y - line.from.y;
  const double square = across * across + down * down;
  const double along =
      ((point.x - line.from.x) * across + (point.y - line.from.y) * down) / std::max(square, 1.0);
  const double part = std::clamp(along, 0.0, 1.0);
  return std::hypot(point.x - line.from.x - part * across, point.y - line.from.y - part * down);
}

/// A line counts once a finger has gone from one of its ends to the other without lifting. Where
/// the panel is dead on the way, its reports leave a gap.
class TouchLinesPage : public MeasurePage {
 public:
  explicit TouchLinesPage(const Context& program)
      : MeasurePage(program, "touch_lines", tr("Touch accuracy"),
                    tr("Follow each line slowly with a finger,\nfrom corner to corner.")) {
    const ScreenSize screen = screenSize();
    const int right = screen.width - 1;
    const int foot = screen.height - 1;
    lines = {{{{0, 0}, {right, foot}, false}, {{right, 0}, {0, foot}, false}}};
  }

  std::vector<Measure> values() const override {
    const auto count = std::ranges::count(lines, true, &Line::isFollowed);
    return measure({{"lines followed", static_cast<double>(count)},
                    {"worst distance", count > 0 ? millimetres(worst) : kNotMeasured},
                    {"longest gap", count > 0 ? millimetres(longest) : kNotMeasured}});
  }

 protected:
  void follow(const Input& input) override {
    using enum Input::Kind;
    const Point point = {input.x, input.y};
    if (input.kind == Press && !finger) begin(point, input.finger);
    if (!finger || *finger != input.finger) return;
    if (input.kind == Move) goOn(point);
    if (input.kind == Lift) finger.reset();
  }

  bool isDone() const override { return std::ranges::all_of(lines, &Line::isFollowed); }

  void drawLook() override {
    constexpr int kWidth = 4;  // pixels
    const ScreenSize screen = screenSize();
    skia_add_box_c({0, 0, screen.width, screen.height, kPageInk.ground});
    for (const Line& line : lines) {
      skia_add_line_c({line.from.x, line.from.y, line.to.x, line.to.y,
                       line.isFollowed ? kPassInk.ground : kLineColor, kWidth});
    }
    for (std::size_t i = 1; i < trace.size(); ++i) {
      skia_add_line_c(
          {trace[i - 1].x, trace[i - 1].y, trace[i].x, trace[i].y, kTraceColor, kWidth / 2});
    }
  }

  int wordsAt() const override { return 3; }

 private:
  static bool isNear(Point point, Point end) { return isWithinMm(distance(point, end), kEndMm); }

  void begin(Point point, uint32_t byFinger) {
    for (Line& line : lines) {
      if (line.isFollowed) continue;
      if (isNear(point, line.to)) std::swap(line.from, line.to);
      if (!isNear(point, line.from)) continue;
      finger = byFinger;
      followed = &line;
      trace = {point};
      farthest = distance(point, line);
      gap = 0;
      return;
    }
  }

  void goOn(Point point) {
    gap = std::max(gap, distance(trace.back(), point));
    trace.push_back(point);
    farthest = std::max(farthest, distance(point, *followed));
    if (!isNear(point, followed->to)) return;
    followed->isFollowed = true;
    worst = std::max(worst, farthest);
    longest = std::max(longest, gap);
    finger.reset();
  }

  std::array<Line, 2> lines = {};
  std::vector<Point> trace;        // of the finger that follows a line, or did last
  std::optional<uint32_t> finger;  // that follows a line
  Line* followed = nullptr;
  double farthest = 0;  // pixels, from the line that is followed
  double worst = 0;     // from all that were
  double gap = 0;       // pixels, the longest between two reports on the line that is followed
  double longest = 0;   // on all that were
};

}  // namespace

std::unique_ptr<Test> makeTouchLines(const Context& program) {
  return std::make_unique<TouchLinesPage>(program);
}

}  // namespace factory_test
