#include <MW/button.h>
#include <MW/window.h>

#include <memory>
#include <tuple>

#include "support/widget_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::Button;
using MW::Window;

constexpr unsigned int kNormal = 0xFF202020;
constexpr unsigned int kHeld = 0xFF87CEFA;
constexpr SKIA_Rect kArea = {100, 200, 300, 80, kNormal};
constexpr Spot kInside = {100, 279};
constexpr Spot kOutside = {400, 240};
const SKIA_Text kCaption = textRecord("Start", 0xFFFFFFFF, 5, 48);

std::string calls;  // a letter for each callback
std::unique_ptr<Button> button;

class ButtonTest : public WidgetTest {
 protected:
  void SetUp() override {
    WidgetTest::SetUp();
    calls.clear();
    button = std::make_unique<Button>(&kArea, &kCaption);
    button->setActive(1);
    button->pressCallback = [](int value) { calls += value == 0 ? 'p' : '!'; };
    button->clickCallback = [](int value) { calls += value == 0 ? 'c' : '!'; };
    platform().ticks = 10000;
    platform().takeLog();
  }
  void TearDown() override {
    button.reset();
    WidgetTest::TearDown();
  }

  static void countDoubleClicks() {
    button->doubleClickCallback = [](int value) { calls += value == 0 ? 'd' : '!'; };
  }
  static void clickAt(unsigned int pressed, unsigned int released) {
    platform().ticks = pressed;
    EXPECT_TRUE(press(*button, kInside));
    platform().ticks = released;
    EXPECT_TRUE(release(*button, kInside));
  }
};

TEST_F(ButtonTest, StartsRegisteredAndInactive) {
  SKIA_Text caption = kCaption;
  caption.string_len = 99;  // not believed
  Button other(&kArea, &caption);
  EXPECT_EQ(other.type(), 1);
  EXPECT_EQ(other.id(), 2);
  EXPECT_FALSE(other.isActive());
  EXPECT_EQ(other.isSelect(), 0);
  EXPECT_EQ(shown(other),
            (std::vector{Drawing{
                .call = Call::ButtonBox, .rect = kArea, .text = {"Start", 0xFFFFFFFF, 5, 48}}}));
}

TEST_F(ButtonTest, AbsentRecordsAreEmpty) {
  Button empty(nullptr, nullptr);
  EXPECT_EQ(shown(empty), (std::vector{Drawing{.call = Call::ButtonBox}}));
}

TEST_F(ButtonTest, AcceptsItsLooks) {
  const SKIA_Rect elsewhere = {1, 2, 3, 4, 0xFF00FF00};
  button->setRect(9, &elsewhere);
  button->setRect(9, nullptr);
  button->setText("Stop");
  button->setTextColor(0xFF0000FF);
  button->setFontSize(20);
  button->setBgColor(1);
  button->setTextAlign(1);
  EXPECT_EQ(shown(*button),
            (std::vector{Drawing{.call = Call::ButtonBox,
                                 .rect = {1, 2, 3, 4, kNormal},  // the colour is not taken over
                                 .text = {"Stop", 0xFF0000FF, 5, 20}}}));
  EXPECT_STREQ(button->getText(), "Stop");
  EXPECT_EQ(button->getTextColor(), 0xFF0000FFU);
  EXPECT_EQ(button->getFontSize(), 20);
  EXPECT_EQ(button->getBgColor(), kNormal);
  EXPECT_EQ(*button->getPositionAndSize(), (SKIA_Rect{1, 2, 3, 4, kNormal}));
  button->setText(std::string(200, 'x').c_str());
  EXPECT_EQ(button->getText(), std::string(127, 'x'));
}

// One step of a gesture and what the button is after it.
struct Step {
  MW::EventCode code;
  Spot spot;
  unsigned int finger;
  bool taken;
  int select;
  unsigned int color;
  const char* calls;  // so far
};

struct GestureCase : Row {
  std::vector<Step> steps;
  std::vector<std::string> log;
};

class ButtonGesture : public ButtonTest, public testing::WithParamInterface<GestureCase> {};

