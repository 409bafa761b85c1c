#include "page_test.h"

#include <MW/window.h>
#include <brimol/input.h>

#include <algorithm>

#include "language/language.h"
#include "layout.h"

namespace factory_test {

void LookTest::leave() {
  page.endAsking();
  endLook();
}

void LookTest::update(uint32_t) {
  if (page.isAsking()) return;
  if (!looked) {
    updateLook();
    return;
  }
  endLook();
  page.ask();
  page.say(question().c_str());
}

void LookTest::finishLookOn(unsigned int code) {
  if (code == MW::kKeySelect || code == kKeyBack) finishLook();
}

// The bar is asked for events before the steps' own widgets, since it is there before them.
void StepTest::beginLook() {
  const ScreenSize screen = screenSize();
  const int height = entryHeight(screen);
  const SKIA_Rect foot = {0, screen.height - height, screen.width, height, kButtonInk.ground};
  const SKIA_Text caption = captionIn(foot, tr("Hold here to end"), kButtonInk.text);
  end.emplace(&foot, &caption);
  end->longPressCallback = [](int) { Current<StepTest>::get().finishLook(); };
  end->setActive(1);
  showStep(shown);
}

void StepTest::endLook() {
  endSteps();
  end.reset();
}

// The steps' widgets were drawn over it.
void StepTest::drawOver() {
  if (end) end->show(GetTicks());
}

void StepTest::moveOn() { wanted = std::min(shown + 1, lastStep()); }

void StepTest::updateLook() {
  const int step = wanted;
  if (step == shown) return;
  if (step > lastStep()) {
    finishLook();
    return;
  }
  shown = step;
  furthest = std::max(furthest.load(), step);
  showStep(step);
  MW::isDisplayUpdate(1);
}

void StepTest::move(int by) { wanted = std::max(shown + by, 0); }

void StepTest::followKey(unsigned int code) {
  switch (code) {
    case MW::kKeyRight:
    case MW::kKeyDown:
    case MW::kKeySelect: move(1); break;
    case MW::kKeyLeft:
    case MW::kKeyUp: move(-1); break;
    case kKeyBack: finishLook(); break;
    default: break;
  }
}

}  // namespace factory_test
