#include <MW/widget.h>

#include <array>
#include <bit>
#include <type_traits>

#include "support/widget_test.h"

namespace {

using brimol::test::WidgetTest;
using MW::Callback;
using W = MW::Widget;

// By the Itanium ABI a pointer to a virtual member holds its offset in the table of virtual
// functions, plus 1; on ARM the 1 stands in the adjustment behind it instead.
template <typename... Members>
std::vector<std::size_t> slotsOf(Members... members) {
  const auto slot = [](auto member) {
    const std::size_t function = std::bit_cast<std::array<std::size_t, 2>>(member)[0];
    return (function - function % 2) / sizeof(void (*)());
  };
  return {slot(members)...};
}

// The two destructors stand in slots 0 and 1: nothing else is left for them.
TEST(WidgetTableTest, VirtualOperationsKeepTheirPlaces) {
  const std::vector<std::size_t> slots = slotsOf(
      static_cast<int (W::*)()>(&W::show), static_cast<int (W::*)(unsigned int)>(&W::show),
      &W::updateTimer, &W::hide, &W::onRecvEvent, &W::getText, &W::getBgColor, &W::getTextColor,
      &W::getFontSize, &W::getPositionAndSize, &W::setFontSize, &W::setText, &W::setTextAlign,
      &W::setTextColor, &W::setBgColor, &W::setBdColor, &W::setLnColor, &W::onShowTimer,
      &W::add_MWWList, &W::lcdOn, &W::onHideTimer, &W::onHover, &W::onPress, &W::onRelease,
      &W::onPressLong, &W::setRect, &W::setMsg, &W::onTouchClickCount, &W::setTimer, &W::onPressKey,
      &W::onReleaseKey, &W::onPlugKey, &W::onPressTouch, &W::onReleaseTouch, &W::onProgressbar,
      &W::restoreColor, &W::Lock, &W::unLock, &W::setDesc, &W::setbutton);
  ASSERT_EQ(slots.size(), 40U);
  for (std::size_t i = 0; i < slots.size(); ++i) EXPECT_EQ(slots[i], i + 2);
}

// Whether a widget that starts to blink is lit or dark at each tick.
std::string phases(std::initializer_list<unsigned int> ticks) {
  W widget;
  std::string found;
  EXPECT_EQ(widget.setBlink(7, MW::kColorBlue), MW::kColorBlue);
  for (const unsigned int now : ticks) {
    found += widget.updateBlink(now) == MW::kColorBlue ? 'l' : 'd';
  }
  EXPECT_EQ(widget.setBlink(0, MW::kColorBlue), 0U);
  EXPECT_EQ(widget.updateBlink(*ticks.begin()), MW::kColorBlack);
  return found;
}

TEST_F(WidgetTest, Blinks) {
  EXPECT_EQ(phases({1000, 1500, 1501}), "ddl");
  EXPECT_EQ(phases({1000, 1900, 2400, 2401}), "dlld") << "counted from the late tick";
  // The next toggle lies behind the wrap and looks past until the clock has wrapped.
  EXPECT_EQ(phases({0xFFFFFF00, 0xFFFFFF01, 0x10, 0x200}), "lddl");
  // A toggle at tick 0 stands for none and is set anew behind the wrap.
  EXPECT_EQ(phases({0xFFFFFE0C, 0x10, 0x204, 0x205}), "llld");
}

class KeyDirWidget : public W {
 public:
  using W::keyDir;
};

TEST_F(WidgetTest, KeysMoveTheSelection) {
  std::string found;  // the selection and the answer; neither side, right, left, and both allowed
  for (const int key : {276, 275, 327, 273}) {
    for (const int allowed : {0, 1, 2, 3}) {
      KeyDirWidget widget;
      const int answer = widget.move_key_select(key, allowed & 2, -(allowed & 1));
      found += std::to_string(widget.keyDir) + std::to_string(answer) + ' ';
    }
  }
  EXPECT_EQ(found, "00 00 10 10 00 20 00 20 00 01 01 01 00 00 00 00 ");
}

TEST(CallbackTest, CallsAFunctionThatTakesARecord) {
  MW::mouse_event mouse = {};
  Callback word;
  word(&mouse);  // null: nothing happens
  word = [](MW::mouse_event* event) { event->x = 5; };
  word(&mouse);
  EXPECT_EQ(mouse.x, 5);
}

static_assert(!std::is_constructible_v<Callback, int (*)(int)>, "a result would be lost");

}  // namespace
