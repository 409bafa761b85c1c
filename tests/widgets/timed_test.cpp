#include <MW/timed.h>

#include "support/play.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using ToastboxPlays = PlayTest;
using ProgressbarPlays = PlayTest;
using MW::Widget;

constexpr SKIA_Rect kArea = {10, 20, 503, 101, 0};
const SKIA_Text kCaption = textRecord("Wi-Fi");
const Maker kToast = makes<MW::Toastbox>(&kArea, &kCaption, &kCaption);
const Maker kBar = makes<MW::Progressbar>(0, &kArea, &kCaption);

// The last text that is drawn, and "!" where the timer pass before asked for it; "gone" once the
// widget is inactive.
Step seen() {
  return look([](Widget& widget) {
    MW::isDisplayUpdate(0);
    widget.updateTimer(platform().ticks);
    const std::string asked = MW::isDisplayUpdate(0) == 1 ? "!" : "";
    const std::vector<Drawing> drawn = shown(widget);
    if (!drawn.empty()) return asked + drawn.back().text.text;
    return asked + (widget.isActive() ? "nothing" : "gone");
  });
}
Step showFor(int ms) { return call(&Widget::onHideTimer, ms); }
Step runFor(int ms) { return call(&Widget::onProgressbar, ms); }

const std::vector<Play> kToasts = {
    {"GoesWithoutATime", kToast, {seen()}, "<gone>"},
    {"GoesAfterItsTime",
     kToast,
     {showFor(500), lookAtRedraw(), seen(), later(500), seen(), later(1), seen(), seen()},
     "<redraw> <Wi-Fi> <Wi-Fi> <!gone> <gone>"},
    {"TakesANewTime",
     kToast,
     {showFor(500), later(499), showFor(500), later(500), seen()},
     "<Wi-Fi>"},
    {"MayHaveNoTimeAtAll", kToast, {showFor(0), later(1), seen()}, "<!gone>"},
    {"GoesAtOnceAtTheWrap", kToast, {at(~255U), showFor(512), later(1), seen()}, "<!gone>"},
    {"ShowsItsMessageBelow",
     kToast,
     {call(&Widget::setMsg, "below"), showFor(1), seen(), call(&Widget::setText, "above"), seen()},
     "<below> <below>"},
    {"OfOneLineHasNoMessage",
     makes<MW::Toastbox>(&kArea, &kCaption),
     {call(&Widget::setMsg, "below"), showFor(1), seen(), call(&Widget::setText, "new"), seen()},
     "<Wi-Fi> <new>"},
};
TEST_P(ToastboxPlays, TellTheirJournal) { expectJournal(GetParam()); }
INSTANTIATE_TEST_SUITE_P(, ToastboxPlays, testing::ValuesIn(kToasts), kRowName);

const std::vector<Play> kBars = {
    {"ShowsNothingBeforeItRuns", kBar, {seen()}, "<nothing>"},
    {"GrowsEveryHundredMillisecondsAndStartsAnew",
     kBar,
     {runFor(5000), seen(),     later(100), seen(),     later(1),   seen(),     later(101),
      seen(),       later(101), seen(),     later(101), seen(),     later(101), seen(),
      later(101),   seen(),     later(101), seen(),     later(101), seen(),     later(101),
      seen(),       later(101), seen(),     later(101), seen()},
     "<!*> <*> <!**> <!***> <!****> <!*****> <!******> <!*******> <!********> <!*********> <!*> "
     "<!*> <!**>"},
    {"EndsAfterItsTime",
     kBar,
     {runFor(50), seen(), later(50), seen(), later(1), seen(), seen()},
     "<!*> <*> <!gone> <gone>"},
    {"IsTakenAway",
     kBar,
     {runFor(50), seen(), runFor(0), seen(), runFor(9), seen()},
     "<!*> <gone> <!*>"},
};
TEST_P(ProgressbarPlays, TellTheirJournal) { expectJournal(GetParam()); }
INSTANTIATE_TEST_SUITE_P(, ProgressbarPlays, testing::ValuesIn(kBars), kRowName);

TEST(ToastboxTest, AnOddHeightLosesItsLastPixel) {
  MW::Toastbox toast(&kArea, &kCaption, &kCaption);
  toast.onHideTimer(1);
  const std::vector<Drawing> drawn = shown(toast);
  EXPECT_EQ(drawn.at(0).rect, (SKIA_Rect{10, 20, 503, 100, 0}));
  EXPECT_EQ(drawn.at(1).rect, (SKIA_Rect{10, 20, 503, 50, 0}));
  EXPECT_EQ(drawn.at(2).rect, (SKIA_Rect{10, 70, 503, 50, 0}));
}

}  // namespace
