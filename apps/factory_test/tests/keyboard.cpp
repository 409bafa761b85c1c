// The keyboard on the screen, in all its layouts.
#include <MW/button_s.h>
#include <MW/ime.h>

#include <array>
#include <atomic>
#include <optional>
#include <string>
#include <utility>

#include "current.h"
#include "layout.h"
#include "page_test.h"

namespace factory_test {

namespace {

// By the numbers of MW::Ime.
constexpr auto kLayouts = std::to_array<const char*>({"abc", "ABC", "#+=", "123"});
constexpr int kFramed = 2;  // MW::ButtonNew's style
constexpr uint32_t kKeyboardColor = 0xFF3C4A60;

/// Tells what was entered. A button for each layout, and the up key for the next one.
class KeyboardTest : public PageTest {
 public:
  KeyboardTest()
      : PageTest("Keyboard",
                 "Type and enter. The buttons below, or key up,\nchange the layout; fold ends.") {}

  void enter() override {
    page.ask().otherKey = [](unsigned int code) {
      if (code == MW::kKeyUp) self().change(self().layout + 1);
    };
    const SKIA_Rect area = rowOf(screenSize(), kContentTop, 38, kKeyboardColor);
    const SKIA_Text looks = captionOf("");
    keyboard.emplace(&area, &looks);
    keyboard->release_cb = [](int, MW::Ime* from) { self().follow(*from); };
    keyboard->setActive(1);
    placeButtons(std::make_index_sequence<kLayouts.size()>());
  }

  void leave() override {
    for (std::size_t i = buttons.size(); i > 0; --i) buttons.at(i - 1).reset();
    keyboard.reset();
    page.endAsking();
  }

  Outcome verdict() const override { return folded ? Outcome::Left : PageTest::verdict(); }

 private:
  static KeyboardTest& self() { return Current<KeyboardTest>::get(); }

  template <std::size_t... number>
  void placeButtons(std::index_sequence<number...>) {
    (placeButton(number, [](int) { self().change(number); }), ...);
  }

  void placeButton(std::size_t number, void (*clicked)(int)) {
    const SKIA_Rect area = cellOf(rowOf(screenSize(), 74, 6, kButtonColor),
                                  static_cast<int>(number), static_cast<int>(kLayouts.size()));
    const SKIA_Text caption = captionOf(kLayouts.at(number));
    MW::ButtonNew& button = buttons.at(number).emplace(kFramed, &area, &caption);
    button.clickCallback = clicked;
    button.setActive(1);
  }

  void change(std::size_t number) {
    layout = number % kLayouts.size();
    const auto type = static_cast<unsigned int>(layout);
    keyboard->keyboard_change(0);  // takes the grey of the digits away
    keyboard->keyboard_change(type);
    keyboard->presskey_set(type);
    page.say(kLayouts.at(type));
  }

  void follow(MW::Ime& from) {
    if (from.get_fold_status()) folded = true;
    const std::string entered = from.getResultString();
    if (entered.empty()) return;
    from.setResultString("");
    page.say(("Entered: " + entered).c_str());
  }

  Current<KeyboardTest> current{this};
  std::atomic<bool> folded = false;
  std::atomic<std::size_t> layout = 0;
  std::optional<MW::Ime> keyboard;
  std::array<std::optional<MW::ButtonNew>, kLayouts.size()> buttons;
};

const TestRegistration kRegistration({Group::Input, 3, "keyboard", "Keyboard",
                                      makeTest<KeyboardTest>});

}  // namespace

}  // namespace factory_test
