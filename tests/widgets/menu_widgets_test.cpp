// What the widgets of a test menu make of input, what they bear (callbacks that delete them,
// screens and records that nobody has), and what they draw as far as it depends on the screen or a
// text.

#include <MW/MW.h>

#include <algorithm>
#include <array>
#include <cstring>

#include "support/script.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::Widget;
using MenuWidgetTest = WidgetTest;

constexpr SKIA_Rect kArea = {10, 20, 503, 100, 0};  // a slide's knob moves from 10 to 310
const SKIA_Text kCaption = textRecord("Wi-Fi");

Made list(const char* title, int height) {
  auto made = std::make_unique<MW::MainList>(title);
  for (const int kind : {1, 1, 2}) made->addIndex(kind, &kCaption, height);
  made->initFinish();
  made->pressCallback = [](auto* mouse, auto*) { tellTouch<'p'>(mouse); };
  made->clickCallback = [](auto* mouse, auto*) { tellTouch<'c'>(mouse); };
  made->releaseCallback = [](auto* mouse, auto*) { tellTouch<'r'>(mouse); };
  made->scrollCallback = [](auto* mouse, auto*) { tellTouch<'s'>(mouse); };
  made->keyPressCallback = [](auto* key, auto*) { tellKey<'k'>(key); };
  made->keyReleaseCallback = [](auto* key, auto*) { tellKey<'r'>(key); };
  return made;
}

enum Class { Button, Screen, Slide, Plain, Key, Toast, Bar, Fill, List };

// `variant`: the number that its constructor takes, or its button type.
Made make(Class which, int variant, const SKIA_Rect& area, const SKIA_Text& text) {
  switch (which) {
    case Button: return std::make_unique<MW::Button3>(variant, &text, &text, area.y);
    case Screen: return std::make_unique<MW::Screen>();
    case Slide: return std::make_unique<MW::Slide>(variant, &area, &text, &text);
    case Plain: return std::make_unique<MW::SlideV>(variant, &area, &text, &text);
    case Key: return std::make_unique<MW::Key>();
    case Toast: return std::make_unique<MW::Toastbox>(&area, &text, &text);
    case Bar: return std::make_unique<MW::Progressbar>(variant, &area, &text);
    case Fill: return std::make_unique<MW::FullScreen>(variant);
    case List: break;
  }
  return list(text.text, area.h);
}

