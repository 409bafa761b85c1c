#include "bar.h"

#include <MW/window.h>

#include <algorithm>
#include <array>
#include <atomic>

#include "place.h"

namespace gallery {

namespace {

constexpr uint32_t kBarColor = 0xFF10161E;

std::atomic<Wish> wished = Wish::None;

void ask(Wish wish) {
  wished = wish;
  MW::isDisplayUpdate(1);
}

struct KeyRow {
  unsigned int code;
  Wish wish;
};
constexpr auto kKeys = std::to_array<KeyRow>({
    {BRIMOL_CODE_BACK, Wish::Back},
    {MW::kKeyLeft, Wish::Previous},
    {MW::kKeySelect, Wish::Other},
    {MW::kKeyRight, Wish::Next},
});

// The buttons stand at the foot, high enough for a finger.
SKIA_Rect buttonPlace(int column) {
  constexpr int kPitch = 24;  // per cent of the screen's width
  SKIA_Rect area = place(2 + column * kPitch, 99, kPitch - 1, 6);
  area.h = atLeastMm(area.h, kTouchMm);
  area.y -= area.h;
  return area;
}

// Two lines of text stand above them; 0 is the lower one.
SKIA_Rect linePlace(int number) {
  SKIA_Rect area = place(2, 0, 96, 3);
  area.y = buttonPlace(0).y - (number + 1) * area.h;
  return area;
}

SKIA_Rect groundPlace() {
  const int top = linePlace(1).y;
  return {0, top, MW::Window::width, MW::Window::height - top, kBarColor};
}

template <typename Primitive>
Primitive make(const SKIA_Rect& area, const SKIA_Text& text) {
  return Primitive(&area, &text);
}

}  // namespace

BarButton::BarButton(const SKIA_Rect& area, const SKIA_Text& caption, MW::LayerNumber layer,
                     void (*clicked)(int))
    : Button(&area, &caption) {
  clickCallback = clicked;
  leaveLayers();
  setType(layer);
  MW::Window::registerWidget(this);
  setActive(1);
}

BarButton::~BarButton() { leaveLayers(); }

BarKeys::BarKeys(MW::LayerNumber layer) {
  setType(layer);
  MW::Window::registerWidget(this);
  setActive(1);
}

BarKeys::~BarKeys() { leaveLayers(); }

bool BarKeys::onRecvEvent(MW::event_data* event, unsigned int) {
  if (event->type != MW::kEventKeyPress) return false;
  const auto* const row = std::ranges::find(kKeys, event->key.code, &KeyRow::code);
  if (row == kKeys.end()) return false;
  ask(row->wish);
  return true;
}

Bar::Bar(const std::string& title, const std::string& other, MW::LayerNumber layer)
    : ground(make<MW::Textbox>(groundPlace(), words(""))),
      heading(make<MW::Label>(linePlace(1), words(title, MW::kColorWhite))),
      line(make<MW::Label>(linePlace(0), words("", MW::kColorHighlight))),
      back(buttonPlace(0), words("Menu"), layer, [](int) { ask(Wish::Back); }),
      previous(buttonPlace(1), words("Previous"), layer, [](int) { ask(Wish::Previous); }),
      switcher(buttonPlace(2), words(other), layer, [](int) { ask(Wish::Other); }),
      next(buttonPlace(3), words("Next"), layer, [](int) { ask(Wish::Next); }),
      keys(layer) {
  wished = Wish::None;
  say("");
}

Wish Bar::wish() { return wished; }

void Bar::draw() {
  line.setText(said().c_str());
  ground.show();
  heading.show();
  line.show();
  for (BarButton* const button : {&back, &previous, &switcher, &next}) button->MW::Button::show();
}

}  // namespace gallery
