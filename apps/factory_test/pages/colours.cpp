// The display in one colour after another, to look for dead pixels and stains.
#include <MW/key.h>
#include <MW/screen.h>
#include <MW/window.h>
#include <brimol/input.h>

#include <algorithm>
#include <atomic>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "current.h"
#include "language/language.h"
#include "layout.h"
#include "on_top.h"
#include "page_test.h"
#include "pages/table.h"
#include "plan/catalog.h"
#include "verdict_bar.h"

namespace factory_test {

namespace {

constexpr int kColours = MW::FullScreen::kGrey + 1;
constexpr uint32_t kSeenMs = 500;

/// What to do stands on the first colour for a while. A tap, or the right key, confirms a colour
/// and shows the next one, but not before it was there for half a second. A long press, or the
/// select key, ends the look, and the verdict is asked for.
class ColourTest : public LookTest {
 public:
  ColourTest()
      : LookTest(tr("Display colours"),
                 tr("Say what you saw: pixels and places\nthat differ are a fault.")) {}

  void drawOver() override {
    if (!hasWords || shown > 0 || page.isAsking()) return;
    const ScreenSize screen = screenSize();
    const SKIA_Rect foot =
        rowsOf<2>({0, 0, screen.width, screen.height, kPanelInk.ground}, 0, {5, 1})[1];
    skia_add_box_c(foot);
    std::string words = planStep.text.empty() ? "" : planStep.text + "\n";
    words += tr("Tap: the next colour.\nHold a finger still, or Select: end.");
    if (!page.shownStanding().empty()) words.append("\n").append(page.shownStanding());
    drawWords(within(foot, gapOf(screen)), words, kPanelInk.text, SKIA_ALIGN_CENTRE,
              textSize(screen));
  }

  bool isComplete() const override { return confirmed() == kColours; }

  std::vector<Measure> values() const override {
    return {measured("colours", "colours confirmed", confirmed())};
  }

 protected:
  void beginLook() override {
    began = GetTicks();
    shownSince = began;
    colour.emplace(MW::FullScreen::kWhite).setActive(1);
    touch.emplace();
    touch->clickCallback = [](MW::mouse_event*) { Current<ColourTest>::get().next(); };
    touch->longPressCallback = [](MW::mouse_event*) { Current<ColourTest>::get().finishLook(); };
    touch->setActive(1);
    moveToTop(key.emplace());
    key->keyPressCallback = [](MW::kbd_event* event) {
      Current<ColourTest>::get().followKey(event->code);
    };
  }

  // The first colour is seen whole once the words have been read.
  void updateLook() override {
    constexpr uint32_t kReadMs = 4000;
    if (!hasWords || GetTicks() - began < kReadMs) return;
    hasWords = false;
    MW::isDisplayUpdate(1);
  }

  std::string question() const override { return tr("Was every colour even?"); }

  void endLook() override {
    if (colour && isSeen()) seenLast = 1;
    key.reset();
    touch.reset();
    colour.reset();
  }

 private:
  bool isSeen() const { return GetTicks() - shownSince >= kSeenMs; }

  // Those that were left, and the one at which the look ended.
  int confirmed() const { return std::min(shown + seenLast, kColours); }

  void next() {
    if (!isSeen()) return;
    shownSince = GetTicks();
    colour->setRect(++shown % kColours);
  }

  void followKey(unsigned int code) {
    if (code == MW::kKeyRight) next();
    finishLookOn(code);
    MW::isDisplayUpdate(1);
  }

  Current<ColourTest> current{this};
  uint32_t began = 0;  // GetTicks() milliseconds
  bool hasWords = true;
  std::atomic<int> shown = 0;            // how often it moved on
  std::atomic<uint32_t> shownSince = 0;  // GetTicks() milliseconds
  int seenLast = 0;                      // whether the last one was seen, too
  std::optional<MW::FullScreen> colour;
  std::optional<OnTop<MW::Screen>> touch;
  std::optional<MW::Key> key;
};

}  // namespace

std::unique_ptr<Test> makeColours(const Context&) { return std::make_unique<ColourTest>(); }

}  // namespace factory_test
