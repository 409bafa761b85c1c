#include <MW/button.h>

#include <sstream>

#include "support/widget_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::Button;
using MW::Widget;

constexpr unsigned int kNormal = 0xFF202020;
constexpr unsigned int kHeld = 0xFF87CEFA;
constexpr SKIA_Rect kArea = {100, 200, 300, 80, kNormal};
constexpr Spot kInside = {100, 279};
constexpr Spot kOutside = {400, 240};

std::string calls;  // a letter for each callback, a capital one while the button looks held
std::unique_ptr<Button> button;

template <char letter>
void note(int value) {
  constexpr char kCapital = letter - 'a' + 'A';
  calls += value != 0 ? '!' : button->getBgColor() == kHeld ? kCapital : letter;
}

class ButtonTest : public WidgetTest {
 protected:
  void SetUp() override {
    WidgetTest::SetUp();
    calls.clear();
    const SKIA_Text caption = textRecord("Start", 0xFFFFFFFF, 5, 48);
    button = std::make_unique<Button>(&kArea, &caption);
    button->setActive(1);
    button->pressCallback = note<'p'>;
    button->clickCallback = note<'c'>;
    platform().ticks = 10000;
  }
  void TearDown() override {
    button.reset();
    WidgetTest::TearDown();
  }

  // A step is a letter, M for motion, P press, R release, L long press and K key press, a capital
  // one inside the button and a small one outside, and the finger. Its outcome: taken or not, the
  // selection, the callbacks, and * while the button looks held.
  static std::string outcomes(const std::string& steps) {
    std::ostringstream found;
    for (std::size_t i = 0; i < steps.size(); i += 3) {
      const std::size_t letter = std::string("MPRLKmprlk").find(steps[i]);
      const auto finger = static_cast<unsigned int>(steps[i + 1] - '0');
      const auto code = static_cast<MW::EventCode>(letter % 5);
      calls.clear();
      const bool taken =
          offer(*button, pointerEvent(code, letter < 5 ? kInside : kOutside, finger));
      found << (taken ? '+' : '-') << button->isSelect() << calls
            << (button->getBgColor() == kHeld ? "* " : " ");
    }
    return found.str();
  }

  // What clicks call whose presses and releases happen at these ticks, and the last one's log.
  std::string callsOfClicks(const std::vector<unsigned int>& times) {
    SetUp();
    button->doubleClickCallback = note<'d'>;
    for (std::size_t i = 0; i < times.size(); ++i) {
      platform().ticks = times[i];
      platform().takeLog();
      offer(*button, pointerEvent(i % 2 == 0 ? MW::kEventPress : MW::kEventRelease, kInside));
    }
    return calls + platform().takeLog().at(0).message;
  }
};

TEST_F(ButtonTest, ShowsItsLooks) {
  EXPECT_EQ(shown(*button)[0], (Drawing{Call::ButtonBox, kArea, {}, {"Start", 0xFFFFFFFF, 5, 48}}));
  const SKIA_Rect elsewhere = {1, 2, 3, 4, 0xFF00FF00};
  button->setRect(9, &elsewhere);
  button->setRect(9, nullptr);
  button->setText(std::string(200, 'x').c_str());
  button->setTextColor(1);
  button->setFontSize(20);
  const SKIA_Rect moved = {1, 2, 3, 4, kNormal};  // the colour is not taken over
  EXPECT_EQ(shown(*button)[0],
            (Drawing{Call::ButtonBox, moved, {}, {std::string(127, 'x'), 1, 5, 20}}));
  Button empty(nullptr, nullptr);
  EXPECT_EQ(shown(empty)[0], Drawing{.call = Call::ButtonBox});
}

TEST_F(ButtonTest, GoesByTheStepsOfAGesture) {
  EXPECT_EQ(outcomes("P0 R0 "), "+1P* +0c ");
  EXPECT_EQ(outcomes("P0 M0 m0 r0 "), "+1P* +1* +1 +0 ") << "left";
  EXPECT_EQ(outcomes("P0 m0 M0 R0 "), "+1P* +1 +1 +0c ") << "left and back";
  EXPECT_EQ(outcomes("p0 r0 l0 M0 "), "-0 -0 -0 -0 ") << "a free button outside";
  EXPECT_EQ(outcomes("R0 "), "+0c ") << "without a press";
  EXPECT_EQ(outcomes("P2 p0 r5 r0 "), "+3P* +1P* +0 -0 ") << "any finger is followed";
  EXPECT_EQ(outcomes("P0 l0 K0 R0 "), "+1P* +1* -1* +0c ") << "no callback for the long press";
  button->longPressCallback = note<'l'>;
  platform().takeLog();
  EXPECT_EQ(outcomes("P0 L0 M0 "), "+1P* +0L -0 ");
  EXPECT_EQ(platform().takeLog(),
            logLines(kDebug, {"[BUTTON] pressed!!", "[BUTTON] long pressed!!"}));
  EXPECT_EQ(MW::isDisplayUpdate(0), 0) << "the dispatcher's business";
}

