// The touch panel: where it is touched, and how.
#include <MW/key.h>
#include <MW/screen.h>

#include <algorithm>
#include <array>
#include <atomic>
#include <cstdio>
#include <memory>
#include <optional>

#include "current.h"
#include "language/language.h"
#include "layout.h"
#include "page_test.h"
#include "pages/table.h"
#include "verdict_bar.h"

namespace factory_test {

namespace {

constexpr uint32_t kCross = kMarkInk.ground;
constexpr int kCrossWidth = 3;  // pixels

/// Shows the coordinates of every touch, with a cross through the last one, and is complete once
/// each quarter of the screen was touched. A long press, or the select key, ends the look, and the
/// verdict is asked for.
class TouchTest : public LookTest {
 public:
  TouchTest()
      : LookTest(tr("Touch panel"), tr("Touch and drag everywhere.\nHold a finger still to end.")) {
  }

  bool isComplete() const override {
    return std::ranges::all_of(touched, [](const auto& each) { return each.load(); });
  }

  void draw() override {
    page.drawGround();
    if (x >= 0) drawCross();
    page.drawFront();
    if (page.isAsking()) drawQuestion();
  }

 protected:
  void beginLook() override {
    touch.emplace();
    touch->pressCallback = [](MW::mouse_event* mouse) { self().tell(tr("Press"), *mouse); };
    touch->hoverCallback = [](MW::mouse_event* mouse) { self().tell(tr("Move"), *mouse); };
    touch->clickCallback = [](MW::mouse_event* mouse) { self().tell(tr("Lift"), *mouse); };
    touch->longPressCallback = [](MW::mouse_event*) { self().finishLook(); };
    touch->setActive(1);
    key.emplace().keyPressCallback = [](MW::kbd_event* event) { self().finishLookOn(event->code); };
  }

  std::string question() const override { return tr("Was every touch met?"); }

  void endLook() override {
    key.reset();
    touch.reset();
  }

 private:
  static TouchTest& self() { return Current<TouchTest>::get(); }

  void drawCross() const {
    const ScreenSize screen = screenSize();
    const int atX = x;
    const int atY = y;
    skia_add_line_c({atX, 0, atX, screen.height, kCross, kCrossWidth});
    skia_add_line_c({0, atY, screen.width, atY, kCross, kCrossWidth});
  }

  void tell(const char* what, const MW::mouse_event& mouse) {
    x = mouse.x;
    y = mouse.y;
    const ScreenSize screen = screenSize();
    const std::size_t below = 2 * mouse.y >= screen.height ? 2U : 0U;
    const std::size_t beside = 2 * mouse.x >= screen.width ? 1U : 0U;
    touched.at(below + beside) = true;
    std::array<char, SKIA_TEXT_BYTES> words{};
    std::snprintf(words.data(), words.size(), tr("%s: finger %u at %d, %d"), what, mouse.finger,
                  mouse.x, mouse.y);
    page.say(words.data());
  }

  Current<TouchTest> current{this};
  std::atomic<int> x = -1;  // pixels; -1: not touched yet
  std::atomic<int> y = -1;
  std::array<std::atomic<bool>, 4> touched = {};  // the screen's quarters, row by row
  std::optional<MW::Screen> touch;
  std::optional<MW::Key> key;
};

}  // namespace

std::unique_ptr<Test> makeTouch(const Context&) { return std::make_unique<TouchTest>(); }

}  // namespace factory_test