TEST_P(ButtonGesture, GoesByItsSteps) {
  int number = 0;
  for (const Step& step : GetParam().steps) {
    SCOPED_TRACE(++number);
    EXPECT_EQ(offer(*button, pointerEvent(step.code, step.spot, step.finger)), step.taken);
    EXPECT_EQ(button->isSelect(), step.select);
    EXPECT_EQ(button->getBgColor(), step.color);
    EXPECT_EQ(calls, step.calls);
  }
  EXPECT_EQ(platform().takeLog(), logLines(kDebug, GetParam().log));
  EXPECT_EQ(MW::isDisplayUpdate(0), 0) << "the dispatcher's business";
}

constexpr Step kPressed = {MW::kEventPress, kInside, 0, true, 1, kHeld, "p"};
constexpr const char* kPressedLog = "[BUTTON] pressed!!";
constexpr const char* kReleasedLog = "[BUTTON] released!!";

INSTANTIATE_TEST_SUITE_P(
    Gestures, ButtonGesture,
    testing::Values(GestureCase{"Click",
                                {kPressed, {MW::kEventRelease, kInside, 0, true, 0, kNormal, "pc"}},
                                {kPressedLog, kReleasedLog}},
                    GestureCase{"ReleaseOutside",
                                {kPressed,
                                 {MW::kEventMotion, {101, 201}, 0, true, 1, kHeld, "p"},
                                 {MW::kEventMotion, kOutside, 0, true, 1, kNormal, "p"},
                                 {MW::kEventRelease, kOutside, 0, true, 0, kNormal, "p"}},
                                {kPressedLog, kReleasedLog}},
                    GestureCase{"OutAndBackIn",
                                {kPressed,
                                 {MW::kEventMotion, kOutside, 0, true, 1, kNormal, "p"},
                                 {MW::kEventMotion, kInside, 0, true, 1, kNormal, "p"},
                                 {MW::kEventRelease, kInside, 0, true, 0, kNormal, "pc"}},
                                {kPressedLog, kReleasedLog}},
                    GestureCase{"FreeButtonOutside",
                                {{MW::kEventPress, kOutside, 0, false, 0, kNormal, ""},
                                 {MW::kEventRelease, kOutside, 0, false, 0, kNormal, ""},
                                 {MW::kEventLongPress, kOutside, 0, false, 0, kNormal, ""},
                                 {MW::kEventMotion, kInside, 0, false, 0, kNormal, ""}},
                                {}},
                    GestureCase{"ReleaseOfAFreeButton",
                                {{MW::kEventRelease, kInside, 0, true, 0, kNormal, "c"}},
                                {kReleasedLog}},
                    GestureCase{"SecondFingerIsFollowed",
                                {{MW::kEventPress, kInside, 2, true, 3, kHeld, "p"},
                                 {MW::kEventPress, kOutside, 0, true, 1, kHeld, "pp"},
                                 {MW::kEventRelease, kOutside, 5, true, 0, kNormal, "pp"},
                                 {MW::kEventRelease, kOutside, 0, false, 0, kNormal, "pp"}},
                                {kPressedLog, kPressedLog, kReleasedLog}},
                    GestureCase{"LongPressWithoutCallback",
                                {kPressed,
                                 {MW::kEventLongPress, kOutside, 0, true, 1, kHeld, "p"},
                                 {MW::kEventRelease, kInside, 0, true, 0, kNormal, "pc"}},
                                {kPressedLog, "[BUTTON] long pressed!!", kReleasedLog}}),
    kRowName);

TEST_F(ButtonTest, OtherCodesPassAHeldButton) {
  press(*button, kInside);
  for (int code = 4; code <= 8; ++code) {
    EXPECT_FALSE(offer(*button, {.type = code, .mouse = {0, 0, 150, 210, 0, 0}})) << code;
  }
  EXPECT_FALSE(button->onRecvEvent(nullptr, 0));
  EXPECT_EQ(button->isSelect(), 1);
}

TEST_F(ButtonTest, LongPressEndsTheHoldBehindItsCallback) {
  button->longPressCallback = [](int) { calls += button->getBgColor() == kHeld ? 'L' : '!'; };
  press(*button, kInside);
  EXPECT_TRUE(longPress(*button, kInside));
  EXPECT_EQ(calls, "pL");
  EXPECT_EQ(button->isSelect(), 0);
  EXPECT_EQ(button->getBgColor(), kNormal);
}

