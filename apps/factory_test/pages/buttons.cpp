// Push buttons that tell what happens to them, and the primitives.
#include <MW/button.h>
#include <MW/primitives.h>
#include <MW/widget_list.h>

#include <algorithm>
#include <array>
#include <atomic>
#include <cstdio>
#include <memory>
#include <optional>

#include "current.h"
#include "language/language.h"
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
constexpr Grid kGrid = {2, 3};

/// Press, click, long press, double click and delayed show, each counted on the line.
class ButtonTest : public PageTest {
 public:
  ButtonTest() : PageTest(tr("Buttons"), tr("Use every button as it says.")) {}

  void enter() override {
    page.ask();
    placePrimitives();
    for (std::size_t i = 0; i < kButtons.size(); ++i) placeButton(i);
  }

  bool isComplete() const override {
    return std::ranges::all_of(counts, [](const auto& count) { return count > 0; });
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
    constexpr int kRulerWidth = 6;
    const ScreenSize screen = screenSize();
    const auto [top, under, buttons] = areas();
    const auto [words, picture, plain] = columnsOf<3>(top, gapOf(screen), {1, 1, 1});
    const SKIA_Rect box = inColor(plain, kPassInk.ground);
    const SKIA_Point ruler = {under.x, under.y,          under.x + under.w,
                              under.y, kPanelInk.ground, kRulerWidth};
    SKIA_Text caption = captionIn(words, tr("Label,\npicture,\nbox, line"), kPageInk.text);
    caption.align = SKIA_ALIGN_LEFT;
    const SKIA_Text name =
        textOf(picturePath("test_card.png").c_str(), MW::kUnused, MW::kUnused, MW::kUnused);
    MW::WidgetList::init();
    MW::Label(&words, &caption).add_MWWList();
    MW::Image(&picture, &name).add_MWWList();
    MW::Box(&box).add_MWWList();
    MW::Line(&ruler).add_MWWList();
  }

  // For the primitives, the ruler and the buttons.
  static std::array<SKIA_Rect, 3> areas() {
    return rowsOf<3>(contentArea(), gapOf(screenSize()), {12, 1, 30});
  }

  void placeButton(std::size_t number) {
    const ButtonRow& look = kButtons.at(number);
    const SKIA_Rect area =
        inColor(cellOf(areas().back(), gapOf(screenSize()), kGrid, static_cast<int>(number)),
                kButtonInk.ground);
    const SKIA_Text caption = captionIn(area, tr(look.caption), kButtonInk.text);
    Button& button = buttons.at(number).emplace(&area, &caption);
    button.*look.callback = look.handler;
    if (number != kLate) button.setActive(1);
  }

  void report(Place place) {
    std::array<char, SKIA_TEXT_BYTES> words{};
    std::snprintf(words.data(), words.size(), "%s: %u", tr(kButtons.at(place).caption),
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
  std::array<std::atomic<unsigned int>, kButtonCount> counts = {};
  std::array<std::optional<Button>, kButtonCount> buttons;
};

const std::array<ButtonTest::ButtonRow, ButtonTest::kButtonCount> ButtonTest::kButtons = {{
    {msg("Press"), &Widget::pressCallback, [](int) { self().report(kPress); }},
    {msg("Click"), &Widget::clickCallback, [](int) { self().report(kClick); }},
    {msg("Long press"), &Widget::longPressCallback, [](int) { self().report(kLongPress); }},
    {msg("Double click"), &Widget::doubleClickCallback, [](int) { self().report(kDoubleClick); }},
    {msg("Delayed show"), &Widget::clickCallback, [](int) { self().showLate(); }},
    {msg("Hide me"), &Widget::clickCallback, [](int) { self().hideLate(); }},
}};

}  // namespace

std::unique_ptr<Test> makeButtons(const Context&) { return std::make_unique<ButtonTest>(); }

}  // namespace factory_test
