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

constexpr SKIA_Rect kArea = {10, 20, 503, 100, 0};
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

constexpr auto kInput = std::to_array<ScriptCase>({
    {0, 0, "t1 p9,500 m14,-28 m14,0 r9,500 t2 p9,500 m0,28 m0,1 r9,500", " p+++cr+ p+++r+"},
    {0, 0, "t1 p9,500 m-28,0 m-1,0 r9,500 t2 p9,500 m0,29 m0,-29 r9,500", " p+++r+ p+++r+"},
    {0, 0, "t1 p9,341 r9,439 t2 p9,340 r t3 p9,440 r t4 p9,500 r9,400 t5 p9,600 r",
     " p+cr+ p+r+ p+r+ p+r+ p+r+"},
    {0, 0, "f2 p9,339 p9,340 ? f1 p9,400 m0,5 r f2 l k5 K5 r9,10 ?",
     "-p+<3/0/0>----5k+5r+r+<0/0/0>"},
    {0, 0, "p9,400 g o1 ? o0 ?", "p+[MAINLIST] position2index= 0340 < 0400 > 0440<1/0/0><0/0/0>"},
});

TEST_F(MenuWidgetTest, IsToldAndAnsweredAndAnyCallbackMayDeleteTheWidget) {
  for (const ScriptCase& row : kInput) {
    expectTold(row, [] {
      widget = list(kCaption.text, kArea.h);
      widget->setActive(1);
      hear(*widget);
    });
  }
}

// Screens that no machine has: 0 is the default size, the others are taken as they are.
constexpr auto kHostileSizes = {0, 1, 7, -1, -1080, INT_MIN, INT_MAX};

// Sets, shows and touches a widget on such a screen; says how many of its texts fill their record.
std::ptrdiff_t longTexts(int w, int h) {
  SKIA_Text endless = {};
  std::ranges::fill(endless.text, 'x');
  endless.string_len = endless.size = INT_MAX;
  const SKIA_Rect area = {w, h, w, h, 0};
  setScreen(w, h);
  widget = list(endless.text, area.h);
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
  for (const int w : kHostileSizes) {
    for (const int h : kHostileSizes) EXPECT_EQ(longTexts(w, h), 1) << w << ' ' << h;
  }
  widget.reset();
}

}  // namespace