TEST_F(ButtonTest, CallbacksSeeTheButtonAsItIs) {
  button->pressCallback = [](int) { calls += button->getBgColor() == kHeld ? 'P' : '!'; };
  button->clickCallback = [](int) {
    calls += button->getBgColor() == kNormal && button->isSelect() == 0 ? 'C' : '!';
  };
  clickAt(10000, 10001);
  EXPECT_EQ(calls, "PC");
}

TEST_F(ButtonTest, NeedsNoCallbacks) {
  button->pressCallback = nullptr;
  button->clickCallback = nullptr;
  clickAt(10000, 10001);
  clickAt(10002, 10003);
  EXPECT_EQ(platform().takeLog(),
            logLines(kDebug, {kPressedLog, kReleasedLog, kPressedLog, kReleasedLog}))
      << "nothing is counted without a double click callback";
}

struct ClickTime {
  unsigned int pressed, released;
};

struct DoubleClickCase : Row {
  std::vector<ClickTime> clicks;
  const char* calls;
  int lastCount;  // logged by the last click; 0: none
};

class ButtonDoubleClick : public ButtonTest, public testing::WithParamInterface<DoubleClickCase> {};

TEST_P(ButtonDoubleClick, GoesByTheClock) {
  countDoubleClicks();
  for (const ClickTime& click : GetParam().clicks) {
    platform().takeLog();
    clickAt(click.pressed, click.released);
  }
  EXPECT_EQ(calls, GetParam().calls);
  std::vector<std::string> lines = {kPressedLog};
  if (GetParam().lastCount != 0) {
    lines.push_back("[BUTTON] onTouchClickCount!! " + std::to_string(GetParam().lastCount));
  }
  lines.emplace_back(kReleasedLog);
  EXPECT_EQ(platform().takeLog(), logLines(kDebug, lines));
}

INSTANTIATE_TEST_SUITE_P(
    Times, ButtonDoubleClick,
    testing::Values(
        DoubleClickCase{"One", {{1000, 1100}}, "pc", 1},
        DoubleClickCase{"Two", {{1000, 1100}, {1200, 1300}}, "pcpcd", 2},
        DoubleClickCase{"Three", {{1000, 1100}, {1200, 1300}, {1400, 1500}}, "pcpcdpc", 3},
        DoubleClickCase{"FirstHeld499", {{1000, 1499}, {1600, 1700}}, "pcpcd", 2},
        DoubleClickCase{"FirstHeld500", {{1000, 1500}, {1600, 1700}}, "pcpc", 1},
        DoubleClickCase{"SecondReleased499", {{1000, 1100}, {1200, 1599}}, "pcpcd", 2},
        DoubleClickCase{"SecondReleased500", {{1000, 1100}, {1200, 1600}}, "pcpc", 0},
        // Not yet too old for the press, but for the release that follows.
        DoubleClickCase{"SecondPressed500", {{1000, 1100}, {1600, 1601}}, "pcpc", 0},
        DoubleClickCase{"SecondPressed501", {{1000, 1100}, {1601, 1650}}, "pcpc", 1},
        DoubleClickCase{"Later", {{1000, 1100}, {9000, 9001}, {9100, 9101}}, "pcpcpcd", 2},
        // At the wrap a step may count as too late; the click after it counts again.
        DoubleClickCase{"AcrossTheWrap",
                        {{0xFFFFFFF0, 0xFFFFFFF8}, {2, 10}, {1000, 1100}, {1200, 1300}},
                        "pcpcpcpcd",
                        2},
        DoubleClickCase{"AtTickZero", {{0, 0}, {900, 1000}, {1100, 1200}}, "pcpcpcd", 2}),
    kRowName);

TEST_F(ButtonTest, ReleaseOutsideIsNoClickOfADoubleClick) {
  countDoubleClicks();
  clickAt(1000, 1100);
  press(*button, kInside);
  release(*button, kOutside);
  EXPECT_EQ(calls, "pcp");
}

TEST_F(ButtonTest, HideFreesIt) {
  press(*button, kInside);
  button->hide();
  EXPECT_FALSE(button->isActive());
  EXPECT_EQ(button->isSelect(), 0);
  EXPECT_EQ(button->getBgColor(), kNormal);
  EXPECT_EQ(MW::isDisplayUpdate(0), 0);
}

