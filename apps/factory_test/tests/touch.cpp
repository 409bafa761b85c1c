// The touch panel: where it is touched, and by how many fingers' moves.
#include <MW/primitives.h>
#include <MW/screen.h>

#include <array>
#include <atomic>
#include <cstdio>
#include <optional>

#include "current.h"
#include "layout.h"
#include "page.h"
#include "test.h"
#include "verdict_bar.h"

namespace factory_test {

namespace {

constexpr int kPassOn = 2;  // MW::Screen's variant that leaves touches to the buttons
constexpr uint32_t kCross = 0xFFE8C040;
constexpr int kCrossWidth = 3;  // pixels

/// Shows the coordinates of every touch, with a cross through the last one, and tells a double tap.
class TouchTest : public Test {
 public:
  void enter() override {
    bar.emplace();
    touch.emplace();
    touch->setButtonType(kPassOn);
    touch->pressCallback = [](MW::mouse_event* mouse) {
      Current<TouchTest>::get().tell("Press", *mouse);
    };
    touch->hoverCallback = [](MW::mouse_event* mouse) {
      Current<TouchTest>::get().tell("Move", *mouse);
    };
    touch->clickCallback = [](MW::mouse_event* mouse) {
      Current<TouchTest>::get().tell("Lift", *mouse);
    };
    touch->longPressCallback = [](MW::mouse_event* mouse) {
      Current<TouchTest>::get().tell("Long press", *mouse);
    };
    touch->doubleClickCallback = [](int) { Current<TouchTest>::get().page.say("Double tap"); };
    touch->setActive(1);
  }

  void leave() override {
    touch.reset();
    bar.reset();
  }

  Outcome verdict() const override { return bar->outcome(); }

  void draw() override {
    page.draw();
    const Screen screen = screenSize();
    const int atX = x;
    const int atY = y;
    if (atX >= 0) {
      skia_add_line_c({atX, 0, atX, screen.h, kCross, kCrossWidth});
      skia_add_line_c({0, atY, screen.w, atY, kCross, kCrossWidth});
    }
    bar->draw();
  }

 private:
  void tell(const char* what, const MW::mouse_event& mouse) {
    x = mouse.x;
    y = mouse.y;
    std::array<char, SKIA_TEXT_BYTES> words{};
    std::snprintf(words.data(), words.size(), "%s: finger %u at %d, %d", what, mouse.finger,
                  mouse.x, mouse.y);
    page.say(words.data());
  }

  Current<TouchTest> current{this};
  std::atomic<int> x = -1;  // pixels; -1: not touched yet
  std::atomic<int> y = -1;
  Page page{"Touch", "Touch and drag everywhere,\ntap twice in one place."};
  std::optional<VerdictBar> bar;
  std::optional<MW::Screen> touch;
};

const TestRegistration kRegistration({Group::Input, 0, "touch", "Touch panel",
                                      makeTest<TouchTest>});

}  // namespace

}  // namespace factory_test
