#include <algorithm>
#include <array>
#include <bit>
#include <climits>
#include <cmath>

#include "support/widget_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using W = MW::Widget;
using MW::Window;

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
  EXPECT_EQ(phases({1000, 1900, 2400, 2401}), "dlld.") << "counted from the late tick";
  // The next toggle lies behind the wrap and looks past until the clock has wrapped.
  EXPECT_EQ(phases({0xFFFFFF00, 0xFFFFFF01, 0x10, 0x200}), "lddl.");
  // A toggle at tick 0 stands for none and is set anew behind the wrap.
  EXPECT_EQ(phases({0xFFFFFE0C, 0x10, 0x204, 0x205}), "llld.");
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

TEST_F(WidgetTest, UnregisteringTakesTheFirstOfEqualIds) {
  std::string drawn;
  const JournalWidget a(drawn, 'a');
  JournalWidget b(drawn, 'b');
  const JournalWidget c(drawn, 'c');
  Window::unregisterWidget(&b);
  JournalWidget d(drawn, 'd');
  EXPECT_EQ(std::pair(c.id(), d.id()), std::pair(3, 3));
  EXPECT_EQ(JournalWidget(drawn, 'D', 0).id(), 1) << "layers are numbered apart";
  Window::unregisterWidget(&d);
  Window::show(1);
  EXPECT_EQ(drawn, "ad") << "c left in place of d";
}

TEST_F(WidgetTest, RegistrationsAreCountedAndRefused) {
  std::string calls;
  const JournalWidget widget(calls, 'w');
  const std::vector<LogLine> entered = platform().takeLog();
  EXPECT_EQ(entered.at(0), logLines(kWarning, {"[WINDOW] registerWidget: type=1"})[0]);
  const std::string counted = "[WINDOW] registerWidget: num_widget=";
  const int count = std::stoi(entered.at(1).message.substr(counted.size()));
  EXPECT_EQ(entered.at(1), logLines(kDebug, {counted + std::to_string(count)})[0]);
  for (const int type : {-1, 2, INT_MIN}) {
    ProbeWidget stranger(type);
    stranger.enter();
    EXPECT_EQ(stranger.id(), 0);
    Window::unregisterWidget(&stranger);
  }
  const std::string left = "[WINDOW] unregisterWidget: num_widget=" + std::to_string(count - 3);
  EXPECT_EQ(platform().takeLog().back(), logLines(kDebug, {left})[0]) << "counted all the same";
  EXPECT_EQ(Window::registerWidget(nullptr) + Window::unregisterWidget(nullptr), 2);
}

TEST_F(WidgetTest, DrawsAndTimesTheBaseLayerFirst) {
  std::string calls;
  const JournalWidget dialog(calls, 'D', 0);
  JournalWidget a(calls, 'a');
  JournalWidget hidden(calls, 'h');
  const JournalWidget b(calls, 'b');
  hidden.setActive(0);
  a.onShow = a.onTimer = [&](unsigned int ticks) { calls += std::to_string(ticks); };
  platform().ticks = 70;
  Window::show(5);
  Window::show();
  Window::updateTimer(5);
  EXPECT_EQ(calls, "5bD70bD70bD") << "the timer pass reads the clock";
}

TEST_F(WidgetTest, ChangesDuringAPassSkipAndRepeatNothing) {
  std::string calls;
  std::vector<std::unique_ptr<JournalWidget>> all;
  const auto add = [&](char name) { all.push_back(std::make_unique<JournalWidget>(calls, name)); };
  const auto unregister = [&](std::size_t i) { Window::unregisterWidget(all[i].get()); };
  // Widgets a, b and c are drawn twice; what a does when it is drawn first.
  const auto callsWith = [&](const std::function<void()>& change) {
    all.clear();
    calls.clear();
    for (const char name : {'a', 'b', 'c'}) add(name);
    bool changed = false;
    all[0]->onShow = [&](unsigned int) {
      calls += 'a';
      if (!std::exchange(changed, true)) change();
    };
    Window::show(1);
    calls += ' ';
    Window::show(2);
    return calls;
  };
  EXPECT_EQ(callsWith([&] { unregister(0); }), "abc bc");
  EXPECT_EQ(callsWith([&] { unregister(1); }), "ac ac");
  EXPECT_EQ(callsWith([&] { all.resize(1); }), "a a");
  EXPECT_EQ(callsWith([&] { Window::show(1); }), "aabcbc abc");
  EXPECT_EQ(callsWith([&] { unregister(1), all[1]->enter(); }), "ac acb");
  const auto addMany = [&] { std::ranges::for_each(std::string(40, 'n'), add); };
  EXPECT_EQ(callsWith(addMany), "abc abc" + std::string(40, 'n'));
}

TEST_F(WidgetTest, TurnsMillimetresIntoPixels) {
  using Pixels = std::pair<float, int>;  // the density as it is kept, and the length
  const auto pixels = [](float dpi, float mm) {
    Window::xdpi = 0;
    platform().xdpi = platform().ydpi = dpi;
    float told = 0;
    const int count = Window::getMura(&told, nullptr, mm);
    EXPECT_EQ(told, dpi) << "before it is rounded";
    EXPECT_EQ(Window::ydpi, dpi) << "only the horizontal density is rounded";
    return Pixels(Window::xdpi, count);
  };
  EXPECT_EQ(pixels(401.6F, 10), Pixels(402, 158));
  EXPECT_EQ(pixels(401.4F, 10), Pixels(401.4F, 158));
  EXPECT_EQ(pixels(100.5F, 254), Pixels(101, 1010));
  EXPECT_EQ(pixels(INFINITY, 10), Pixels(INFINITY, INT_MAX));
  EXPECT_EQ(pixels(-3e9F, 100), Pixels(-3e9F, INT_MIN));
  EXPECT_EQ(pixels(400, NAN), Pixels(400, 0));
  EXPECT_EQ(platform().takeLog()[0],
            logLines(kError, {"[WINDOW] getMura[402.000000 dpi] 10.000000mm = 158 pixel"})[0]);
}

}  // namespace
