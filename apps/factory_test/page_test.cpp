#include "page_test.h"

#include <MW/window.h>
#include <brimol/input.h>

#include <algorithm>

#include "language/language.h"
#include "layout.h"
#include "text_fit.h"
#include "value_lines.h"

namespace factory_test {

void PageTest::prepare(const PlanStep& planned) {
  planStep = planned;
  if (!planStep.text.empty()) page.instruct(planStep.text);
}

void PageTest::drawValues(const SKIA_Rect& area) const {
  std::string words;
  for (const ValueLine& line : valueLines(values(), planStep)) {
    words.append(words.empty() ? "" : "\n").append(line.words);
  }
  if (words.empty()) return;
  drawWords(area, words, kPageInk.text, SKIA_ALIGN_CENTRE, textSize(screenSize()));
}

void LookTest::draw() {
  page.draw();
  if (page.isAsking()) drawValues(contentArea());
}

void LookTest::drawHintOverLook() const {
  if (page.isAsking()) return;
  const ScreenSize screen = screenSize();
  const int margin = 2 * gapOf(screen);
  const int height = 3 * lineHeight(textSize(screen));
  page.drawHint(
      {margin, screen.height - entryHeight(screen) - height, screen.width - 2 * margin, height, 0});
}

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
  drawHintOverLook();
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
