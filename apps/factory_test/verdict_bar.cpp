#include "verdict_bar.h"

#include <MW/window.h>

#include <algorithm>

#include "layout.h"

namespace factory_test {

namespace {

struct VerdictButton {
  MW::Button3::Position position;
  const char* caption;
  Outcome outcome;
  void (*clicked)(int);
};

using Bar = Current<VerdictBar>;

// From left to right, as keys move over them.
constexpr auto kVerdicts = std::to_array<VerdictButton>({
    {MW::Button3::kBottomLeft, "PASS", Outcome::Pass,
     [](int) { Bar::get().choose(Outcome::Pass); }},
    {MW::Button3::kBottomCentre, "RETRY", Outcome::Retry,
     [](int) { Bar::get().choose(Outcome::Retry); }},
    {MW::Button3::kBottomRight, "FAIL", Outcome::Fail,
     [](int) { Bar::get().choose(Outcome::Fail); }},
});

constexpr int kMarkWidth = 10;  // pixels around the button

}  // namespace

VerdictBar::VerdictBar(Keys keys) {
  const int size = 2 * textSize(screenSize());
  for (std::size_t i = 0; i < kButtons; ++i) {
    const VerdictButton& row = kVerdicts.at(i);
    const SKIA_Text caption = textOf(row.caption, MW::kColorBlack, SKIA_ALIGN_CENTRE, size);
    MW::Button3& button = buttons.at(i).emplace(row.position, &caption);
    button.clickCallback = row.clicked;
    button.setActive(1);
  }
  if (keys == Keys::Free) return;
  key.emplace().keyPressCallback = [](MW::kbd_event* event) { Bar::get().followKey(event->code); };
}

void VerdictBar::draw() {
  const int index = marked;
  if (index < 0) return;
  const SKIA_Rect& face = *buttons.at(static_cast<std::size_t>(index))->getPositionAndSize();
  skia_add_box_c({face.x - kMarkWidth, face.y - kMarkWidth, face.w + 2 * kMarkWidth,
                  face.h + 2 * kMarkWidth, MW::kColorHighlight});
}

void VerdictBar::followKey(unsigned int code) {
  constexpr int kLast = kButtons - 1;
  const int index = marked;
  switch (code) {
    case MW::kKeyLeft: marked = std::max(index - 1, 0); break;
    case MW::kKeyRight: marked = std::min(index + 1, kLast); break;
    case MW::kKeySelect:
      if (index >= 0) choose(kVerdicts.at(static_cast<std::size_t>(index)).outcome);
      break;
    case kKeyBack: choose(Outcome::Left); break;
    default:
      if (otherKey != nullptr) otherKey(code);
  }
  MW::isDisplayUpdate(1);
}

}  // namespace factory_test
