// Push buttons that tell what happens to them, and the primitives.
#include <MW/button.h>
#include <MW/primitives.h>
#include <MW/widget_list.h>

#include <array>
#include <cstdio>
#include <memory>
#include <optional>

#include "current.h"
#include "layout.h"
#include "page_test.h"
#include "pages/table.h"
#include "pictures.h"

namespace factory_test {

namespace {

using MW::Button;
using MW::Callback;
using MW::Widget;

constexpr int kLateMs = 1000;
constexpr uint32_t kBoxColor = 0xFF3FA66B;
constexpr uint32_t kRulerColor = 0xFF4C5870;
constexpr int kColumns = 3;

/// Press, click, long press, double click and delayed show, each counted on the line.
class ButtonTest : public PageTest {
 public:
  ButtonTest() : PageTest("Buttons", "Use every button as it says.") {}

  void enter() override {
    page.ask();
    placePrimitives();
    for (std::size_t i = 0; i < kButtons.size(); ++i) placeButton(i);
  }

  void leave() override {
    for (auto& button : buttons) button.reset();
    MW::WidgetList::destroy();
    page.endAsking();
  }

  void draw() override {
    page.draw();
    MW::WidgetList::show();
  }

 private:
  enum Place { kPress, kClick, kLongPress, kDoubleClick, kDelayedShow, kLate };
  struct ButtonRow {
    const char* caption;
    Callback Widget::*callback;
    void (*handler)(int);
  };

  static ButtonTest& self() { return Current<ButtonTest>::get(); }

  // By Place.
  static constexpr std::size_t kButtonCount = 6;
  static const std::array<ButtonRow, kButtonCount> kButtons;

  // What never changes goes to the display-item table, which keeps copies.
  static void placePrimitives() {
    const ScreenSize screen = screenSize();
    const SKIA_Rect row = rowOf(screen, kContentTop, 12, kBoxColor);
    const SKIA_Rect words = cellOf(row, 0, kColumns);
    const SKIA_Rect picture = cellOf(row, 1, kColumns);
    const SKIA_Rect box = cellOf(row, 2, kColumns);
    const SKIA_Rect under = rowOf(screen, kContentTop + 13, 1, 0);
    const SKIA_Point ruler = {under.x, under.y, under.x + under.w, under.y, kRulerColor, 6};
    const SKIA_Text caption =
        textOf("Label,\npicture,\nbox, line", MW::kColorWhite, SKIA_ALIGN_LEFT, textSize(screen));
    const SKIA_Text name =
        textOf(picturePath("test_card.png").c_str(), MW::kUnused, MW::kUnused, MW::kUnused);
    MW::WidgetList::init();
    MW::Label(&words, &caption).add_MWWList();
    MW::Image(&picture, &name).add_MWWList();
    MW::Box(&box).add_MWWList();
    MW::Line(&ruler).add_MWWList();
  }

  void placeButton(std::size_t number) {
    const ButtonRow& look = kButtons.at(number);
    const ScreenSize screen = screenSize();
    const SKIA_Rect area = cellOf(screen, kButtonGrid, static_cast<int>(number), kButtonColor);
    const SKIA_Text caption = captionOf(look.caption);
    Button& button = buttons.at(number).emplace(&area, &caption);
    button.*look.callback = look.handler;
    if (number != kLate) button.setActive(1);
  }

  void report(Place place) {
    std::array<char, SKIA_TEXT_BYTES> words{};
    std::snprintf(words.data(), words.size(), "%s: %u", kButtons.at(place).caption,
                  ++counts.at(place));
    page.say(words.data());
  }

  void showLate() {
    report(kDelayedShow);
    buttons.at(kLate)->onShowTimer(kLateMs);
  }

  void hideLate() {
    report(kLate);
    buttons.at(kLate)->hide();
  }

  Current<ButtonTest> current{this};
  std::array<unsigned int, kButtonCount> counts = {};  // dispatch thread
  std::array<std::optional<Button>, kButtonCount> buttons;
};

const std::array<ButtonTest::ButtonRow, ButtonTest::kButtonCount> ButtonTest::kButtons = {{
    {"Press", &Widget::pressCallback, [](int) { self().report(kPress); }},
    {"Click", &Widget::clickCallback, [](int) { self().report(kClick); }},
    {"Long press", &Widget::longPressCallback, [](int) { self().report(kLongPress); }},
    {"Double click", &Widget::doubleClickCallback, [](int) { self().report(kDoubleClick); }},
    {"Delayed show", &Widget::clickCallback, [](int) { self().showLate(); }},
    {"Hide me", &Widget::clickCallback, [](int) { self().hideLate(); }},
}};

}  // namespace

std::unique_ptr<Test> makeButtons(const Context&) { return std::make_unique<ButtonTest>(); }

}  // namespace factory_test
