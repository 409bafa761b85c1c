// The trails of all fingers, with their numbers and raw coordinates.
#include <algorithm>
#include <array>
#include <cmath>
#include <deque>
#include <memory>
#include <string>
#include <vector>

#include "language/language.h"
#include "layout.h"
#include "measure_page.h"
#include "pages/table.h"

namespace factory_test {

namespace {

constexpr std::size_t kFingers = 10;
constexpr std::size_t kLongest = 200;  // points of a trail
constexpr double kTrailMm = 10;        // what each finger has to draw
constexpr uint32_t kRateMs = 1000;
constexpr auto kColors =
    std::to_array<uint32_t>({0xFFE8C040, 0xFF7FD4FF, 0xFFFF8A80, 0xFF9CE29C, 0xFFD0A8FF, 0xFFFFFFFF,
                             0xFFFFB060, 0xFF60E0D0, 0xFFFF9AD5, 0xFFB8C4D6});
static_assert(kColors.size() == kFingers);

struct Trail {
  bool isDown = false;
  double length = 0;  // pixels, since the finger came down
  std::deque<Input> points;
};

/// Passes once enough fingers have each drawn a trail at the same time.
class TouchTrailsPage : public MeasurePage {
 public:
  explicit TouchTrailsPage(const Context& program)
      : MeasurePage(program, "touch_trails", tr("Touch trails"),
                    wordsFor(stepOf(program, "touch_trails").parameter("fingers"))) {}

  std::vector<Measure> values() const override {
    return measure({{"fingers counted", mostDrawing},
                    {"longest trail", longest > 0 ? millimetres(longest) : kNotMeasured}});
  }

 protected:
  void follow(const Input& input) override {
    using enum Input::Kind;
    if (input.kind == KeyPress || input.kind == KeyRelease || input.finger >= kFingers) return;
    Trail& trail = trails.at(input.finger);
    if (input.kind == Press) trail = {.isDown = true, .points = {}};
    if (!trail.points.empty()) {
      const Input& last = trail.points.back();
      trail.length += std::hypot(input.x - last.x, input.y - last.y);
    }
    trail.points.push_back(input);
    if (trail.points.size() > kLongest) trail.points.pop_front();
    longest = std::max(longest, trail.length);
    mostDrawing = std::max(mostDrawing, drawing());
    if (input.kind == Lift) trail.isDown = false;
    recent.push_back(input.ticks);
  }

  // The last second's reports.
  void updateAt(uint32_t now) override {
    while (!recent.empty() && now - recent.front() > kRateMs) recent.pop_front();
  }

  bool isDone() const override { return mostDrawing >= static_cast<int>(parameter("fingers")); }

  void drawLook() override {
    const ScreenSize screen = screenSize();
    skia_add_box_c({0, 0, screen.width, screen.height, kPageInk.ground});
    for (std::size_t i = 0; i < kFingers; ++i) drawTrail(i);
    const int height = 2 * textSize(screen);
    const std::string rate = std::to_string(recent.size()) + tr(" reports in the last second");
    skia_add_label_c({0, height, screen.width, height, 0},
                     textOf(rate.c_str(), kPageInk.text, SKIA_ALIGN_CENTRE, textSize(screen)));
  }

 private:
  static std::string wordsFor(double fingers) {
    return counted(trn("Draw with %d finger:\nthe number stays with the finger.",
                       "Draw with %d fingers at once:\nthe numbers stay with the fingers.",
                       static_cast<unsigned long>(fingers)),
                   fingers);
  }

  int drawing() const {
    return static_cast<int>(std::ranges::count_if(trails, [](const Trail& trail) {
      return trail.isDown && !isWithinMm(trail.length, kTrailMm);
    }));
  }

  void drawTrail(std::size_t finger) const {
    constexpr int kWidth = 4;  // pixels
    constexpr int kLetters = 14;
    const Trail& trail = trails.at(finger);
    if (trail.points.empty()) return;
    for (std::size_t i = 1; i < trail.points.size(); ++i) {
      const Input& from = trail.points[i - 1];
      const Input& to = trail.points[i];
      skia_add_line_c({from.x, from.y, to.x, to.y, kColors.at(finger), kWidth});
    }
    const Input& last = trail.points.back();
    const ScreenSize screen = screenSize();
    const int size = textSize(screen);
    const int width = kLetters * size;
    const std::string words =
        std::to_string(finger) + ": " + std::to_string(last.x) + ", " + std::to_string(last.y);
    skia_add_label_c({std::clamp(last.x - width / 2, 0, std::max(screen.width - width, 0)),
                      std::max(last.y - 4 * size, 0), width, 2 * size, 0},
                     textOf(words.c_str(), kColors.at(finger), SKIA_ALIGN_CENTRE, size));
  }

  std::array<Trail, kFingers> trails;
  std::deque<uint32_t> recent;  // when the reports of the last second came
  int mostDrawing = 0;          // fingers at the same time
  double longest = 0;           // pixels
};

}  // namespace

std::unique_ptr<Test> makeTouchTrails(const Context& program) {
  return std::make_unique<TouchTrailsPage>(program);
}

}  // namespace factory_test
