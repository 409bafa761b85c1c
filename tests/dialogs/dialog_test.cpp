#include <MW/dialog.h>

#include "dialogs/dialog_plays.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::Dialog;
using DialogTest = WidgetTest;

Step lookAtStars() {
  return look([](MW::Widget& widget) { return shown(widget).back().text.text; });
}

std::unique_ptr<MW::Widget> deletedByItsDoubleKey() {
  auto made = makes<Dialog>(Dialog::kLeaveTest)();
  made->doubleKeyCallback = [](MW::kbd_event* key) {
    stage.widget.reset();
    note("record" + std::to_string(key->code));
  };
  return made;
}

const auto kPlays = std::to_array<Play>({
    {"ABadGyroValueAnswersAsBothButtonsAtTheRight",
     makes<Dialog>(Dialog::kBadGyroValue),
     {press(900, 1530), release(), release(300, 1530)},
     "press+ button1 button2 click+ button1 click+"},
    {"WithoutButtonsNothingAnswers",
     makes<Dialog>(Dialog::kWaitVoiceTest),
     {press(900, 1530), release(), keyDown(323)},
     "press- click+ +"},
    {"TheHookKeyAnswersItsKind",
     makes<Dialog>(Dialog::kPushHookKey),
     {keyDown(323), lookAtLog(), keyDown(274), plug(17), lookAtLog()},
     "hook+ <[DIALOG] Hook key pressed!!> down274+ plug17+ <[DIALOG] key onPlugKey sym = 17>"},
    {"RepeatedKeysAreCounted",
     makes<Dialog>(Dialog::kLeaveTest),
     {keyUp(5), later(999), keyUp(5), keyUp(5), keyUp(5), keyUp(6), keyUp(5)},
     "up5+ twice5 up5+ thrice5 up5+ up5+ up6+ up5+"},
    {"ARecordOutlivesItsDialog", deletedByItsDoubleKey, {keyUp(5), keyUp(5)}, "up5+ record5+"},
    {"AKeyDelaysTheNextStar",
     makes<Dialog>(Dialog::kDoNotTouch),
     {lookAtStars(), later(101), lookAtStars(), later(100), keyUp(5), later(100), lookAtStars(),
      later(1), lookAtStars()},
     "<*> <**> up5+ <**> <***>"},
});
using DialogPlays = PlayTest;
TEST_P(DialogPlays, TellTheirJournal) { expectJournal(GetParam()); }
INSTANTIATE_TEST_SUITE_P(, DialogPlays, testing::ValuesIn(kPlays), kRowName);

TEST_F(DialogTest, StarsStartAnewAfterTen) {
  Dialog dialog(Dialog::kDoNotTouch);
  std::string counts;
  for (unsigned int pass = 1; pass <= 11; ++pass) {
    platform().ticks = pass * 101;
    counts += std::to_string(shown(dialog).back().text.text.size()) + ' ';
  }
  EXPECT_EQ(counts, "1 2 3 4 5 6 7 8 9 10 1 ");
}

struct Open : Dialog {
  using Dialog::Dialog;
  using Dialog::message;
  using Dialog::second;
};

TEST_F(DialogTest, AKindWithoutASecondLineTakesTheLastOne) {
  const Dialog twoLines(Dialog::kReinsertEarjack);
  EXPECT_STREQ(Open(Dialog::kLeaveTest).second.text, "If you want to test earjack.");
}

TEST_F(DialogTest, IsLaidOutAnewWithItsTexts) {
  Open dialog(Dialog::kLeaveFailedTest);
  dialog.setDesc("No");
  dialog.setRect(Dialog::kReinsertEarjack);
  EXPECT_EQ(shown(dialog).at(6).text.text, "No");
  EXPECT_EQ(shown(dialog).at(6).rect, (SKIA_Rect{154, 1290, 1132, 69, 0}));
  EXPECT_STREQ(dialog.message.text, "No you want to exit?") << "the record keeps the old tail";
}

}  // namespace
