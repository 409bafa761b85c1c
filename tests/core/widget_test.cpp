#include <array>
#include <bit>

#include "support/widget_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
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
  widget.setBlink(7, MW::kColorBlue);
  for (const unsigned int now : ticks) {
    found += widget.updateBlink(now) == MW::kColorBlue ? 'l' : 'd';
  }
  widget.setBlink(0, MW::kColorBlue);
  return found + (widget.updateBlink(*ticks.begin()) == MW::kColorBlack ? "." : "!");
}

TEST_F(WidgetTest, Blinks) {
  EXPECT_EQ(phases({1000, 1500, 1501}), "ddl.");
  EXPECT_EQ(phases({0, 500, 501}), "ddl.") << "from the clock's start";
  EXPECT_EQ(phases({1000, 1900, 2400, 2401}), "dlld.") << "counted from the late tick";
  EXPECT_EQ(phases({0xFFFFFF00, 0xFFFFFF01, 0xF4, 0xF5}), "dddl.") << "over the wrap";
  EXPECT_EQ(phases({0xFFFFFE0C, 0, 1}), "ddl.") << "up to the wrap";
  EXPECT_EQ(phases({0xFFFFFD00, 0x10, 0x205}), "dld.") << "none was drawn from its end to the wrap";
  EXPECT_EQ(phases({0xF0000000, 0xA0000000}), "dl.") << "hidden for a month";
}

TEST_F(WidgetTest, ThePlainOneHasNothingAndAnswersNothing) {
  W widget;
  EXPECT_EQ(widget.getText(), nullptr);
  EXPECT_EQ(widget.getPositionAndSize(), nullptr);
  EXPECT_EQ(widget.getBgColor() | widget.getTextColor(), 0U);
  EXPECT_EQ(widget.getFontSize() | widget.show() | widget.show(1) | widget.hide(), 0);
  EXPECT_EQ(widget.add_MWWList() | widget.setTimer(5), 0);
}

struct KeyDirWidget : W {
  using W::keyDir;
};

TEST_F(WidgetTest, KeysMoveTheSelection) {
  KeyDirWidget widget;
  EXPECT_EQ(widget.move_key_select(276, 0, 1) + widget.keyDir, 0);
  EXPECT_EQ(widget.move_key_select(276, 1, 0) + widget.keyDir, 1);
  EXPECT_EQ(widget.move_key_select(275, 1, 0) + widget.keyDir, 1);
  EXPECT_EQ(widget.move_key_select(275, 0, 5) + widget.keyDir, 2);
  EXPECT_EQ(widget.move_key_select(327, 0, 0) + widget.keyDir, 2);
  EXPECT_EQ(widget.move_key_select(327, 0, -1) + widget.keyDir, 3);
}

}  // namespace
