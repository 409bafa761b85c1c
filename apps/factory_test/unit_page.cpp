#include "unit_page.h"

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
  const auto [upper, lower] = rowsOf<2>(wholeContent(), gapOf(screenSize()), {7, 1});
  const SKIA_Rect area = inColor(upper, kPanelInk.ground);
  const SKIA_Text looks = captionOf("");
  keyboard.emplace(&area, &looks);
  keyboard->release_cb = [](int, MW::Ime*) { Here::get().follow(*Here::get().keyboard); };
  keyboard->setActive(1);
  const auto caption = [](const SKIA_Rect& face, const char* words) {
    return captionIn(face, words, kButtonInk.text);
  };
  const SKIA_Rect without = inColor(lower, kButtonInk.ground);
  buttons.place<0>(without, caption(without, tr("Without a number")));
  const SKIA_Rect leave = layOutPage(screenSize()).leave;
  buttons.place<1>(leave, caption(leave, tr("Leave")));
  key.emplace().keyPressCallback = [](MW::kbd_event* event) { Here::get().followKey(event->code); };
}

void UnitPage::choose(std::size_t index) {
  if (index == 0) {
    goWithout();
  } else {
    wish = Wish::Leave;
  }
}

void UnitPage::followKey(unsigned int code) {
  if (buttons.isDeaf()) return;
  if (code == MW::kKeySelect) wish = Wish::Without;
  if (code == kKeyBack) wish = Wish::Leave;
}

void UnitPage::answer(std::string serial) {
  const std::lock_guard guard(lock);
  entered = std::move(serial);
}

// What was typed stays in the bar, for a correction.
void UnitPage::follow(Keyboard& from) {
  if (from.get_fold_status()) {
    from.set_fold_status(false);
    wish = Wish::Leave;
  }
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
