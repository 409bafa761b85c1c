// How often the panel reports, and how late its reports reach the screen.
#include <algorithm>
#include <cmath>
#include <memory>
#include <optional>
#include <utility>
#include <vector>

#include <brimol/input.h>

#include "language/language.h"
#include "layout.h"
#include "measure_page.h"
#include "pages/table.h"

namespace factory_test {

namespace {

constexpr double kSecond = 1000;  // ms
constexpr uint32_t kDotColor = 0xFFE8C040;

/// Counts the reports of one finger while it moves, until it has moved for long enough.
class TouchRatePage : public MeasurePage {
 public:
  explicit TouchRatePage(const Context& program)
      : MeasurePage(program, "touch_rate", tr("Touch rate"),
                    tr("Draw circles with one finger,\nquickly and without a stop.")) {}

  std::vector<Measure> values() const override {
    return measure({{"event rate", moved > 0 ? reports * kSecond / moved : kNotMeasured},
                    {"longest gap", reports > 0 ? longestGap : kNotMeasured},
                    {"latency", frames > 0 ? late / frames : kNotMeasured}});
  }

  void endFrame() override {
    if (!std::exchange(isDrawn, false)) return;
    late += GetTicks() - *undrawn;
    frames += 1;
    undrawn.reset();
  }

 protected:
  void follow(const Input& input) override {
    using enum Input::Kind;
    if (input.kind == Press && !last) last = input;
    if (!last || input.finger != last->finger) return;
    if (input.kind == Move) count(input);
    if (input.kind == Lift) last.reset();
  }

  bool isDone() const override { return moved >= kSecond * parameter("seconds"); }

  void drawLook() override {
    const ScreenSize screen = screenSize();
    skia_add_box_c({0, 0, screen.width, screen.height, kPageInk.ground});
    if (last) {
      const int side = 2 * textSize(screen);
      skia_add_roundbox_c({last->x - side / 2, last->y - side / 2, side, side, kDotColor});
    }
    isDrawn = undrawn.has_value();
  }

 private:
  // A finger that stands reports nothing; a panel that stalls while it moves has a jump behind it.
  static bool isStanding(const Input& from, const Input& to) {
    constexpr double kStandsMs = 200;
    constexpr double kStandsMm = 3;
    return to.ticks - from.ticks > kStandsMs &&
           isWithinMm(std::hypot(to.x - from.x, to.y - from.y), kStandsMm);
  }

  void count(const Input& input) {
    if (!undrawn) undrawn = input.ticks;
    if (isStanding(*last, input)) {
      last = input;
      return;
    }
    const double gap = input.ticks - last->ticks;
    reports += 1;
    moved += gap;
    longestGap = std::max(longestGap, gap);
    last = input;
  }

  std::optional<Input> last;        // of the finger that is down
  std::optional<uint32_t> undrawn;  // when the oldest report came that no frame shows yet
  bool isDrawn = false;             // in the frame that is not ended yet
  double reports = 0;
  double moved = 0;  // ms
  double longestGap = 0;
  double late = 0;  // ms, of all frames that showed a report
  double frames = 0;
};

}  // namespace

std::unique_ptr<Test> makeTouchRate(const Context& program) {
  return std::make_unique<TouchRatePage>(program);
}

}  // namespace factory_test
