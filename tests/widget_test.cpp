#include <MW/button.h>
#include <MW/widget.h>

#include <array>
#include <cstring>
#include <type_traits>

#include "support/widget_test.h"

namespace {

using brimol::test::kRowName;
using brimol::test::Row;
using brimol::test::WidgetTest;
using MW::Callback;
using MW::Widget;

// By the Itanium ABI a pointer to a virtual member holds its offset in the table of virtual
// functions, plus 1; on ARM the 1 stands in the adjustment behind it instead.
template <typename Member>
std::size_t slotOf(Member member) {
  struct Words {
    std::size_t function, adjustment;
  };
  static_assert(sizeof(Member) == sizeof(Words));
  Words words = {};
  std::memcpy(&words, &member, sizeof words);
  const std::size_t offset = words.function % 2 == 1 ? words.function - 1 : words.function;
  return offset / sizeof(void (*)());
}

template <typename... Arguments>
std::size_t showSlot(int (Widget::*member)(Arguments...)) {
  return slotOf(member);
}

// The two destructors stand in slots 0 and 1: nothing else is left for them.
TEST(WidgetTableTest, VirtualOperationsKeepTheirPlaces) {
  const auto slots = std::to_array<std::size_t>(
      {showSlot<>(&Widget::show),      showSlot<unsigned int>(&Widget::show),
       slotOf(&Widget::updateTimer),   slotOf(&Widget::hide),
       slotOf(&Widget::onRecvEvent),   slotOf(&Widget::getText),
       slotOf(&Widget::getBgColor),    slotOf(&Widget::getTextColor),
       slotOf(&Widget::getFontSize),   slotOf(&Widget::getPositionAndSize),
       slotOf(&Widget::setFontSize),   slotOf(&Widget::setText),
       slotOf(&Widget::setTextAlign),  slotOf(&Widget::setTextColor),
       slotOf(&Widget::setBgColor),    slotOf(&Widget::setBdColor),
       slotOf(&Widget::setLnColor),    slotOf(&Widget::onShowTimer),
       slotOf(&Widget::add_MWWList),   slotOf(&Widget::lcdOn),
       slotOf(&Widget::onHideTimer),   slotOf(&Widget::onHover),
       slotOf(&Widget::onPress),       slotOf(&Widget::onRelease),
       slotOf(&Widget::onPressLong),   slotOf(&Widget::setRect),
       slotOf(&Widget::setMsg),        slotOf(&Widget::onTouchClickCount),
       slotOf(&Widget::setTimer),      slotOf(&Widget::onPressKey),
       slotOf(&Widget::onReleaseKey),  slotOf(&Widget::onPlugKey),
       slotOf(&Widget::onPressTouch),  slotOf(&Widget::onReleaseTouch),
       slotOf(&Widget::onProgressbar), slotOf(&Widget::restoreColor),
       slotOf(&Widget::Lock),          slotOf(&Widget::unLock),
       slotOf(&Widget::setDesc),       slotOf(&Widget::setbutton)});
  ASSERT_EQ(slots.size(), 40U);
  for (std::size_t i = 0; i < slots.size(); ++i) EXPECT_EQ(slots.at(i), i + 2);
}

TEST_F(WidgetTest, StartsInactiveAndFree) {
  const Widget widget;
  EXPECT_FALSE(widget.isActive());
  EXPECT_EQ(widget.isSelect(), 0);
  EXPECT_EQ(widget.getOwnerFinger(), -1);
  EXPECT_EQ(widget.type(), 0);
  EXPECT_EQ(widget.id(), 0);
  EXPECT_EQ(widget.typeButton(), 0);
}

TEST_F(WidgetTest, BaseOperationsAnswerNothing) {
  Widget widget;
  MW::event_data event = brimol::test::pointerEvent(MW::kEventPress, {0, 0});
  EXPECT_EQ(widget.show() + widget.show(1) + widget.hide() + widget.setTimer(1), 0);
  EXPECT_FALSE(widget.onRecvEvent(&event, 0));
  EXPECT_EQ(widget.getText(), nullptr);
  EXPECT_EQ(widget.getPositionAndSize(), nullptr);
  EXPECT_EQ(widget.getBgColor() + widget.getTextColor(), 0U);
  EXPECT_EQ(widget.getFontSize() + widget.add_MWWList(), 0);
  EXPECT_TRUE(brimol::test::platform().takeDrawings().empty());
}

TEST_F(WidgetTest, BecomingInactiveUnselects) {
  Widget widget;
  widget.setSelect(3);
  widget.setActive(-1);
  EXPECT_TRUE(widget.isActive());
  EXPECT_EQ(widget.isSelect(), 3);
  widget.setActive(0);
  EXPECT_FALSE(widget.isActive());
  EXPECT_EQ(widget.isSelect(), 0);
}

constexpr unsigned int kBlack = 0xFF000000;
constexpr unsigned int kRed = 0xFFFF0000;

struct BlinkStep {
  unsigned int now, color;
};

struct BlinkCase : Row {
  std::vector<BlinkStep> steps;
};

class WidgetBlink : public testing::TestWithParam<BlinkCase> {};

TEST_P(WidgetBlink, ShowsAPhase) {
  Widget widget;
  EXPECT_EQ(widget.setBlink(1, kRed), kRed);
  for (const BlinkStep& step : GetParam().steps) {
    EXPECT_EQ(widget.updateBlink(step.now), step.color) << step.now;
  }
}

INSTANTIATE_TEST_SUITE_P(
    Times, WidgetBlink,
    testing::Values(
        BlinkCase{"StartsDarkFor500", {{1000, kBlack}, {1500, kBlack}, {1501, kRed}}},
        BlinkCase{"CountsFromTheTickThatNotices",
                  {{1000, kBlack}, {1900, kRed}, {2400, kRed}, {2401, kBlack}}},
        BlinkCase{"TogglesOnceAfterALongPause", {{1, kBlack}, {9000, kRed}, {9001, kRed}}},
        // The next toggle lies behind the wrap and so looks past until the clock has wrapped.
        BlinkCase{"GoesOnAfterTheWrap",
                  {{0xFFFFFF00, kRed}, {0xFFFFFF01, kBlack}, {0x10, kBlack}, {0x200, kRed}}},
        // A toggle at tick 0 stands for none and is set anew behind the wrap.
        BlinkCase{"SurvivesAToggleAtTickZero",
                  {{0xFFFFFE0C, kRed}, {0x10, kRed}, {0x204, kRed}, {0x205, kBlack}}}),
    kRowName);

TEST_F(WidgetTest, BlinkEndsAndStartsAnew) {
  Widget widget;
  EXPECT_EQ(widget.updateBlink(5), kBlack);
  widget.setBlink(1, kRed);
  widget.updateBlink(1);
  EXPECT_EQ(widget.updateBlink(1000), kRed);
  widget.setBlink(7, kRed);
  EXPECT_EQ(widget.updateBlink(3000), kBlack) << "a new start begins dark";
  EXPECT_EQ(widget.setBlink(0, kRed), 0U);
  EXPECT_EQ(widget.updateBlink(9000), kBlack);
}

class KeyDirWidget : public Widget {
 public:
  using Widget::keyDir;
};

struct KeyCase : Row {
  int key, canLeft, canRight, keyDir, result;
};

class WidgetKeys : public testing::TestWithParam<KeyCase> {};

TEST_P(WidgetKeys, MoveTheSelection) {
  const KeyCase& row = GetParam();
  KeyDirWidget widget;
  EXPECT_EQ(widget.keyDir, 0);
  widget.keyDir = 7;
  EXPECT_EQ(widget.move_key_select(row.key, row.canLeft, row.canRight), row.result);
  EXPECT_EQ(widget.keyDir, row.keyDir);
}

INSTANTIATE_TEST_SUITE_P(
    Keys, WidgetKeys,
    testing::Values(KeyCase{"Left", 276, 1, 0, 1, 0}, KeyCase{"LeftBarred", 276, 0, 1, 7, 0},
                    KeyCase{"Right", 275, 0, 5, 2, 0}, KeyCase{"RightBarred", 275, 1, 0, 7, 0},
                    KeyCase{"SelectLeft", 327, 1, 0, 7, 1},
                    KeyCase{"SelectRight", 327, 0, -1, 7, 1},
                    KeyCase{"SelectNothing", 327, 0, 0, 7, 0}, KeyCase{"Up", 273, 1, 1, 7, 0}),
    kRowName);

TEST(CallbackTest, WordsStandInOrder) {
  using Word = Callback Widget::*;
  const auto words = std::to_array<Word>(
      {&Widget::pressCallback,        &Widget::hoverCallback,       &Widget::clickCallback,
       &Widget::longPressCallback,    &Widget::doubleClickCallback, &Widget::callbackWord5,
       &Widget::keyPressCallback,     &Widget::keyReleaseCallback,  &Widget::plugCallback,
       &Widget::doubleKeyCallback,    &Widget::tripleKeyCallback,   &Widget::touchPressCallback,
       &Widget::touchReleaseCallback, &Widget::button1Callback,     &Widget::button2Callback,
       &Widget::hookKeyCallback,      &Widget::rowPressCallback,    &Widget::callbackWord17,
       &Widget::callbackWord18,       &Widget::leftCallback,        &Widget::rightCallback,
       &Widget::exitCallback});
  Widget widget;
  ASSERT_EQ(words.size(), 22U);
  for (std::size_t i = 0; i < words.size(); ++i) {
    const Callback& word = widget.*words.at(i);
    EXPECT_FALSE(word) << i;
    EXPECT_EQ(&word, &widget.pressCallback + i);
  }
}

int lastInt;
int* lastInts;
MW::mouse_event* lastMouse;
MW::kbd_event* lastKey;
void takeInt(int value) { lastInt = value; }

TEST(CallbackTest, TakesEachKindOfFunction) {
  Callback word;
  word(1);  // null: nothing happens

  word = takeInt;
  word(2);
  EXPECT_EQ(lastInt, 2);
  word = [](int value) { lastInt = -value; };
  word(3);
  EXPECT_EQ(lastInt, -3);

  MW::mouse_event mouse = {};
  word = [](MW::mouse_event* event) { lastMouse = event; };
  word(&mouse);
  EXPECT_EQ(lastMouse, &mouse);
  MW::kbd_event key = {};
  word = [](MW::kbd_event* event) { lastKey = event; };
  word(&key);
  EXPECT_EQ(lastKey, &key);
  word = [](int* values) { lastInts = values; };
  word(&lastInt);
  EXPECT_EQ(lastInts, &lastInt);

  EXPECT_TRUE(word);
  word = nullptr;
  EXPECT_FALSE(word);
}

static_assert(!std::is_constructible_v<Callback, int (*)(int)>, "a result would be lost");
static_assert(!std::is_constructible_v<Callback, void (*)(char)>);

}  // namespace