TEST_F(ButtonTest, CountsClicksByTheClock) {
  const std::string counted = "[BUTTON] onTouchClickCount!! ";
  const std::string uncounted = "[BUTTON] released!!";
  EXPECT_EQ(callsOfClicks({1000, 1100, 1200, 1300, 1400, 1500}), "PcPcdPc" + counted + "3");
  EXPECT_EQ(callsOfClicks({1000, 1499, 1600, 1700}), "PcPcd" + counted + "2");
  EXPECT_EQ(callsOfClicks({1000, 1500, 1600, 1700}), "PcPc" + counted + "1");
  EXPECT_EQ(callsOfClicks({1000, 1100, 1200, 1599}), "PcPcd" + counted + "2");
  EXPECT_EQ(callsOfClicks({1000, 1100, 1200, 1600}), "PcPc" + uncounted);
  EXPECT_EQ(callsOfClicks({1000, 1100, 1600, 1601}), "PcPc" + uncounted) << "old when released";
  EXPECT_EQ(callsOfClicks({1000, 1100, 1601, 1650}), "PcPc" + counted + "1");
  EXPECT_EQ(callsOfClicks({0, 0, 900, 1000, 1100, 1200}), "PcPcPcd" + counted + "2");
  // At the wrap a step may count as too late; the click after it counts again.
  EXPECT_EQ(callsOfClicks({~15U, ~7U, 2, 10, 1000, 1100, 1200, 1300}), "PcPcPcPcd" + counted + "2");
}

TEST_F(ButtonTest, RestoringTheColorAsksForARedrawAndHidingFrees) {
  button->restoreColor();
  EXPECT_EQ(MW::isDisplayUpdate(0), 0);
  press(*button, kInside);
  button->restoreColor();
  EXPECT_EQ(MW::isDisplayUpdate(0), 1);
  EXPECT_EQ(outcomes("M0 P0 "), "+1 +1P* ") << "still held";
  button->hide();
  EXPECT_FALSE(button->isActive());
  EXPECT_EQ(outcomes("M0 "), "-0 ");
}

TEST_F(ButtonTest, DelayedShowIsInvisibleAndDeafUntilDrawn) {
  button->setActive(0);
  button->onShowTimer(250);
  EXPECT_TRUE(button->isActive() && MW::isDisplayUpdate(0) == 1);
  for (const unsigned int time : {10249U, 10250U}) {
    platform().ticks = time;
    EXPECT_FALSE(press(*button, kInside)) << "not drawn yet";
    button->updateTimer(time);
    EXPECT_EQ(MW::isDisplayUpdate(0), time == 10250 ? 1 : 0);
    button->show();  // as of tick 0
    EXPECT_TRUE(platform().takeDrawings().empty());
    EXPECT_EQ(shown(*button).size(), time == 10250 ? 1U : 0U);
  }
  EXPECT_TRUE(press(*button, kInside));
  button->updateTimer(99999);
  EXPECT_EQ(MW::isDisplayUpdate(0), 0);
}

TEST_F(ButtonTest, CallbacksMayDeleteTheirButton) {
  for (const auto word : {&Widget::pressCallback, &Widget::clickCallback,
                          &Widget::longPressCallback, &Widget::doubleClickCallback}) {
    SetUp();
    button->doubleClickCallback = note<'d'>;
    (*button).*word = [](int) { button.reset(); };
    for (const auto code : {1, 2, 1, 3, 2}) {  // two clicks, as far as there is still a button
      if (button != nullptr) offer(*button, {.type = code, .mouse = {0, 0, 100, 200, 0, 0}});
    }
    EXPECT_EQ(button, nullptr);
  }
}

}  // namespace
