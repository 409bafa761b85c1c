#include <MW/timed.h>

#include "support/play_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::Widget;

constexpr SKIA_Rect kArea = {10, 20, 503, 101, 0};
const SKIA_Text kCaption = textRecord("Wi-Fi");
const PlaysOn kToast = {makes<MW::Toastbox>(&kArea, &kCaption)};
const PlaysOn kTwoLines = {makes<MW::Toastbox>(&kArea, &kCaption, &kCaption)};
const PlaysOn kBar = {makes<MW::Progressbar>(0, &kArea, &kCaption)};

constexpr unsigned int kMonthMs = 31U * 86'400'000;

Step showFor(int ms) { return call(&Widget::onHideTimer, ms); }
Step runFor(int ms) { return call(&Widget::onProgressbar, ms); }
Step setActive(int on) { return call(&Widget::setActive, on); }
Step setMsg(const char* words) { return call(&Widget::setMsg, words); }

// What a drawing pass writes last, with "!" if the timer pass before it asked for one; "gone" once
// the widget is inactive.
Step seen() {
  return look([](Widget& widget) {
    MW::isDisplayUpdate(0);
    widget.updateTimer(platform().ticks);
    const std::string asked = MW::isDisplayUpdate(0) == 1 ? "!" : "";
    EXPECT_EQ(widget.show(platform().ticks), 1);
    const std::vector<Drawing> drawn = platform().takeDrawings();
    if (!drawn.empty()) return asked + drawn.back().text.text;
    return asked + (widget.isActive() ? "nothing" : "gone");
  });
}
// Outside of a pass.
Step seenWithoutTime() {
  return look([](Widget& widget) {
    widget.show(0);
    return platform().takeDrawings().empty() ? "nothing" : "drawn";
  });
}
Steps stepsOfStars(int count) {
  Steps steps;
  steps.push_back(runFor(5000));
  for (int i = 0; i < count; ++i) {
    steps.push_back(seen());
    steps.push_back(later(101));
  }
  return steps;
}

const PlayTests kPlays = {
    kToast("AToastGoesWithoutATime", {seen()}, "<gone>"),
    kToast("AToastGoesAfterItsTime",
           {showFor(500), lookAtRedraw(), seen(), later(500), seen(), later(1), seen(), seen()},
           "<redraw> <Wi-Fi> <Wi-Fi> <!gone> <gone>"),
    kToast("AToastStaysOverTheWrap",
           {at(~255U), showFor(512), later(512), seen(), at(~255U), showFor(256), later(257),
            seen(), later(1), seen()},
           "<Wi-Fi> <Wi-Fi> <!gone>"),
    kToast("AToastEndsBehindTheWrapAfterALastPassBeforeIt",
           {at(~255U), showFor(100), seen(), at(9), seen()}, "<Wi-Fi> <!gone>"),
    kToast("AToastStartsWithTheClock", {at(0), showFor(5), seen(), at(5), seen(), at(6), seen()},
           "<Wi-Fi> <Wi-Fi> <!gone>"),
    kToast("AToastThatWasPutAwayForAMonthIsOver",
           {at(1000), showFor(500), setActive(0), at(1000 + kMonthMs), setActive(1), seen()},
           "<!gone>"),
    kToast("WithoutATimeAToastDoesNotEnd",
           {at(100'000), showFor(500), seenWithoutTime(), later(500), seen(), at(~0U), showFor(0),
            at(0), seenWithoutTime()},
           "<drawn> <Wi-Fi> <nothing>"),
    kBar("ABarThatWasPutAwayForAMonthIsOver",
         {at(1000), runFor(500), setActive(0), at(1000 + kMonthMs), setActive(1), seen()},
         "<!gone>"),
    kBar("ABarEndsOverTheWrap", {at(~15U), runFor(50), seen(), later(50), seen(), later(1), seen()},
         "<!*> <*> <!gone>"),
    kBar("ABarStartsWithTheClock", {at(0), runFor(50), seen(), at(50), seen(), at(51), seen()},
         "<!*> <*> <!gone>"),
    kTwoLines("AToastOfTwoLinesHasAMessage", {setMsg("below"), showFor(1), seen()}, "<below>"),
    kToast("AToastOfOneLineHasNone", {setMsg("below"), showFor(1), seen()}, "<Wi-Fi>"),
    kBar("ABarShowsNothingBeforeItRuns", {seen()}, "<nothing>"),
    kBar("ABarGrowsAndStartsAnew", stepsOfStars(12),
         "<!*> <!**> <!***> <!****> <!*****> <!******> <!*******> <!********> <!*********> <!*> "
         "<!*> <!**>"),
    kBar("ABarEndsAfterItsTime", {runFor(50), seen(), later(50), seen(), later(1), seen()},
         "<!*> <*> <!gone>"),
    kBar("ABarIsTakenAway", {runFor(50), seen(), runFor(0), seen(), runFor(9), seen()},
         "<!*> <gone> <!*>"),
};

}  // namespace
