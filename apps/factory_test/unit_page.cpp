#include "unit_page.h"

#include <array>
#include <utility>

#include "language/language.h"
#include "layout.h"
#include "verdict_bar.h"

namespace factory_test {

namespace {

// No verdict is asked for.
SKIA_Rect wholeContent() {
  const PageLayout page = layOutPage(screenSize());
  const SKIA_Rect& first = page.content;
  const SKIA_Rect& last = page.verdicts.back();
  return {first.x, first.y, last.x + last.w - first.x, last.y + last.h - first.y, 0};
}

}  // namespace

UnitPage::UnitPage()
    : page(tr("Which unit?"), tr("Type the serial number of the phone,\nthen the enter key.")) {
  using Here = Current<UnitPage>;
  static constexpr auto kFaces = std::to_array<ButtonRow::Face>(
      {{msg("Without a number"), [](int) { Here::get().answer(""); }}});
  const auto [upper, lower] = rowsOf<2>(wholeContent(), gapOf(screenSize()), {7, 1});
  const SKIA_Rect area = inColor(upper, kPanelInk.ground);
  const SKIA_Text looks = captionOf("");
  keyboard.emplace(&area, &looks);
  keyboard->release_cb = [](int, MW::Ime*) { Here::get().follow(*Here::get().keyboard); };
  keyboard->setActive(1);
  without.emplace(lower, kFaces);
  key.emplace().keyPressCallback = [](MW::kbd_event* event) {
    if (event->code == kKeyBack) Here::get().answer("");
  };
}

void UnitPage::answer(std::string serial) {
  const std::lock_guard guard(lock);
  entered = std::move(serial);
}

// What was typed stays in the bar, for a correction.
void UnitPage::follow(Keyboard& from) {
  if (!from.isEntered()) return;
  const std::string serial = from.getResultString();
  from.setResultString("");
  if (serial.empty()) {
    page.say(tr("No number was typed."));
  } else {
    answer(serial);
  }
}

bool UnitPage::Keyboard::onRecvEvent(MW::event_data* event, unsigned int unused) {
  if (event != nullptr && event->type == MW::kEventPress) {
    const SKIA_Rect& enter = key_rect.back();
    const auto& at = event->mouse;
    hasEnter =
        at.x > enter.x && at.x < enter.x + enter.w && at.y > enter.y && at.y < enter.y + enter.h;
  }
  return Ime::onRecvEvent(event, unused);
}

std::optional<std::string> UnitPage::takeAnswer() {
  const std::lock_guard guard(lock);
  return std::exchange(entered, std::nullopt);
}

}  // namespace factory_test
