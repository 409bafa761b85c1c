// A while without a touch, in which the panel may report none.
#include <MW/window.h>
#include <brimol/input.h>
#include <algorithm>

#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "language/language.h"
#include "layout.h"
#include "measure_page.h"
#include "pages/table.h"

namespace factory_test {

namespace {

/// Ends by itself; every touch that began is counted.
class StuckTouchPage : public MeasurePage {
 public:
  explicit StuckTouchPage(const Context& program)
      : MeasurePage(program, "stuck_touch", tr("Stuck touch"),
                    tr("Put the phone down\nand do not touch it.")) {}

  std::vector<Measure> values() const override {
    return measure({{"touches seen", touches}, {"time watched", watched}});
  }

 protected:
  void follow(const Input& input) override {
    // An input's time may be a little before the first update's.
    const bool isLate = began && static_cast<int32_t>(input.ticks - *began) >= kLiftMs;
    if (input.kind == Input::Kind::Press) {
      touches += 1;
    } else if (isOfAnOldTouch(input) && isLate) {
      // It was there before the page: the finger that chose it has been lifted by now.
      touches = std::max(touches, 1.0);
    }
  }

  void updateAt(uint32_t now) override {
    constexpr uint32_t kSecond = 1000;
    if (!began) began = now;
    const uint32_t seconds = (now - *began) / kSecond;
    if (seconds == watched) return;
    watched = seconds;
    MW::isDisplayUpdate(1);
  }

  bool isDone() const override { return watched >= parameter("seconds"); }

  bool waitsForLift() const override { return false; }
  bool followsOldTouches() const override { return true; }

  void drawLook() override {
    const ScreenSize screen = screenSize();
    skia_add_box_c({0, 0, screen.width, screen.height, kPageInk.ground});
    const std::string words =
        std::to_string(static_cast<int>(parameter("seconds")) - static_cast<int>(watched)) + " s";
    const int size = 4 * textSize(screen);
    skia_add_label_c({0, percentOf(screen.height, 15), screen.width, 2 * size, 0},
                     textOf(words.c_str(), kPageInk.text, SKIA_ALIGN_CENTRE, size));
  }

 private:
  static constexpr int32_t kLiftMs = 2000;

  std::optional<uint32_t> began;  // GetTicks() milliseconds
  uint32_t watched = 0;           // seconds
  double touches = 0;
};

}  // namespace

std::unique_ptr<Test> makeStuckTouch(const Context& program) {
  return std::make_unique<StuckTouchPage>(program);
}

}  // namespace factory_test
