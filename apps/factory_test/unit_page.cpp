#include "unit_page.h"

#include <array>
#include <utility>

#include "language/language.h"
#include "layout.h"
#include "verdict_bar.h"

namespace factory_test {

UnitPage::UnitPage()
    : page(tr("Which unit?"), tr("Type the serial number of the phone,\nthen the enter key.")) {
  using Here = Current<UnitPage>;
  static constexpr auto kFaces = std::to_array<ButtonRow::Face>(
      {{msg("Without a number"), [](int) { Here::get().answer(""); }}});
  const auto [upper, lower] = rowsOf<2>(contentArea(), gapOf(screenSize()), {7, 1});
  const SKIA_Rect area = inColor(upper, kPanelInk.ground);
  const SKIA_Text looks = captionOf("");
  keyboard.emplace(&area, &looks);
  keyboard->release_cb = [](int, MW::Ime* from) { Here::get().follow(*from); };
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

void UnitPage::follow(MW::Ime& from) {
  const std::string serial = from.getResultString();
  if (serial.empty()) return;
  from.typing_reset();
  answer(serial);
}

std::optional<std::string> UnitPage::takeAnswer() {
  const std::lock_guard guard(lock);
  return std::exchange(entered, std::nullopt);
}

}  // namespace factory_test
