// The built-in dialogs, and on one of them the touches of a frame with two buttons.

#include <MW/dialog.h>

#include "dialogs/dialog_catalogue.h"
#include "dialogs/dialog_plays.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::Dialog;
using DialogTest = WidgetTest;

std::unique_ptr<MW::Widget> prompt() {
  auto made = makes<Dialog>(Dialog::kLeaveFailedTest)();
  made->button2Callback = [](int) { note(stage.widget->isActive() ? "too early" : "button2"); };
  return made;
}
Step lookAtStars() {
  return look([](MW::Widget& widget) { return shown(widget).back().text.text; });
}

const PlaysOn kPrompt = {prompt};
const PlaysOn kBadGyro = {makes<Dialog>(Dialog::kBadGyroValue)};
const PlaysOn kHookKey = {makes<Dialog>(Dialog::kPushHookKey)};
const PlaysOn kStars = {makes<Dialog>(Dialog::kDoNotTouch)};
const PlayTests kPlays = {
    kPrompt(
        "TheLeftButtonAnswersAndStaysUp",
        {finger(2), press(154, 1400), lookAtHold(), lookAtFaces(), release(714, 1619), lookAtLog()},
        "press+ <held 3> <lit 1> button1 click+ <[DIALOG] btn1 released!!>"),
    kPrompt("TheRightButtonHidesFirst",
            {press(1285, 1619), lookAtFaces(), release(), lookAtFaces(), lookAtLog(), lookAtHold()},
            "press+ <lit 1> button2 click+ <lit 0> <[DIALOG] btn2 released!!> <held 0>"),
    kPrompt("BesideTheButtonsNothingAnswers",
            {moveTo(300, 1500), press(720, 1500), release(), longPress(300, 1500), appEvent(1)},
            "hover- press- click+ - -"),
    kPrompt("AFingerThatSlidesOffTakesTheHighlightAlong",
            {press(300, 1500), moveTo(301, 1500), lookAtFaces(), moveTo(720, 1500), lookAtFaces(),
             release(), release(300, 1500)},
            "press+ hover+ <lit 1> hover+ <lit 0> click+ button1 click+"),
    kPrompt("InTheDarkNothingAnswersUntilItIsHidden",
            {press(300, 1500), lcdOn(0), moveTo(720, 1500), lookAtFaces(), press(300, 1500),
             release(), hide(), press()},
            "press+ hover+ <lit 0> press- click+ press+"),
    kBadGyro("OneWideButtonMayAnswerAsBothAtTheRight",
             {press(900, 1530), release(), release(300, 1530), keyDown(323)},
             "press+ button1 button2 click+ button1 click+ +"),
    kHookKey("OnlyKeysAnswerWithoutButtons",
             {press(900, 1530), release(), keyDown(323), keyDown(274), plug(17), lookAtLog()},
             "press- click+ hook+ down274+ plug17+ <[DIALOG] key onPlugKey sym = 17>"),
    kStars("RepeatedKeysAreCountedAndDelayTheNextStar",
           {later(101), lookAtStars(), later(100), keyUp(5), keyUp(5), keyUp(5), later(100),
            lookAtStars(), later(1), lookAtStars()},
           "<*> up5+ twice5 up5+ thrice5 up5+ <*> <**>"),
};

TEST_F(DialogTest, StarsStartAnewAfterTen) {
  Dialog dialog(Dialog::kDoNotTouch);
  for (const int stars : {1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 1}) {
    platform().ticks += 101;
    EXPECT_EQ(std::ssize(shown(dialog).back().text.text), stars);
  }
  dialog.updateProgress(platform().ticks += 101);
  EXPECT_EQ(platform().takeDrawings().back().text.text, "**");
}

// A character for each kind from 0 to 40, of which 22 and 40 are none: the number of its layout,
// and the buttons that answer (both, the left one, none).
TEST_F(DialogTest, EachKindHasItsLayoutAndItsButtons) {
  std::string layouts;
  std::string touches;
  for (int kind = 0; kind <= 40; ++kind) {
    layouts += std::to_string(Dialog::isType(kind));
    touches += "nlb"[static_cast<int>(MW::catalogueEntry(kind).buttons.touches)];
  }
  EXPECT_EQ(layouts, "00001140111102340004000560444444400444700");
  EXPECT_EQ(touches, "bbbbbbbbbbbbbnnlbbblbbblbblllllllbblllnbb");
}

TEST_F(DialogTest, OtherNumbersAreEmptyDialogs) {
  for (const int kind : {INT_MIN, -1, 22, 40, INT_MAX}) {
    Dialog dialog(kind);
    EXPECT_EQ(words(shown(dialog)), "||||") << kind;
  }
}

struct Open : Dialog {
  using Dialog::Dialog;
  using Dialog::message;
  using Dialog::second;
};

TEST_F(DialogTest, AKindWithoutASecondLineTakesTheLastOne) {
  const Dialog twoLines(Dialog::kReinsertEarjack);
  const Open dialog(Dialog::kCalibrateGyro);
  EXPECT_STREQ(dialog.second.text, "If you want to test earjack.");
  EXPECT_EQ(dialog.second.size, 69) << "the kind's letters are those of its message alone";
}

TEST_F(DialogTest, IsLaidOutAnewWithItsTexts) {
  Open dialog(Dialog::kLeaveFailedTest);
  dialog.setDesc("No");
  dialog.setRect(Dialog::kReinsertEarjack);
  EXPECT_EQ(shown(dialog).at(6).text.text, "No");
  EXPECT_EQ(shown(dialog).at(6).rect, (SKIA_Rect{154, 1290, 1132, 69, 0}));
  EXPECT_STREQ(dialog.message.text, "No you want to exit?") << "the record keeps the old tail";
  const auto backdrop = [&] { return shown(dialog).front().rect.color; };
  const unsigned int plain = backdrop();
  dialog.setRect(Dialog::kDoNotTouch);
  EXPECT_EQ(backdrop(), plain) << "it is no alarm";
}

}  // namespace
