#include "page.h"

#include <MW/window.h>

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
  const int size = percentOf(textSize(screen), 140);
  return {layOutPage(screen).title, textOf(title, MW::kColorWhite, SKIA_ALIGN_CENTRE, size)};
}

Record hintRecord(const char* instructions) {
  const ScreenSize screen = screenSize();
  return {layOutPage(screen).hint,
          textOf(instructions, MW::kColorWhite, SKIA_ALIGN_LEFT, textSize(screen))};
}

Record lineRecord() { return {layOutPage(screenSize()).line, captionOf("")}; }

MW::Box makeGround() {
  const SKIA_Rect area = layOutPage(screenSize()).ground;
  return MW::Box(&area);
}

template <typename Primitive>
Primitive make(const Record& record) {
  return Primitive(&record.area, &record.text);
}

}  // namespace

Page::Page(const char* title, const char* instructions)
    : ground(makeGround()),
      titleBar(make<MW::Textbox>(titleRecord(title))),
      hint(make<MW::Label>(hintRecord(instructions))),
      line(make<MW::Textbox>(lineRecord())) {}

void Page::draw() {
  drawGround();
  drawFront();
}

void Page::drawGround() { ground.show(); }

void Page::drawFront() {
  titleBar.show();
  hint.show();
  line.show();
  if (bar) bar->draw();
}

void Page::say(const char* words) {
  line.setText(words);
  MW::isDisplayUpdate(1);
}

}  // namespace factory_test
