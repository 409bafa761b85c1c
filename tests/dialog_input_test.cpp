#include <MW/dialog.h>

#include <memory>

#include "support/drawings.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::Dialog;

constexpr unsigned int kWhite = 0xFFFFFFFF;
constexpr unsigned int kHeld = 0xFF87CEFA;

// On the default screen of 1440 x 2560.
constexpr Spot kOnLeft = {154, 1400};
constexpr Spot kOnRight = {1285, 1619};
constexpr Spot kBetween = {720, 1500};
const std::string kLong(300, 'x');

struct OpenDialog : Dialog {
  using Dialog::Dialog;
  using Dialog::message;
  using Dialog::second;
};

std::string calls;
std::unique_ptr<OpenDialog> dialog;

template <char letter>
void noteKey(MW::kbd_event* key) {
  calls += letter + std::to_string(key->code) + ' ';
}
template <char letter>
void noteTouch(MW::mouse_event* mouse) {
  calls += mouse->finger == 2 ? letter : '!';
}

class DialogInput : public WidgetTest {
 protected:
  void SetUp() override {
    WidgetTest::SetUp();
    calls.clear();
    platform().ticks = 10000;
    open(0);
  }
  void TearDown() override {
    dialog.reset();
    WidgetTest::TearDown();
  }
  static void open(int kind) {
    dialog = std::make_unique<OpenDialog>(kind);
    dialog->setActive(1);
    dialog->button1Callback = [](int) { calls += dialog->isActive() ? '1' : '!'; };
    dialog->button2Callback = [](int) { calls += dialog->isActive() ? '!' : '2'; };
    dialog->hookKeyCallback = [](int) { calls += 'H'; };
    dialog->pressCallback = noteTouch<'p'>;
    dialog->hoverCallback = noteTouch<'h'>;
    dialog->clickCallback = noteTouch<'c'>;
    dialog->keyPressCallback = noteKey<'k'>;
    dialog->keyReleaseCallback = noteKey<'r'>;
    dialog->doubleKeyCallback = noteKey<'D'>;
    dialog->tripleKeyCallback = noteKey<'T'>;
    dialog->plugCallback = noteKey<'u'>;
    platform().takeLog();
  }
  static unsigned int faceColor(std::size_t drawing) {
    return shown(*dialog).at(drawing).rect.color;
  }
  static unsigned int leftColor() { return faceColor(8); }
  static unsigned int rightColor() { return faceColor(10); }
};

TEST_F(DialogInput, LeftButtonAnswersAndStays) {
  EXPECT_TRUE(press(*dialog, kOnLeft, 2));
  EXPECT_EQ(dialog->isSelect(), 3);
  EXPECT_EQ(leftColor(), kHeld);
  EXPECT_TRUE(release(*dialog, kOnLeft, 2));
  EXPECT_EQ(leftColor(), kWhite);
  EXPECT_TRUE(dialog->isActive());
  EXPECT_EQ(calls, "p1c");
  EXPECT_EQ(platform().takeLog(),
            logLines(kDebug, {"[DIALOG] btn1 pressed!!", "[DIALOG] btn1 released!!"}));
}

TEST_F(DialogInput, RightButtonHidesBeforeItAnswers) {
  EXPECT_TRUE(press(*dialog, kOnRight, 2));
  EXPECT_EQ(rightColor(), kHeld);
  EXPECT_TRUE(release(*dialog, kOnRight, 2));
  EXPECT_FALSE(dialog->isActive());
  EXPECT_EQ(calls, "p2c");
  EXPECT_EQ(platform().takeLog(),
            logLines(kDebug, {"[DIALOG] btn2 pressed!!", "[DIALOG] btn2 released!!"}));
}

TEST_F(DialogInput, PressesAreTakenByButtonsAlone) {
  EXPECT_FALSE(drag(*dialog, kOnLeft, 2)) << "nothing is held";
  EXPECT_FALSE(press(*dialog, kBetween, 2));
  EXPECT_TRUE(release(*dialog, kBetween, 2));
  EXPECT_EQ(calls, "hpc");
  EXPECT_FALSE(longPress(*dialog, kOnLeft, 2));
  EXPECT_FALSE(offer(*dialog, keyEvent(MW::kEventApplication, 1)));
  EXPECT_FALSE(offer(*dialog, keyEvent(MW::kEventUnknown, 1)));
  EXPECT_FALSE(dialog->onRecvEvent(nullptr, 0));
  EXPECT_TRUE(platform().takeLog().empty());
}

TEST_F(DialogInput, SlidingOffTakesTheHighlightAway) {
  press(*dialog, kOnLeft, 2);
  EXPECT_TRUE(drag(*dialog, kOnLeft, 2));
  EXPECT_EQ(leftColor(), kHeld);
  EXPECT_TRUE(drag(*dialog, kBetween, 2));
  EXPECT_EQ(leftColor(), kWhite);
  release(*dialog, kBetween, 2);
  EXPECT_EQ(calls, "phhc");
}

