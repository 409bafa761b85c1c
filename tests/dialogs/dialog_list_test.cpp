#include <MW/dialog_list.h>

#include "dialogs/dialog_plays.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::DialogList;
using DialogListTest = WidgetTest;

template <char target>
void noteRow(int* row) {  // NOLINT(readability-non-const-parameter): a callback's type
  note((stage.widget->isActive() ? "" : "hidden ") + std::string(1, target) + std::to_string(*row));
}

// Confirmed and marked is row 1.
std::unique_ptr<MW::Widget> threeRows() {
  auto made = makes<DialogList>("Title")();
  auto& list = static_cast<DialogList&>(*made);
  while (list.addIndex("row") < 2) continue;
  list.initFinish(1);
  list.rowPressCallback = noteRow<'r'>;
  list.button1Callback = noteRow<'c'>;  // CANCEL
  list.button2Callback = noteRow<'o'>;  // OK
  return made;
}
void setCancel(DialogList& list, bool isWanted) {
  list.button1Callback = isWanted ? MW::Callback(noteRow<'c'>) : nullptr;
}

const PlaysOn kList = {threeRows};
const auto kPlays = std::to_array<Play>({
    kList(
        "OkHidesAndConfirmsTheMarkedRow",
        {press(172, 1384), release(), press(725, 1514), release(), lookAtLog(), release(154, 1514)},
        "press r2+ click+ press+ hidden o2 click+ <[DIALOGLIST] btn2-OK released!!> "
        "hidden c2 click+"),
    kList(
        "CancelMarksTheConfirmedRow",
        {press(172, 1384), release(), press(154, 1514), release(), lookAtLog(), release(725, 1514)},
        "press r2+ click+ press+ c1 click+ <[DIALOGLIST] btn1-CANCEL released!!> "
        "hidden o1 click+"),
    kList("CancelThatNobodyHearsLeavesTheMark",
          {call<DialogList>(setCancel, false), press(172, 1384), release(), release(154, 1514),
           release(725, 1514)},
          "press r2+ click+ click+ hidden o2 click+"),
    kList("ARowsEdgesLieOutside",
          {press(171, 1078), lookAtHold(), release(), lookAtHold(), press(1270, 1176), lookAtLog(),
           release(), press(1271, 1176)},
          "press+ <held 1> click+ <held 0> press r0+ "
          "<[DIALOGLIST] position2index= [1270,1176], index = 0> click+ press+"),
    kList("WhatWasPressedLocksTheRest",
          {press(172, 1078), release(725, 1514), press(), release(154, 1514), press(),
           release(725, 1514)},
          "press r0+ click+ press+ click+ press+ click+"),
    kList("OtherFingersAreKeptOut",
          {finger(1), press(172, 1384), finger(0), press(), drag(1, 0), release(), finger(1),
           drag(1, 0), release()},
          "press r2+ - - - hover+ click+"),
    kList("InTheDarkNothingAnswers",
          {lcdOn(0), press(172, 1384), drag(1, 0), release(), lcdOn(1), press(), lcdOn(0),
           drag(1, 0)},
          "press- hover- click+ press r2+ hover-"),
});
using DialogListPlays = PlayTest;
TEST_P(DialogListPlays, TellTheirJournal) { expectJournal(GetParam()); }
INSTANTIATE_TEST_SUITE_P(, DialogListPlays, testing::ValuesIn(kPlays), kRowName);

TEST_F(DialogListTest, RefusesRowsThatAreTooLongTooManyOrLate) {
  DialogList dialog(nullptr);
  EXPECT_EQ(dialog.addIndex(nullptr), -1);
  EXPECT_EQ(dialog.addIndex(kTooLong.c_str() + 1), -1);
  for (const int row : {0, 1, 2, 3, 4, 5, 6, 7, -1}) EXPECT_EQ(dialog.addIndex("row"), row);
  EXPECT_TRUE(shown(dialog).empty()) << "not finished";
  dialog.initIndex();
  EXPECT_EQ(dialog.addIndex("row"), 0);
  EXPECT_EQ(dialog.initFinish(0), 1);
  EXPECT_EQ(dialog.addIndex("late"), -1);
}

TEST_F(DialogListTest, ReplacesTheTextOfARowAndOfTheNextOne) {
  DialogList dialog("Title");
  dialog.setText(0, "next");
  EXPECT_EQ(dialog.addIndex("first"), 0);
  dialog.setText(0, kTooLong.c_str() + 2);
  for (const int row : {-1, 2, INT_MAX}) dialog.setText(row, "nowhere");
  for (const int start : {1, 128}) dialog.setText(0, kTooLong.c_str() + start);
  dialog.initFinish(0);
  EXPECT_EQ(words(shown(dialog)), "Title|" + kTooLong.substr(2) + "|CANCEL|OK|");
  EXPECT_EQ(places({shown(dialog).at(8)}), "2,2 96x96|") << "a mark, though there is no layout";
}

}  // namespace
