#include "page_test.h"

#include <MW/window.h>

#include <algorithm>

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

void StepTest::updateLook() {
  const int step = wanted;
  if (step == shown) return;
  if (step > lastStep()) {
    finishLook();
    return;
  }
  shown = step;
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
