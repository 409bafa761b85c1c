// The dialogs that the application fills: where they stand, what they make of input, and what they
// take as texts.

#include <MW/MW.h>

#include <array>

#include "support/script.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using DialogsTest = WidgetTest;

enum Class { New, List, Shell, Slide };

void tellRow(int* row) {  // NOLINT(readability-non-const-parameter): a callback's type
  told += std::to_string(*row);
  note(widget->isActive() ? '=' : '.');
}

// `size`: of lines and buttons (3: a progress row), of rows, of lines; the slide's kind.
void make(int which, int size) {
  if (which == Slide) hold<MW::DialogSlide>(size);
  if (which == Shell) hold<MW::DialogShell>("Title", size).addShell("one");
  if (which == New) {
    auto& dialog = hold<MW::DialogNew>("Title", 5, 7);
    dialog.setDesc("a", size > 1 ? "b" : nullptr, "c");
    dialog.setbutton("1", size > 1 ? "2" : nullptr);
    if (size > 2) dialog.setProgress(0);
  }
  if (which == List) {
    auto& dialog = hold<MW::DialogList>("Title");
    while (dialog.addIndex("row") < size - 1) continue;
    dialog.initFinish(1);
    dialog.rowPressCallback = dialog.button1Callback = dialog.button2Callback = tellRow;
  }
}

struct Place {
  Class which;
  int size, w, h, letters;  // of the first text in the body
  const char* places;       // frame, and the body's parts without borders
};

constexpr auto kPlaces = std::to_array<Place>({
    {New, 2, 1440, 2560, 57,
     "144,935 1152x690|159,1180 1122x57|159,1251 1122x57|159,1322 1122x57|149,1400 568x220|"
     "722,1400 568x220|"},
    {New, 1, 1920, 1080, 56, "528,282 864x516|571,497 778x85|533,631 854x162|"},
    {List, 2, 1440, 2560, 75,
     "144,897 1152x766|171,1154 100x100|321,1154 950x100|171,1307 100x100|321,1307 950x100|"
     "173,1309 96x96|154,1438 561x220|725,1438 561x220|"},
    {List, 2, 1920, 1080, 75,
     "528,254 864x572|536,434 100x100|686,434 662x100|536,548 100x100|686,548 662x100|"
     "538,550 96x96|538,659 417x162|965,659 417x162|"},
    {Shell, 3, 1440, 2560, 277, "144,561 1152x1438|170,792 1100x325|154,1774 1132x220|0,0 0x0|"},
    {Shell, 26, 1920, 1080, 24, "528,5 864x1069|554,178 812x28|538,907 844x162|0,0 0x0|"},
    {Slide, 3, 1440, 2560, 70,
     "144,935 1152x690|154,1175 1132x210|145,1396 380x228|907,1396 380x228|526,1396 380x228|"},
    {Slide, 2, 1920, 1080, 70,
     "528,282 864x516|538,464 844x152|529,627 284x170|1099,627 284x170|814,627 284x170|"},
});

TEST_F(DialogsTest, StandInTheMiddleOfTheirScreens) {
  for (const Place& row : kPlaces) {
    setScreen(row.w, row.h);
    make(row.which, row.size);
    std::vector<Drawing> all = shown(*widget);
    all.erase(all.begin() + 2, all.begin() + 6);
    all.erase(all.begin());
    std::erase_if(all, [](const Drawing& each) { return each.call == Call::RoundBox; });
    EXPECT_EQ(places(all), row.places);
    EXPECT_EQ(all.at(row.which == List ? 2 : 1).text.size, row.letters);
  }
  widget.reset();
}

constexpr auto kInput = std::to_array<ScriptCase>({
    {New, 2, "f2 p149,1400 ? r716,1619 ? g", "p+<3/1/722>1c+<3/0/722>[DIALOGNEW] btn1 released!!"},
    {New, 2, "p719,1400 p149,1400 m150 ? m719 ? r722,1400 ? g o0 p r h p",
     "p-p+h+<1/1/722>h+<1/0/722>2c+<0/0/722>[DIALOGNEW] btn2 released!!p-c+p+"},
    {New, 3, "p722,1400 r p149,1400 r k323 k5 K5 u17 l1,1 a1", "p-c+p-c++5k+5r+17u+--"},
    {Shell, 3, "f1 p154,1774 ? f0 p m r1285,1993 ? g k323 K5 u17 f1 p0,0",
     "p+<2/1/0>--1c+<2/0/0>[DIALOGSHELL] btn1 released!!323k+5r+-p-"},
    {List, 3, "p171,1078 ? r p172,1078 ? r p1270,1176 r p1271,1176 g",
     "p+<1/1/725>c+p0=+<1/1/725>c+p0=+c+p+[DIALOGLIST] position2index= [1270,1176], index = 0"},
    {List, 3, "f1 p172,1384 f0 p m r f1 m r f0 o0 p m r k323 K5 u5 o1 p172,1384 o0 m",
     "p2=+---h+c+p-h-c+323k+5r+-p2=+h-"},
    {List, 3, "p172,1078 r725,1514 p r154,1514 p r725,1514", "p0=+c+p+c+p+c+"},
    {List, 3, "p172,1384 r p154,1514 ? r g p172,1384 r p725,1514 r g p154,1514 r",
     "p2=+c+p+<1/2/725>1=c+[DIALOGLIST] btn1-CANCEL released!!p2=+c+p+2.c+[DIALOGLIST] btn2-OK "
     "released!!p+2.c+"},
    {Slide, 3, "p905,1623 m-380 ? m-1 ? m-2147483648 r ? g",
     "p+h+<1/0/146>h+<1/0/145>h+cL+<0/0/526>[DIALOGSLIDE] Left Slide"},
    {Slide, 4, "p525,1396 p906,1396 p526,1395 m5 r", "p-p-p-h-c-"},
    {Slide, 4, "p526,1396 m389 ? m-1 r p526,1396 r", "p+h+<1/0/915>h+c+p+c+"},
    {Slide, 5, "p526,1396 m2147483647 r p526,1396 r k5 K323 u5 l5", "p+h+cR+p+cR+5k+323r+--"},
    {Slide, 3, "p526,1396 f1 m9 p526,1396 f0 m9 r f1 m9 ? g o0 m9 r ? h p526,1396",
     "p+h-p+h-c-h+<2/0/535>[DIALOGSLIDE] onSlidePressed!!: 2h-c-<2/0/535>p+"},
});