TEST_F(ButtonTest, RestoringTheColorAsksForARedrawOnce) {
  button->restoreColor();
  EXPECT_EQ(MW::isDisplayUpdate(0), 0);
  press(*button, kInside);
  button->restoreColor();
  EXPECT_EQ(MW::isDisplayUpdate(0), 1);
  EXPECT_EQ(button->getBgColor(), kNormal);
  EXPECT_EQ(button->isSelect(), 1) << "still held";
  EXPECT_EQ(platform().takeLog().size(), 1U);
}

TEST_F(ButtonTest, DelayedShowIsInvisibleAndDeafUntilDrawn) {
  button->setActive(0);
  button->onShowTimer(250);
  EXPECT_TRUE(button->isActive());
  EXPECT_EQ(MW::isDisplayUpdate(0), 1);
  platform().ticks = 10249;
  EXPECT_FALSE(press(*button, kInside));
  EXPECT_TRUE(shown(*button).empty());
  button->updateTimer(10249);
  EXPECT_EQ(MW::isDisplayUpdate(0), 0);
  platform().ticks = 10250;
  button->updateTimer(10250);
  EXPECT_EQ(MW::isDisplayUpdate(0), 1);
  EXPECT_FALSE(press(*button, kInside)) << "due, but not drawn yet";
  button->show();
  EXPECT_TRUE(platform().takeDrawings().empty()) << "show() draws as of tick 0";
  EXPECT_EQ(shown(*button).size(), 1U);
  EXPECT_TRUE(press(*button, kInside));
  button->updateTimer(99999);
  EXPECT_EQ(MW::isDisplayUpdate(0), 0);
}

// What a callback does to its own button, and where it is called from.
struct ChangeCase : Row {
  void (*change)(int);
};

struct WordCase : Row {
  MW::Callback MW::Widget::*word;
};

class ButtonChange : public ButtonTest,
                     public testing::WithParamInterface<std::tuple<ChangeCase, WordCase>> {};

// Each of two clicks with a long press is offered as far as there is still a button.
TEST_P(ButtonChange, FromInsideItsCallback) {
  const auto& [change, from] = GetParam();
  countDoubleClicks();
  (*button).*from.word = change.change;
  const auto codes = {MW::kEventPress, MW::kEventRelease, MW::kEventPress, MW::kEventLongPress,
                      MW::kEventRelease};
  for (const MW::EventCode code : codes) {
    if (button != nullptr) offer(*button, pointerEvent(code, kInside));
  }
  EXPECT_NE(calls.find('*'), std::string::npos) << "was called";
}

INSTANTIATE_TEST_SUITE_P(
    Changes, ButtonChange,
    testing::Combine(testing::Values(ChangeCase{"Deletes",
                                                [](int) {
                                                  calls += '*';
                                                  button.reset();
                                                }},
                                     ChangeCase{"Hides",
                                                [](int) {
                                                  calls += '*';
                                                  button->hide();
                                                }},
                                     ChangeCase{"Unregisters",
                                                [](int) {
                                                  calls += '*';
                                                  Window::unregisterWidget(button.get());
                                                }},
                                     ChangeCase{"ForgetsCallbacks",
                                                [](int) {
                                                  calls += '*';
                                                  button->pressCallback = button->clickCallback =
                                                      nullptr;
                                                  button->longPressCallback = nullptr;
                                                  button->doubleClickCallback = nullptr;
                                                }}),
                     testing::Values(WordCase{"Press", &MW::Widget::pressCallback},
                                     WordCase{"Click", &MW::Widget::clickCallback},
                                     WordCase{"LongPress", &MW::Widget::longPressCallback},
                                     WordCase{"DoubleClick", &MW::Widget::doubleClickCallback})),
    [](const auto& row) {
      return std::string(std::get<0>(row.param).name) + "From" + std::get<1>(row.param).name;
    });

TEST_F(ButtonTest, ADeletedButtonIsNotTouchedAgain) {
  button->clickCallback = [](int) { button.reset(); };
  press(*button, kInside);
  EXPECT_TRUE(release(*button, kInside));
  EXPECT_EQ(platform().takeLog(), logLines(kDebug, {kPressedLog, kReleasedLog}));
  EXPECT_EQ(layerSize(1), 0);
}

}  // namespace
