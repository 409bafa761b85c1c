#include "page_test.h"

#include <MW/window.h>
#include <brimol/input.h>

#include <algorithm>

#include "language/language.h"
#include "layout.h"
#include "text_fit.h"
#include "value_lines.h"

namespace factory_test {

namespace {

Ink inkOf(const ValueLine& value) {
  if (!value.isWithin) return kRowInk;
  return *value.isWithin ? kPassInk : kFailInk;
}

void drawValueRow(const SKIA_Rect& row, const ValueLine& value) {
  const ScreenSize screen = screenSize();
  const Ink ink = inkOf(value);
  std::string words = value.words;
  if (value.isWithin) {
    words.append("\n").append(*value.isWithin ? tr("within its limits") : tr("outside its limits"));
  }
  skia_add_box_c(inColor(row, ink.ground));
  drawWords(within(row, gapOf(screen) / 2), words, ink.text, SKIA_ALIGN_CENTRE, textSize(screen));
}

}  // namespace

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
  if (page.isAsking()) drawQuestion();
}

// In large letters, below the values, which so stand apart from the verdicts' buttons. In one line
// if that is not smaller than other texts.
void LookTest::drawQuestion() const {
  constexpr int kLargePercent = 150;
  const ScreenSize screen = screenSize();
  const PageLayout place = layOutPage(screen);
  const int gap = gapOf(screen);
  const int size = textSize(screen);
  SKIA_Rect row = {place.line.x, place.line.y, place.line.w, 2 * lineHeight(size) + gap, 0};
  for (const ValueLine& line : valueLines(values(), planStep)) {
    drawValueRow(row, line);
    row.y += row.h + gap;
  }
  row.h = place.content.y + place.content.h - row.y;
  const int large = percentOf(size, kLargePercent);
  const int inOneLine = fitted(asked, large, row.w, lineHeight(large)).size;
  drawWords(row, asked, kPageInk.text, SKIA_ALIGN_CENTRE, inOneLine >= size ? inOneLine : large);
}

void LookTest::drawHintOverLook() const {
  if (page.isAsking()) return;
  const ScreenSize screen = screenSize();
  const int margin = 2 * gapOf(screen);
  const int foot = screen.height - entryHeight(screen);
  // Beside the dialogs, which take the middle of a wide screen, or below them.
  if (isLandscape(screen)) {
    constexpr int kWidth = 24;  // per cent
    const int height = foot / 2;
    page.drawHint({margin, foot - height, percentOf(screen.width, kWidth), height, 0});
  } else {
    const int height = 3 * lineHeight(textSize(screen));
    page.drawHint({margin, foot - height, screen.width - 2 * margin, height, 0});
  }
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
  asked = question();
  page.say("");
  page.ask();
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