TEST_F(DialogsTest, AreToldAndAnswerAndAnyCallbackMayDeleteThem) {
  for (const ScriptCase& row : kInput) {
    expectTold(row, [&row] { make(row.which, row.variant); });
  }
}

const std::string kLong(128, 'x');

TEST_F(DialogsTest, NewAndSlideTakeTexts) {
  MW::DialogNew dialog(kLong.c_str(), 5, 7);
  dialog.setDesc("a", nullptr, "c");
  dialog.setbutton(nullptr, "X");
  dialog.setDescColor(9);
  dialog.setDescBlink(0);
  EXPECT_EQ(words(shown(dialog)), kLong.substr(1) + "|a|");
  EXPECT_EQ(shown(dialog).at(5).text, (DrawnText{kLong.substr(1), 7, 5, 70}));
  EXPECT_EQ(shown(dialog).at(3).rect.color, MW::kColorBlack) << "until the next layout";
  dialog.setBackGroundColor(8);
  dialog.setDesc(nullptr, "b", "c", 2);
  EXPECT_EQ(shown(dialog).at(3).rect.color + shown(dialog).at(0).rect.color, 9U + 8U);
  EXPECT_EQ(words(shown(dialog)), kLong.substr(1) + '|');
  MW::DialogSlide slide(4);
  EXPECT_EQ(words(shown(slide)), "Warning|Test already pass. Try again?|CANCEL|OK|<AAT>|");
  slide.setTitle(kLong.c_str());
  slide.setDesc(kLong.c_str() + 1);
  EXPECT_EQ(words(shown(slide)), '|' + kLong.substr(1) + "|CANCEL|OK|<AAT>|");
}

TEST_F(DialogsTest, ListTakesEightShortRows) {
  MW::DialogList dialog(nullptr);
  EXPECT_EQ(dialog.addIndex(nullptr) + dialog.addIndex(kLong.c_str() + 1), -2);
  EXPECT_EQ(dialog.addIndex(kLong.c_str() + 2), 0);
  EXPECT_EQ(shown(dialog).size(), 0U) << "not finished";
  EXPECT_EQ(dialog.initFinish(0), 1);
  EXPECT_EQ(places({shown(dialog).at(8)}), "2,2 96x96|") << "a mark, though there is no layout";
  EXPECT_EQ(dialog.addIndex("late"), -1);
  dialog.initIndex();
  for (const int row : {0, 1, 2, 3, 4, 5, 6, 7, -1}) EXPECT_EQ(dialog.addIndex("row"), row);
  for (const int row : {-1, 8, INT_MAX}) dialog.setText(row, "nowhere");
  for (const char* const bad : {kLong.c_str() + 1, kLong.c_str() + 128}) dialog.setText(7, bad);
  EXPECT_EQ(dialog.initFinish(MW::DialogList::kNoRow), 8);
  EXPECT_EQ(words(shown(dialog)), "|row|row|row|row|row|row|row|row|CANCEL|OK|");
}

TEST_F(DialogsTest, ShellDropsItsOldestLine) {
  for (const auto& [given, room] : {Spot{0, 1}, {2, 2}, {26, 25}}) {
    MW::DialogShell dialog("Title", given);
    std::string left = "Title|";
    for (int i = 0; i < room + 2; ++i) {
      const std::string line = i == 2 ? "" : std::to_string(i);
      EXPECT_EQ(dialog.addShell(line.c_str()), i % room);
      if (i > 2) left += line + '|';
    }
    EXPECT_EQ(dialog.addShell(kLong.c_str() + 1) + dialog.addShell(nullptr), -2);
    EXPECT_EQ(words(shown(dialog)), left + "OK|CANCEL|");
  }
}

}  // namespace