constexpr auto kInput = std::to_array<ScriptCase>({
    {Screen, 4, "f2 p-5,9000 m1,2 l3,4 f7 r5,6 k5 K5 u17", "p+h+l+c+---"},
    {Screen, 2, "p1,1 m2,2 r l", "p-h-c-l-"},
    {Screen, 0, "t1000 p500,500 t1100 r p60,2500 r p r g",
     " p+ c+p+cd+p+c+[BUTTON] onTouchClickCount!! 3"},
    {Screen, 0, "t1000 p500,500 r p t1500 r p r p r", " p+c+p+ c+p+c+p+cd+"},
    {Screen, 0, "t1000 p500,500 r475,524 p r t2000 p500,500 r474,500 p r", " p+c+p+cd+ p+c+p+c+"},
    {Screen, 0, "t1000 p500,500 r500,525 p r t2000 p50,50 r p r", " p+c+p+c+ p+c+p+cd+"},
    {Screen, 0, "t1000 p49,50 r p r t2000 p50,49 r p r", " p+c+p+c+ p+c+p+c+"},
    {Screen, 0, "t1000 p1390,2510 r p r t2000 p1391,2510 r p r", " p+c+p+cd+ p+c+p+c+"},
    {Slide, 0, "p209,79 ? m298 ? m1 ? m1", "+<1/0/10>+<1/0/308>R+<0/0/310>-"},
    {Slide, 1, "p310,20 m-299 ? m-1 ?", "++<1/0/11>L+<0/0/10>"},
    {Slide, 2, "p10,20 m199 ? m1 ?", "++<1/0/209>R+<0/0/310>"},
    {Slide, 3, "p310,20 m-199 ? m-1 ?", "++<1/0/111>L+<0/0/10>"},
    {Slide, 3, "p310,20 m-2147483648 ? p10,20 m2147483647 ?", "+L+<0/0/10>+R+<0/0/310>"},
    {Slide, 5, "p10,20 m-50 m20 ? m400 ?", "+++<1/0/30>+<1/0/309>"},
    {Slide, 0, "p210,20 m5 f1 p209,79 f0 m50 r15,25 f1 m50 ? l r999,999 ?",
     "--+--+<2/0/60>-+<0/0/10>"},
    {Slide, 1, "p315,25 m-100 h ? f1 p900,900 ? p g", "++<1/0/210>+<0/0/310>-[SLIDE] pressed!!: 0"},
    {Slide, 0, "L t1000 p15,25 m299 ? t1499 r15,25 p t1998 r p r", " ++<1/0/10> ++ d+++"},
    {Slide, 0, "L t1000 p15,25 r999,25 p15,25 r p t1500 r p r", " +++++ +++"},
    {Key, 0, "p1,2 m5,5 r3,4 l5,6 k10 K11 a12 u13", "p--c-l+10k+11r+++"},
    {Key, 0, "t1000 K5 t1999 K5 t2998 K5 K5 t3998 K5 K5 K6 K5",
     " 5r+ 5D5r+ 5T5r+5r+ 5r+5D5r+6r+5r+"},
    {Key, 0, "t-16 K5 t-8 K5 t10 K5 K65535 K65535", " 5r+ 5r+ 5D5r+65535r+65535D65535r+"},
    {Key, 0, "t1000 u2 t1100 d t1101 d t9000 d u5 d", " +  2u 5u+"},
    {Key, 0, "t1000 u17 t1050 u18 u5 t1150 d t1151 d", " + ++  2u"},
    {Key, 0, "t1000 u5 t9000 d u2 u5 t9999 d", " + +5u+ "},
    {Bar, 0,
     "* t1000 B1111 * n100 * n1 * n101 * n101 * n101 * n101 * n101 * n101 * n101 * n101 * n101 * "
     "n101 * n1 * B0 * B9 *",
     "? !11!2!3!4!5!6!7!8!9!1!1!2!--!1"},
    {Toast, 0, "* t1000 H500 * t1500 * t1501 * * H0 t1502 *", "- !5 5 !-- !-"},
    {Toast, 0, "t-256 H512 t-255 *", "  !-"},  // at the wrap it goes at once, and does not stay
    {List, 0, "t1 p9,500 m14,-28 m14,0 r9,500 t2 p9,500 m0,28 m0,1 r9,500", " p+++cr+ p+++r+"},
    {List, 0, "t1 p9,500 m-28,0 m-1,0 r9,500 t2 p9,500 m0,29 m0,-29 r9,500", " p+++r+ p+++r+"},
    {List, 0, "t1 p9,341 r9,439 t2 p9,340 r t3 p9,440 r t4 p9,500 r9,400 t5 p9,600 r",
     " p+cr+ p+r+ p+r+ p+r+ p+r+"},
    {List, 0, "f2 p9,339 p9,340 ? f1 p9,400 m0,5 r f2 l k5 K5 r9,10 ?",
     "-p+<3/0/0>----5k+5r+r+<0/0/0>"},
    {List, 0, "p9,400 g o1 ? o0 ?",
     "p+[MAINLIST] position2index= 0340 < 0400 > 0440<1/0/0><0/0/0>"},
});

TEST_F(MenuWidgetTest, IsToldAndAnsweredAndAnyCallbackMayDeleteTheWidget) {
  for (const ScriptCase& row : kInput) {
    expectTold(row, [&row] {
      widget = make(static_cast<Class>(row.which), row.variant, kArea, kCaption);
      widget->setActive(1);
      widget->setButtonType(row.variant);
      hear(*widget);
      if (row.which == Slide) widget->doubleClickCallback = tellTouch<'d'>;
    });
  }
}

// Screens that no machine has: 0 is the default size, the others are taken as they are.
constexpr auto kHostileSizes = {0, 1, 7, -1, -1080, INT_MIN, INT_MAX};

// Sets, shows and touches a widget on such a screen; says how many of its texts fill their record.
std::ptrdiff_t longTexts(Class which, int w, int h) {
  SKIA_Text endless = {};
  std::ranges::fill(endless.text, 'x');
  endless.string_len = endless.size = INT_MAX;
  const SKIA_Rect area = {w, h, w, h, 0};
  setScreen(w, h);
  widget = make(which, 24, area, endless);
  widget->onHideTimer(1);
  widget->onProgressbar(1);
  widget->setRect(2, nullptr);
  widget->setMsg(std::string(300, 'x').c_str());
  widget->setText(std::string(300, 'x').c_str());
  const auto isLong = [](const Drawing& each) { return each.text.text == std::string(127, 'x'); };
  const auto found = std::ranges::count_if(shown(*widget), isLong);
  play("p9,2147483647 m-2147483648,2147483647 m2147483647,-2147483648 d r0,0 l k5 K5 u2 a1 d");
  widget->setMsg(nullptr);
  widget->setText(nullptr);
  return found;
}

