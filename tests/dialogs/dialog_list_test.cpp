#include <MW/dialog_list.h>

#include "dialogs/dialog_plays.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::DialogList;
using DialogListTest = WidgetTest;

const PlaysOn kList = {threeRows};
const PlaysOn kWithoutCancel = {without(&MW::Widget::button1Callback, threeRows)};
const PlayTests kPlays = {
    kList(
        "CancelMarksTheConfirmedRowAndOkConfirmsTheMarkedOne",
        {press(172, 1384), release(), press(154, 1514), release(), lookAtLog(), press(172, 1384),
         release(), press(725, 1514), release(), lookAtLog(), release(154, 1514)},
        "press r2+ click+ press+ c1 click+ <[DIALOGLIST] btn1-CANCEL released!!> press r2+ click+ "
        "press+ hidden o2 click+ <[DIALOGLIST] btn2-OK released!!> hidden c2 click+"),
    kWithoutCancel("CancelThatNobodyHearsLeavesTheMark",
                   {press(172, 1384), release(), release(154, 1514), release(725, 1514)},
                   "press r2+ click+ click+ hidden o2 click+"),
    kList("ARowsEdgesLieOutside",
          {press(171, 1078), lookAtHold(), release(), lookAtHold(), press(1270, 1176), lookAtLog(),
           release(), press(1271, 1176)},
          "press+ <held 1> click+ <held 0> press r0+ "
          "<[DIALOGLIST] position2index= [1270,1176], index = 0> click+ press+"),
    kList("WhatWasPressedLocksTheRest",
          {press(172, 1078), release(725, 1514), press(), release(154, 1514), press(),
           press(172, 1384), release(725, 1514)},
          "press r0+ click+ press+ click+ press+ press- click+"),
    kList("OtherFingersAreKeptOut",
          {finger(1), press(172, 1384), finger(0), press(), drag(1, 0), release(), finger(1),
           drag(1, 0), release()},
          "press r2+ - - - hover+ click+"),
    kList("InTheDarkNothingAnswers",
          {lcdOn(0), press(172, 1384), release(), lcdOn(1), press(), lcdOn(0), drag(1, 0)},
          "press- click+ press r2+ hover-"),
};

TEST_F(DialogListTest, IsLaidOutAnew) {
  const auto list = threeRows();
  setScreen(1920, 1080);
  static_cast<DialogList&>(*list).setRect_static(3, 1);
  EXPECT_EQ(shown(*list), shown(*threeRows()));
}

TEST_F(DialogListTest, TakesTheReleaseThatDeletesIt) {
  EXPECT_EQ(played(threeRows, {release(725, 1514)}, 1), "hidden o1+");
}

TEST_F(DialogListTest, RefusesRowsThatAreTooLongTooManyOrLate) {
  DialogList dialog(nullptr);
  EXPECT_EQ(dialog.addIndex(nullptr), -1);
  EXPECT_EQ(dialog.addIndex(kTooLong.c_str() + 1), -1);
  for (const int row : {0, 1, 2, 3, 4, 5, 6, 7, -1}) EXPECT_EQ(dialog.addIndex("row"), row);
  dialog.setText(8, "no row");
  EXPECT_TRUE(shown(dialog).empty()) << "not finished";
  dialog.initIndex();
  EXPECT_EQ(dialog.initFinish(0), 0);
  EXPECT_EQ(dialog.addIndex("late"), -1);
}

struct Open : DialogList {
  using DialogList::DialogList;
  using DialogList::rows;
};

TEST_F(DialogListTest, ReplacesTheTextOfARow) {
  Open dialog("Title");
  EXPECT_EQ(dialog.addIndex("first"), 0);
  dialog.setText(0, kTooLong.c_str() + 2);
  for (const int row : {-1, 1, 2, INT_MAX}) dialog.setText(row, "nowhere");
  for (const int start : {1, 128}) dialog.setText(0, kTooLong.c_str() + start);
  dialog.initFinish(0);
  EXPECT_EQ(words(shown(dialog)), "Title|" + kTooLong.substr(2) + "|CANCEL|OK|");
  EXPECT_STREQ(dialog.rows[2].text.text, "");
  EXPECT_STREQ(dialog.rows[1].text.text, "nowhere") << "behind the last one it is kept unseen";
  EXPECT_EQ(places({shown(dialog).at(8)}), "2,2 96x96|") << "a mark, though there is no layout";
}

}  // namespace
