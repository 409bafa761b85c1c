#include "page.h"

#include <MW/window.h>

#include <algorithm>

#include "layout.h"

namespace factory_test {

namespace {

// The primitives copy their records, which live for the call.
struct Record {
  SKIA_Rect area;
  SKIA_Text text;
};

Record titleRecord(const char* title) {
  const ScreenSize screen = screenSize();
  const int size = percentOf(textSize(screen), 120);
  const SKIA_Rect area = layOutPage(screen).title;
  return {area, captionIn(area, title, kHeadInk.text, size)};
}

Record lineRecord() { return {layOutPage(screenSize()).line, captionOf("", kPanelInk.text)}; }

template <typename Primitive>
Primitive make(const Record& record) {
  return Primitive(&record.area, &record.text);
}

MW::Box makeBox(SKIA_Rect PageLayout::*place) {
  const PageLayout page = layOutPage(screenSize());
  return MW::Box(&(page.*place));
}

}  // namespace

Page::Page(const char* title, const char* instructions)
    : ground(makeBox(&PageLayout::ground)),
      head(makeBox(&PageLayout::head)),
      titleText(make<MW::Label>(titleRecord(title))),
      hint(instructions),
      line(make<MW::Textbox>(lineRecord())) {}

void Page::draw() {
  drawGround();
  drawFront();
}

void Page::drawGround() { ground.show(); }

void Page::drawFront() {
  head.show();
  drawProgress(progress, layOutPage(screenSize()).progress);
  titleText.show();
  drawWhose();
  drawHint(layOutPage(screenSize()).hint);
  if (hasLine) line.show();
  if (bar) bar->draw();
}

void Page::drawWhose() const {
  if (progress.whose.empty()) return;
  const ScreenSize screen = screenSize();
  const SKIA_Rect area = layOutPage(screen).whose;
  drawWords(within(area, gapOf(screen) / 4), progress.whose, kHeadInk.text, SKIA_ALIGN_CENTRE,
            smallTextSize(screen));
}

void Page::drawHint(const SKIA_Rect& area) const {
  const ScreenSize screen = screenSize();
  std::string words = hint;
  // Its lines are as long as a tall screen is wide.
  if (isLandscape(screen)) std::ranges::replace(words, '\n', ' ');
  if (!standing.empty()) words.append("\n").append(standing);
  drawWords(area, words, kPageInk.text, leadingAlign(), textSize(screen));
}

void Page::say(const char* words) {
  const SKIA_Text text = captionIn(layOutPage(screenSize()).line, words, kPanelInk.text);
  line.setFontSize(text.size);
  line.setText(text.text);
  hasLine = *words != '\0';
  MW::isDisplayUpdate(1);
}

}  // namespace factory_test
