// The keyboard on the screen, in all its layouts.
#include <MW/ime.h>

#include <array>
#include <atomic>
#include <memory>
#include <optional>
#include <string>

#include "button_row.h"
#include "current.h"
#include "language/language.h"
#include "layout.h"
#include "page_test.h"
#include "pages/table.h"

namespace factory_test {

namespace {

/// Tells what was entered. A button for each layout, and the up key for the next one.
class KeyboardTest : public PageTest {
 public:
  KeyboardTest()
      : PageTest(
            tr("Keyboard"),
            tr("Type and enter. The buttons below, or key up,\nchange the layout; fold ends.")) {}

  void enter() override {
    page.ask().otherKey = [](unsigned int code) {
      if (code == MW::kKeyUp) self().change(self().layout + 1);
    };
    const auto [upper, lower] = rowsOf<2>(contentArea(), gapOf(screenSize()), {7, 1});
    const SKIA_Rect area = inColor(upper, kPanelInk.ground);
    const SKIA_Text looks = captionOf("");
    keyboard.emplace(&area, &looks);
    keyboard->release_cb = [](int, MW::Ime* from) { self().follow(*from); };
    keyboard->setActive(1);
    layouts.emplace(lower, kFaces);
  }

  void leave() override {
    layouts.reset();
    keyboard.reset();
    page.endAsking();
  }

  bool isComplete() const override { return wasEntered; }
  Outcome verdict() const override { return folded ? Outcome::Left : PageTest::verdict(); }

 private:
  // By the numbers of MW::Ime's layouts.
  static constexpr std::size_t kLayoutCount = MW::Ime::kOnlyDigits + 1;
  static const std::array<ButtonRow::Face, kLayoutCount> kFaces;

  static KeyboardTest& self() { return Current<KeyboardTest>::get(); }

  void change(std::size_t number) {
    layout = number % kLayoutCount;
    const auto type = static_cast<unsigned int>(layout);
    keyboard->keyboard_change(MW::Ime::kSmall);  // takes the grey of the digits away
    keyboard->keyboard_change(type);
    keyboard->presskey_set(type);
    page.say(kFaces.at(type).caption);
  }

  void follow(MW::Ime& from) {
    if (from.get_fold_status()) folded = true;
    const std::string entered = from.getResultString();
    if (entered.empty()) return;
    from.setResultString("");
    wasEntered = true;
    page.say((tr("Entered: ") + entered).c_str());
  }

  Current<KeyboardTest> current{this};
  std::atomic<bool> folded = false;
  std::atomic<bool> wasEntered = false;
  std::atomic<std::size_t> layout = MW::Ime::kSmall;
  std::optional<MW::Ime> keyboard;
  std::optional<ButtonRow> layouts;
};

const std::array<ButtonRow::Face, KeyboardTest::kLayoutCount> KeyboardTest::kFaces = {{
    {"abc", [](int) { self().change(MW::Ime::kSmall); }},
    {"ABC", [](int) { self().change(MW::Ime::kCapitals); }},
    {"#+=", [](int) { self().change(MW::Ime::kSpecial); }},
    {"123", [](int) { self().change(MW::Ime::kOnlyDigits); }},
}};

}  // namespace

std::unique_ptr<Test> makeKeyboard(const Context&) { return std::make_unique<KeyboardTest>(); }

}  // namespace factory_test
