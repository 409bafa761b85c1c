// What every widget of this room bears: records and screens that no machine has, no records at all,
// and being shown without a time.

#include <MW/MW.h>

#include <algorithm>
#include <climits>

#include "support/drawings.h"
#include "support/play.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words

enum class Untimed { Drawn, Nothing };

struct Kind : Row {
  std::unique_ptr<MW::Widget> (*make)(const SKIA_Rect* area, const SKIA_Text* text);
  std::ptrdiff_t texts;  // how many of the constructor's and the setters' texts it draws
  Untimed untimed = Untimed::Drawn;
};
class AnyRecord : public WidgetTest, public testing::WithParamInterface<Kind> {
 protected:
  void TearDown() override {
    stage.widget.reset();
    WidgetTest::TearDown();
  }
};

std::unique_ptr<MW::Widget> shownForAWhile(std::unique_ptr<MW::Widget> widget) {
  widget->onHideTimer(INT_MAX);
  widget->onProgressbar(INT_MAX);
  return widget;
}

template <typename Widget>
std::unique_ptr<MW::Widget> of(const SKIA_Rect* area, const SKIA_Text* text) {
  return std::make_unique<Widget>(area, text);
}
template <typename Widget, int number>
std::unique_ptr<MW::Widget> numbered(const SKIA_Rect* area, const SKIA_Text* text) {
  return std::make_unique<Widget>(number, area, text);
}
template <typename Widget>
std::unique_ptr<MW::Widget> sliding(const SKIA_Rect* area, const SKIA_Text* text) {
  return std::make_unique<Widget>(0, area, text, text);
}

const std::vector<Kind> kKinds = {
    {"Button", of<MW::Button>, 1},
    {"Button3",
     [](const SKIA_Rect* area, const SKIA_Text* text) -> std::unique_ptr<MW::Widget> {
       return std::make_unique<MW::Button3>(5, text, text, area != nullptr ? area->y : 0);
     },
     2},
    {"ButtonS", of<MW::ButtonS>, 1},
    {"ButtonNew", numbered<MW::ButtonNew, 2>, 1},
    {"Button8", numbered<MW::Button8, 3>, 0},
    {"Screen",
     [](auto*, auto*) -> std::unique_ptr<MW::Widget> { return std::make_unique<MW::Screen>(); }, 0},
    {"FullScreen",
     [](auto*, auto*) -> std::unique_ptr<MW::Widget> {
       return std::make_unique<MW::FullScreen>(1);
     },
     0},
    {"Slide", sliding<MW::Slide>, 2},
    {"SlideV", sliding<MW::SlideV>, 2},
    {"SlideE", sliding<MW::SlideE>, 1},
    {"SlideMove",
     [](const SKIA_Rect* area, const SKIA_Text*) -> std::unique_ptr<MW::Widget> {
       return std::make_unique<MW::SlideMove>(area, 20, 0, 100, 50);
     },
     0},
    {"Key", [](auto*, auto*) -> std::unique_ptr<MW::Widget> { return std::make_unique<MW::Key>(); },
     0},
    {"Toastbox",
     [](const SKIA_Rect* area, const SKIA_Text* text) -> std::unique_ptr<MW::Widget> {
       return std::make_unique<MW::Toastbox>(area, text, text);
     },
     2, Untimed::Nothing},
    {"Progressbar", numbered<MW::Progressbar, 0>, 1, Untimed::Nothing},
};
INSTANTIATE_TEST_SUITE_P(, AnyRecord, testing::ValuesIn(kKinds), kRowName);

const Steps kTouches = {press(9, INT_MAX),
                        drag(INT_MIN, INT_MAX),
                        drag(INT_MAX, INT_MIN),
                        draw(),
                        release(0, 0),
                        longPress(),
                        keyUp(5),
                        plug(2)};

TEST_P(AnyRecord, IsDrawnCutAndTouchedOnAnyScreen) {
  SKIA_Text endless = {};
  std::ranges::fill(endless.text, 'x');
  endless.string_len = endless.size = INT_MAX;
  const std::string longest(127, 'x');
  const auto isLongest = [&](const Drawing& each) { return each.text.text == longest; };
  for (const int w : {0, 1, 7, -1, -1080, INT_MIN, INT_MAX}) {
    for (const int h : {0, 1, 7, -1, -1080, INT_MIN, INT_MAX}) {
      setScreen(w, h);
      const SKIA_Rect area = {w, h, w, h, 0};
      played([&] { return shownForAWhile(GetParam().make(&area, &endless)); }, kTouches);
      stage.widget = shownForAWhile(GetParam().make(&area, &endless));
      stage.widget->setText(std::string(300, 'x').c_str());
      stage.widget->setMsg(std::string(300, 'x').c_str());
      EXPECT_EQ(std::ranges::count_if(shown(*stage.widget), isLongest), GetParam().texts);
    }
  }
}

// A second caption that is absent is left out.
TEST_P(AnyRecord, AnAbsentRecordIsAnEmptyOne) {
  const SKIA_Rect nowhere = {};
  const SKIA_Text nothing = {};
  std::vector<Drawing> empty = shown(*shownForAWhile(GetParam().make(&nowhere, &nothing)));
  stage.widget = shownForAWhile(GetParam().make(nullptr, nullptr));
  stage.widget->setRect(0, nullptr);
  stage.widget->setText(nullptr);
  EXPECT_FALSE(stage.widget->onRecvEvent(nullptr, 0));
  const std::vector<Drawing> absent = shown(*stage.widget);
  ASSERT_LE(absent.size(), empty.size());
  empty.resize(absent.size());
  EXPECT_EQ(absent, empty);
}

TEST_P(AnyRecord, ShownWithoutATimeItIsDrawnAsAtZero) {
  const SKIA_Rect area = {10, 20, 400, 100, 5};
  const SKIA_Text text = textRecord("text");
  stage.widget = shownForAWhile(GetParam().make(&area, &text));
  stage.widget->show();
  const std::vector<Drawing> untimed = platform().takeDrawings();
  const bool draws = GetParam().untimed == Untimed::Drawn;
  EXPECT_EQ(untimed, draws ? shown(*stage.widget) : std::vector<Drawing>());
}

}  // namespace