TEST_F(DialogInput, ADarkScreenTakesNoTouch) {
  dialog->lcdOn(0);
  EXPECT_FALSE(press(*dialog, kOnLeft, 2));
  EXPECT_TRUE(release(*dialog, kOnLeft, 2));
  EXPECT_EQ(calls, "pc");
  EXPECT_EQ(dialog->hide(), 1);
  EXPECT_TRUE(press(*dialog, kOnLeft, 2)) << "hiding it forgets";
}

TEST_F(DialogInput, OneReleaseAnswersTwiceWhereAWideButtonHidesAnother) {
  for (const int kind : {6, 24}) {
    open(kind);
    EXPECT_TRUE(press(*dialog, kOnRight, 2));
    EXPECT_TRUE(release(*dialog, kOnRight, 2));
    EXPECT_EQ(calls, "p12c") << kind;
    calls.clear();
  }
}

TEST_F(DialogInput, TheHookKeyAnswersOneKind) {
  EXPECT_TRUE(offer(*dialog, keyEvent(MW::kEventKeyPress, 323)));
  EXPECT_EQ(calls, "");
  EXPECT_TRUE(platform().takeLog().empty());
  open(13);
  EXPECT_TRUE(offer(*dialog, keyEvent(MW::kEventKeyPress, 323)));
  EXPECT_TRUE(offer(*dialog, keyEvent(MW::kEventKeyPress, 274)));
  EXPECT_TRUE(offer(*dialog, keyEvent(MW::kEventUser, 17)));
  EXPECT_EQ(calls, "Hk274 u17 ");
  EXPECT_EQ(platform().takeLog(),
            logLines(kDebug, {"[DIALOG] Hook key pressed!!", "[DIALOG] key pressed sym = 274",
                              "[DIALOG] key onPlugKey sym = 17"}));
}

TEST_F(DialogInput, CountsReleasesOfOneKey) {
  const auto releaseAt = [](unsigned int at, unsigned int key) {
    platform().ticks = at;
    EXPECT_TRUE(offer(*dialog, keyEvent(MW::kEventKeyRelease, key)));
  };
  for (const unsigned int at : {1000U, 1999U, 2998U, 3000U}) releaseAt(at, 5);
  EXPECT_EQ(calls, "r5 D5 r5 T5 r5 r5 ");
  EXPECT_EQ(platform().takeLog().back().message, "[DIALOG] key onReleaseKey sym = 5");
  calls.clear();
  releaseAt(3100, 6);
  releaseAt(3200, 5);
  releaseAt(4200, 5);
  releaseAt(4300, 0xFFFFFFFF);
  EXPECT_EQ(platform().takeLog().back().message, "[DIALOG] key onReleaseKey sym = -1");
  EXPECT_EQ(calls, "r6 r5 r5 r4294967295 ");
}

TEST_F(DialogInput, ProgressGrowsToTenStarsAndStartsAgain) {
  open(23);
  const auto stars = [] { return shown(*dialog).back().text.text.size(); };
  platform().ticks = 100;
  EXPECT_EQ(stars(), 1U) << "no step yet";
  std::vector<std::size_t> rows;
  for (int i = 0; i < 12; ++i) {
    platform().ticks += 101;
    rows.push_back(stars());
    platform().ticks += 100;
    EXPECT_EQ(stars(), rows.back());
  }
  EXPECT_EQ(rows, (std::vector<std::size_t>{1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 1, 2}));
  offer(*dialog, keyEvent(MW::kEventKeyRelease, 5));
  platform().ticks += 100;
  EXPECT_EQ(stars(), 2U) << "a key delays it";
}

TEST_F(DialogInput, BlinksInItsBody) {
  dialog->setBlink(1, 0xFF00FF00);
  EXPECT_EQ(faceColor(3), 0xFF000000);
  platform().ticks = 10501;
  EXPECT_EQ(faceColor(3), 0xFF00FF00);
}

// All dialogs share it, and those without one of their own inherit the last one's.
TEST_F(DialogInput, TheSecondLineIsKeptFromDialogToDialog) {
  open(9);
  open(0);
  EXPECT_STREQ(dialog->second.text, "after put the phone on the 20cm JIG");
  open(21);
  open(-1);
  EXPECT_STREQ(dialog->second.text, "Are you sure to test again?");
}

TEST_F(DialogInput, NewTextsKeepTheOldTail) {
  dialog->setDesc("No");
  EXPECT_EQ(shown(*dialog).at(6).text.text, "No");
  EXPECT_STREQ(dialog->message.text, "No you want to exit?");
  dialog->setTitle(kLong.c_str());
  dialog->setDesc(nullptr);
  EXPECT_EQ(shown(*dialog).at(5).text.text, std::string(127, 'x'));
  EXPECT_EQ(shown(*dialog).at(6).text.text, "");
}

TEST_F(DialogInput, IsLaidOutAnewWithItsTexts) {
  setScreen(1080, 1920);
  dialog->setRect(13);
  EXPECT_EQ(shown(*dialog).at(1).rect, (SKIA_Rect{108, 788, 864, 344, 0xFFBFBFBF}));
  EXPECT_EQ(shown(*dialog).at(5).text.text, "Test Fail");
}

}  // namespace
