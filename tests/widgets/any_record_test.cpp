// What every widget of this room bears: screens and records that no machine has, no records at all,
// and being shown without a time.

#include <MW/MW.h>

#include <algorithm>
#include <climits>

#include <brimol3_widget_test/drawings.h>
#include "support/play_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words

using Made = std::unique_ptr<MW::Widget>;
using Area = const SKIA_Rect*;
using Text = const SKIA_Text*;

struct Kind : Row {
  Made (*construct)(Area area, Text text);
  std::ptrdiff_t texts;  // that it draws of those that it was given
  bool isDrawnUntimed = true;

  Made make(Area area, Text text) const {
    auto made = construct(area, text);
    made->onHideTimer(INT_MAX);
    made->onProgressbar(INT_MAX);
    return made;
  }
};
class AnyRecord : public WidgetTest, public testing::WithParamInterface<Kind> {};

template <typename Widget, typename... Arguments>
Made make(Arguments... arguments) {
  return std::make_unique<Widget>(arguments...);
}
int bottomOf(Area area) { return area != nullptr ? area->y : 0; }

const std::vector<Kind> kKinds = {
    {"Label", make<MW::Label>, 1},
    {"Textbox", make<MW::Textbox>, 1},
    {"Image", make<MW::Image>, 1},
    {"Box", [](Area a, Text) { return make<MW::Box>(a); }, 0},
    {"Line", [](Area, Text) { return make<MW::Line>(nullptr); }, 0},
    {"Button", make<MW::Button>, 1},
    {"Button3", [](Area a, Text t) { return make<MW::Button3>(5, t, t, bottomOf(a)); }, 2},
    {"ButtonS", make<MW::ButtonS>, 1},
    {"ButtonNew", [](Area a, Text t) { return make<MW::ButtonNew>(2, a, t); }, 1},
    {"Button8", [](Area a, Text t) { return make<MW::Button8>(5, a, t); }, 0},
    {"Screen", [](Area, Text) { return make<MW::Screen>(); }, 0},
    {"FullScreen", [](Area, Text) { return make<MW::FullScreen>(1); }, 0},
    {"Slide", [](Area a, Text t) { return make<MW::Slide>(0, a, t, t); }, 2},
    {"SlideV", [](Area a, Text t) { return make<MW::SlideV>(0, a, t, t); }, 2},
    {"SlideE", [](Area a, Text t) { return make<MW::SlideE>(0, a, t, t); }, 1},
    {"SlideMove", [](Area a, Text) { return make<MW::SlideMove>(a, 20, 0, 100, 50); }, 0},
    {"Key", [](Area, Text) { return make<MW::Key>(); }, 0},
    {"Toastbox", [](Area a, Text t) { return make<MW::Toastbox>(a, t, t); }, 2, false},
    {"Progressbar", [](Area a, Text t) { return make<MW::Progressbar>(0, a, t); }, 1, false},
};
INSTANTIATE_TEST_SUITE_P(, AnyRecord, testing::ValuesIn(kKinds), kRowName);

const std::string kLongest(127, 'x');
constexpr auto kHostile = {0, 1, 7, -1, -1080, INT_MIN, INT_MAX};

const Steps kTouches = {press(9, INT_MAX),
                        drag(INT_MIN, INT_MAX),
                        drag(INT_MAX, INT_MIN),
                        draw(),
                        release(0, 0),
                        longPress(),
                        keyUp(5),
                        plug(2)};

// Touches a widget of such an area, and says how many of its texts fill their record.
std::ptrdiff_t longTexts(const Kind& kind, const SKIA_Rect& area) {
  SKIA_Text endless = {};
  std::ranges::fill(endless.text, 'x');
  endless.string_len = endless.size = INT_MAX;
  played([&] { return kind.make(&area, &endless); }, kTouches);
  const Made made = kind.make(&area, &endless);
  made->setText(std::string(300, 'x').c_str());
  made->setMsg(std::string(300, 'x').c_str());
  const auto isLongest = [](const Drawing& each) { return each.text.text == kLongest; };
  return std::ranges::count_if(shown(*made), isLongest);
}

TEST_P(AnyRecord, IsDrawnCutAndTouchedOnAnyScreen) {
  for (const int w : kHostile) {
    for (const int h : kHostile) {
      setScreen(w, h);
      EXPECT_EQ(longTexts(GetParam(), {w, h, w, h, 0}), GetParam().texts);
    }
  }
}

TEST_P(AnyRecord, WithoutRecordsItIsShownWithoutATimeAsAtZero) {
  const Made made = GetParam().make(nullptr, nullptr);
  made->setRect(0, nullptr);
  made->setText(nullptr);
  made->show();
  const std::vector<Drawing> untimed = platform().takeDrawings();
  EXPECT_EQ(untimed, GetParam().isDrawnUntimed ? shown(*made) : std::vector<Drawing>());
}

}  // namespace
