// The display's light, set by a slider.
#include <MW/slide_move.h>
#include <brimol/host.h>

#include <algorithm>
#include <atomic>
#include <memory>
#include <optional>
#include <string>

#include "current.h"
#include "language/language.h"
#include "layout.h"
#include "page_test.h"
#include "pages/table.h"

namespace factory_test {

namespace {

constexpr int kLeast = 10;  // per cent; on a darker screen the slider cannot be found
constexpr int kFull = 100;
constexpr int kDark = 50;  // what it must have come down to
constexpr int kStep = 10;

/// The screen follows the slider at once, and is bright again behind the test.
class BrightnessTest : public PageTest {
 public:
  BrightnessTest()
      : PageTest(tr("Brightness"),
                 tr("Drag the knob: the screen follows.\nKeys up and down do the same.")) {}

  void enter() override {
    page.ask().otherKey = [](unsigned int code) {
      if (code == MW::kKeyUp) Current<BrightnessTest>::get().steps += 1;
      if (code == MW::kKeyDown) Current<BrightnessTest>::get().steps -= 1;
    };
    const SKIA_Rect area = inColor(rowsOf<3>(contentArea(), 0, {2, 1, 4})[1], kPanelInk.ground);
    slider.emplace(&area, MW::SlideMove::kValueKnob, kLeast, kFull, kFull);
    slider->setActive(1);
  }

  bool isComplete() const override { return wasDark; }

  void leave() override {
    slider.reset();
    page.endAsking();
    brimol_host_set_brightness(kFull);
  }

  void update(uint32_t) override {
    const int by = kStep * steps.exchange(0);
    if (by != 0) {
      slider->setValue(static_cast<unsigned int>(std::clamp(shown + by, kLeast, kFull)));
    }
    const int value = slider->getValue();
    if (value == shown) return;
    shown = value;
    wasDark = wasDark || value <= kDark;
    brimol_host_set_brightness(value);
    page.say((tr("Light ") + std::to_string(value) + " %").c_str());
  }

 private:
  Current<BrightnessTest> current{this};
  std::atomic<int> steps = 0;  // by keys, not yet done
  int shown = kFull;           // per cent
  bool wasDark = false;
  std::optional<MW::SlideMove> slider;
};

}  // namespace

std::unique_ptr<Test> makeBrightness(const Context&) { return std::make_unique<BrightnessTest>(); }

}  // namespace factory_test