TEST_F(MenuWidgetTest, TakesAnyScreenAndRecord) {
  using std::pair;
  for (const auto& [which, texts] :
       {pair(Button, 2), pair(Screen, 0), pair(Slide, 2), pair(Plain, 2), pair(Key, 0),
        pair(Toast, 2), pair(Bar, 1), pair(Fill, 0), pair(List, 1)}) {
    SCOPED_TRACE(which);
    widget = make(which, 1, kArea, kCaption);
    EXPECT_EQ(layerSize(which == Fill ? 0 : 1), 1);
    EXPECT_EQ(widget->isActive(), which == Key);
    EXPECT_FALSE(widget->onRecvEvent(nullptr, 0));
    for (const int w : kHostileSizes) {
      for (const int h : kHostileSizes) EXPECT_EQ(longTexts(which, w, h), texts) << w << ' ' << h;
    }
    widget.reset();
  }
  MW::Slide slide(0, nullptr, nullptr, nullptr);
  MW::Toastbox toast(nullptr, nullptr, nullptr);
  MW::Progressbar bar(0, nullptr, nullptr);
  MW::Button3 button(3, nullptr, nullptr, 0);
  for (Widget* const each : std::initializer_list<Widget*>{&slide, &toast, &bar, &button}) {
    each->onHideTimer(1);
    each->onProgressbar(1);
    EXPECT_EQ(shown(*each).front().rect.w, 0) << "nothing was given";
  }
}

// Three columns and three rows of squares.
struct Grid {
  int w, h, side;
  std::array<int, 3> left, top;
};
constexpr auto kGrids = std::to_array<Grid>({{1440, 2560, 441, {28, 497, 966}, {28, 1060, 2091}},
                                             {1080, 1920, 331, {21, 373, 725}, {21, 795, 1568}},
                                             {720, 1280, 220, {14, 248, 482}, {14, 530, 1046}},
                                             {2560, 1440, 785, {51, 887, 1723}, {51, 328, 604}},
                                             {1081, 1921, 331, {21, 373, 725}, {21, 795, 1569}}});
constexpr std::array kPositions = {10, 12, 11, 7, 9, 8, 1, 5, 2};  // row by row

TEST_F(MenuWidgetTest, VerdictButtonsStandByTheirPositions) {
  for (const auto& [w, h, side, left, top] : kGrids) {
    setScreen(w, h);
    for (std::size_t i = 0; i < kPositions.size(); ++i) {
      MW::Button3 button(kPositions.at(i), nullptr, 100);
      button.setRect(6, nullptr);                        // no position: it stays
      const int y = top.at(i / 3) - (i >= 6 ? 100 : 0);  // room below the last row alone
      EXPECT_EQ(shown(button).front().rect, (SKIA_Rect{left.at(i % 3), y, side, side, 0xFFFFFFFF}));
    }
  }
}

// The new length goes to the button box's own text, which stays empty.
TEST_F(MenuWidgetTest, VerdictButtonsKeepTheLengthOfTheirCaption) {
  const std::string gap(3, '\0');
  MW::Button3 button(1);
  const auto drawn = [&button](const char* given) {
    button.setText(given);
    EXPECT_EQ(shown(button).at(0).text.text,
              std::string(given == nullptr ? 0 : strlen(given), '\0'));
    return shown(button).at(1).text.text;
  };
  EXPECT_EQ(shown(button).at(1).text.text, "PASS");
  EXPECT_EQ(drawn("RETRY"), "RETR");
  EXPECT_EQ(drawn("OK"), "OK" + gap.substr(1));
  EXPECT_EQ(drawn("a\u00e4\u00f6"), "a\u00e4" + gap.substr(2)) << "whole characters";
  EXPECT_EQ(drawn(nullptr), gap + '\0');
  EXPECT_EQ(drawn("FAIL"), "FAIL");
  EXPECT_EQ(drawn(button.getText()), "FAIL");
}

// A slide's second caption has its record's length, but only as many bytes as its size says.
TEST_F(MenuWidgetTest, SlidesCutTheirSecondCaptionByItsSize) {
  for (const int size : {INT_MIN, 0, 3, 6, 80}) {
    const SKIA_Text caption = textRecord("LOCKED", 0, 0, size);
    MW::Slide slide(0, &kArea, nullptr, &caption);
    std::string expected(6, '\0');
    std::copy_n("LOCKED", std::clamp(size, 0, 6), expected.begin());
    EXPECT_EQ(shown(slide).at(5).text.text, expected);
  }
}

TEST_F(MenuWidgetTest, FilledScreensAreGreyBehindFourColors) {
  MW::FullScreen fill(3);
  EXPECT_EQ(shown(fill).front().rect, (SKIA_Rect{0, 0, 1441, 2561, 0xFF0000FF}));
  for (const int number : {4, -1, INT_MIN}) {
    fill.setRect(number);
    EXPECT_EQ(shown(fill).front().rect.color, 0xFFBFBFBF);
  }
}

}  // namespace
