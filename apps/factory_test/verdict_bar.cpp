#include "verdict_bar.h"

#include <MW/window.h>

#include <algorithm>

#include "language/language.h"
#include "layout.h"

namespace factory_test {

namespace {

struct ButtonLook {
  const char* caption;
  Ink ink;
  int textPercent;  // of the page's text size
  Outcome outcome;
};

// The verdicts as keys move over them.
constexpr auto kLooks = std::to_array<ButtonLook>({
    {msg("PASS"), kPassInk, 150, Outcome::Pass},
    {msg("RETRY"), kRowInk, 150, Outcome::Retry},
    {msg("FAIL"), kFailInk, 150, Outcome::Fail},
    {msg("Leave"), kButtonInk, 100, Outcome::Left},
});

constexpr auto kOwnKeys =
    std::to_array<unsigned int>({MW::kKeyLeft, MW::kKeyRight, MW::kKeySelect, kKeyBack});

SKIA_Rect around(const SKIA_Rect& first, const SKIA_Rect& last) {
  return {first.x, first.y, last.x + last.w - first.x, last.y + last.h - first.y, 0};
}

}  // namespace

VerdictBar::VerdictBar(Keys keys) {
  const PageLayout page = layOutPage(screenSize());
  place<0>(page.verdicts[0]);
  place<1>(page.verdicts[1]);
  place<2>(page.verdicts[2]);
  place<3>(page.leave);
  veil.emplace(around(page.verdicts.front(), page.verdicts.back()), MW::kBaseLayer,
               GetTicks() + PressGuard::kDeafMs);
  if (keys == Keys::Free) return;
  key.emplace().keyPressCallback = [](MW::kbd_event* event) {
    Current<VerdictBar>::get().followKey(event->code);
  };
}

template <std::size_t index>
void VerdictBar::place(const SKIA_Rect& area) {
  const ButtonLook& look = kLooks.at(index);
  const int size = percentOf(textSize(screenSize()), look.textPercent);
  const SKIA_Rect face = inColor(area, look.ink.ground);
  buttons.place<index>(face, captionIn(area, tr(look.caption), look.ink.text, size));
}

void VerdictBar::choose(std::size_t index) { chosen = kLooks.at(index).outcome; }

void VerdictBar::draw() {
  const int index = marked;
  if (index < 0) return;
  const SKIA_Rect& face = buttons.face(static_cast<std::size_t>(index));
  skia_add_box_c(inColor(within(face, -gapOf(screenSize())), kMarkInk.ground));
}

void VerdictBar::followKey(unsigned int code) {
  if (std::ranges::count(kOwnKeys, code) == 0) {
    if (otherKey != nullptr) otherKey(code);
  } else if (!buttons.isDeaf()) {
    followOwnKey(code);
  }
  MW::isDisplayUpdate(1);
}

void VerdictBar::followOwnKey(unsigned int code) {
  constexpr int kLast = kVerdicts - 1;
  const int index = marked;
  switch (code) {
    case MW::kKeyLeft: marked = std::max(index - 1, 0); break;
    case MW::kKeyRight: marked = std::min(index + 1, kLast); break;
    case MW::kKeySelect:
      if (index >= 0) choose(static_cast<std::size_t>(index));
      break;
    default: chosen = Outcome::Left;
  }
}

}  // namespace factory_test
