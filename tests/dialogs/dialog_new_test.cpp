#include <MW/dialog_new.h>

#include "dialogs/dialog_plays.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::DialogNew;
using DialogNewTest = WidgetTest;

const PlaysOn kDialog = {makes<DialogNew>("Title", 5, 7)};
const PlayTests kPlays = {
    kDialog("AProgressRowAnswersNoTouch",
            {call(&MW::Widget::setbutton, "1", "2"), press(722, 1400), release(), lookAtLog(),
             call<DialogNew>(&DialogNew::setProgress, 0U), press(), release()},
            "press+ button2 click+ <[DIALOGNEW] btn2 released!!> press- click+"),
    kDialog("AButtonThatWentAwayAnswersNoTouch",
            {call(&MW::Widget::setbutton, "1", "2"), call(&MW::Widget::setbutton, "1", nullptr),
             press(1285, 1500), release()},
            "press+ button1 click+"),
    kDialog("OnlyTheHookKeyIsIgnored", {keyDown(323), keyDown(5), keyUp(323)}, "+ down5+ up323+"),
};

TEST_F(DialogNewTest, TextsEndAtTheFirstNull) {
  DialogNew dialog(kTooLong.c_str(), 5, 7);
  dialog.setDesc("a", nullptr, "c");
  dialog.setbutton(nullptr, "X");
  EXPECT_EQ(words(shown(dialog)), kTooLong.substr(1) + "|a|");
  EXPECT_EQ(shown(dialog).at(5).text, (DrawnText{kTooLong.substr(1), 7, 5, 70}));
}

TEST_F(DialogNewTest, InitStartsOverWithOneStar) {
  DialogNew dialog("Title", 5, 7);
  for (const char* const stars : {"*", "**", "*"}) {
    dialog.updateProgress(platform().ticks += 101);
    EXPECT_EQ(platform().takeDrawings().back().text.text, stars);
    if (std::string_view(stars) == "**") dialog.DialogNew_init();
  }
}

TEST_F(DialogNewTest, TheBodyBlinks) {
  DialogNew dialog("Title", 5, 7);
  dialog.setBlink(1, 9);
  dialog.show(1);
  platform().takeDrawings();
  dialog.show(5000);
  EXPECT_EQ(platform().takeDrawings().at(3).rect.color, 9U);
}

TEST_F(DialogNewTest, TheBodyChangesItsColourWithTheNextLayout) {
  DialogNew dialog("Title", 5, 7);
  dialog.setDescBlink(0);
  dialog.setDescColor(9);
  EXPECT_EQ(shown(dialog).at(3).rect.color, MW::kColorBlack);
  dialog.setProgress(0);
  EXPECT_EQ(shown(dialog).at(3).rect.color, 9U);
}

struct Open : DialogNew {
  using DialogNew::buttonMode;
  using DialogNew::descLast;
  using DialogNew::DialogNew;
};

TEST_F(DialogNewTest, NumbersThatNoSetterGivesDrawNothing) {
  Open dialog("Title", 5, 7);
  for (const auto& [last, mode] : {Spot{3, 2}, {-1, -1}, {INT_MIN, 5}, {INT_MAX, 13}}) {
    dialog.descLast = last;
    dialog.buttonMode = mode;
    dialog.setRect();
    EXPECT_EQ(words(shown(dialog)), "Title|") << last;
  }
}

}  // namespace
