#include <MW/timed.h>

#include "support/drawings.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::Progressbar;
using MW::Toastbox;

constexpr unsigned int kFill = 0xFF112233;
constexpr SKIA_Rect kArea = {10, 20, 300, 101, kFill};
const SKIA_Text kLine = textRecord("Saved", 0xFFFFFFFF, 5, 40);
const SKIA_Text kMessage = textRecord("to the disk", 0xFF00FF00, 1, 30);
const DrawnText kLineDrawn = {"Saved", 0xFFFFFFFF, 5, 40};
const std::string kLong(300, 'x');

using ToastboxTest = WidgetTest;

TEST_F(ToastboxTest, GoesAwayWhereNoTimeWasSet) {
  Toastbox toast(&kArea, &kLine);
  toast.setActive(1);
  platform().ticks = 1;
  EXPECT_TRUE(shown(toast).empty());
  EXPECT_FALSE(toast.isActive());
}

TEST_F(ToastboxTest, OneLineStandsOnItsBox) {
  Toastbox toast(&kArea, &kLine);
  toast.onHideTimer(500);
  EXPECT_TRUE(toast.isActive());
  EXPECT_EQ(MW::isDisplayUpdate(0), 1);
  EXPECT_EQ(shown(toast), (std::vector{textbox({10, 20, 300, 100, kFill}, kLineDrawn)}));
  toast.setMsg("no place for it");
  toast.setText("Gone");
  EXPECT_EQ(shown(toast),
            (std::vector{textbox({10, 20, 300, 100, kFill}, {"Gone", 0xFFFFFFFF, 5, 40})}));
}

TEST_F(ToastboxTest, TwoLinesDivideTheBox) {
  Toastbox toast(&kArea, &kLine, &kMessage);
  toast.onHideTimer(500);
  EXPECT_EQ(shown(toast),
            (std::vector{box({10, 20, 300, 100, kFill}), label({10, 20, 300, 50, 0}, kLineDrawn),
                         label({10, 70, 300, 50, 0}, {"to the disk", 0xFF00FF00, 1, 30})}));
  toast.setText(kLong.c_str());
  toast.setMsg(nullptr);
  EXPECT_EQ(shown(toast).at(1).text.text, std::string(127, 'x'));
  EXPECT_EQ(shown(toast).at(2).text.text, "");
}

struct ToastCase : Row {
  unsigned int start;
  int ms;
  unsigned int at;
  bool drawn, asks;  // in a drawing pass, and for one, at that time
};

class ToastTime : public ToastboxTest, public testing::WithParamInterface<ToastCase> {};

TEST_P(ToastTime, GoesByTheClock) {
  Toastbox toast(&kArea, &kLine);
  platform().ticks = GetParam().start;
  toast.onHideTimer(1);
  toast.onHideTimer(GetParam().ms);
  MW::isDisplayUpdate(0);
  platform().ticks = GetParam().at;
  toast.updateTimer(GetParam().at);
  EXPECT_EQ(MW::isDisplayUpdate(0), GetParam().asks ? 1 : 0);
  EXPECT_EQ(shown(toast).size(), GetParam().drawn ? 1U : 0U);
  EXPECT_EQ(toast.isActive(), GetParam().drawn);
  if (GetParam().drawn) return;
  toast.updateTimer(0xFFFFFFFF);
  EXPECT_EQ(MW::isDisplayUpdate(0), 0) << "its time is over for good";
}

INSTANTIATE_TEST_SUITE_P(
    Times, ToastTime,
    testing::Values(ToastCase{{"Runs"}, 1000, 500, 1499, true, false},
                    ToastCase{{"LastMoment"}, 1000, 500, 1500, true, false},
                    ToastCase{{"Over"}, 1000, 500, 1501, false, true},
                    ToastCase{{"NoTimeAtAll"}, 1000, 0, 1001, false, true},
                    ToastCase{{"Negative"}, 1000, -1, 1000, false, true},
                    // At the wrap it goes at once, and does not stay.
                    ToastCase{{"AcrossTheWrap"}, 0xFFFFFF00, 512, 0xFFFFFF01, false, true}),
    rowName);

TEST_F(ToastboxTest, TakesAnyRecord) {
  Toastbox empty(nullptr, nullptr, nullptr);
  empty.onHideTimer(1);
  EXPECT_EQ(shown(empty), (std::vector{box({}), label({}, {}), label({}, {})}));
  const SKIA_Text endless = endlessText('x');
  const SKIA_Rect huge = {INT_MAX, INT_MAX, INT_MAX, INT_MAX, 1};
  Toastbox toast(&huge, &endless, &endless);
  toast.onHideTimer(1);
  EXPECT_EQ(shown(toast).at(2).rect, (SKIA_Rect{INT_MAX, INT_MAX, INT_MAX, 1073741823, 0}));
  EXPECT_EQ(shown(toast).at(2).text.text, std::string(127, 'x'));
  const SKIA_Rect negative = {INT_MIN, INT_MIN, INT_MIN, INT_MIN, 1};
  toast.setRect(2, &negative);
  toast.setRect(2, nullptr);
  EXPECT_EQ(shown(toast).at(0).rect, negative);
  EXPECT_EQ(shown(toast).at(2).rect.y, INT_MIN);
}

using ProgressbarTest = WidgetTest;

std::vector<Drawing> barWith(const std::string& stars) {
  return {box({10, 20, 296, 202, 0xFF4F4F4F}), box({12, 22, 0, 198, kFill}),
          textbox({10, 20, 300, 101, 0}, kLineDrawn),
          textbox({10, 121, 300, 101, 0}, {stars, 0xFFFFFFFF, 5, 40})};
}

TEST_F(ProgressbarTest, GrowsFromTheFirstPassOn) {
  Progressbar bar(99, &kArea, &kLine);
  EXPECT_TRUE(shown(bar).empty());
  platform().ticks = 1000;
  platform().takeLog();
  bar.onProgressbar(5000);
  EXPECT_TRUE(bar.isActive());
  EXPECT_FALSE(press(bar, {11, 21}));
  const auto rows = {1, 2, 3, 4, 5, 6, 7, 8, 9, 1, 1, 2};
  std::vector<std::string> log;
  for (const int stars : rows) {
    EXPECT_EQ(shown(bar), barWith(std::string(static_cast<std::size_t>(stars), '*')));
    log.push_back("[PROGRESSBAR] show Star " + std::to_string(log.size() + 1));
    platform().ticks += 100;
    EXPECT_EQ(shown(bar).back().text.text.size(), static_cast<std::size_t>(stars));
    platform().ticks += 1;
  }
  EXPECT_EQ(platform().takeLog(), logLines(kDebug, log));
}

TEST_F(ProgressbarTest, AsksForPassesThatChangeIt) {
  Progressbar bar(0, &kArea, &kLine);
  const auto asks = [&bar](unsigned int now) {
    bar.updateTimer(now);
    return MW::isDisplayUpdate(0) == 1;
  };
  EXPECT_FALSE(asks(5000));
  platform().ticks = 1000;
  bar.onProgressbar(5000);
  EXPECT_TRUE(asks(1000)) << "the first one";
  shown(bar);
  EXPECT_FALSE(asks(1100));
  EXPECT_TRUE(asks(1101));
  platform().ticks = 5950;
  shown(bar);
  EXPECT_FALSE(asks(6000));
  EXPECT_TRUE(asks(6001)) << "over";
}

TEST_F(ProgressbarTest, EndsByTimeOrWord) {
  Progressbar bar(0, &kArea, &kLine);
  platform().ticks = 1000;
  bar.onProgressbar(500);
  platform().ticks = 1500;
  EXPECT_FALSE(shown(bar).empty());
  platform().ticks = 1501;
  EXPECT_TRUE(shown(bar).empty());
  EXPECT_FALSE(bar.isActive());
  bar.onProgressbar(500);
  EXPECT_EQ(shown(bar), barWith("*")) << "from the beginning";
  bar.onProgressbar(0);
  EXPECT_FALSE(bar.isActive());
  EXPECT_TRUE(shown(bar).empty());
  bar.onProgressbar(-1);
  EXPECT_TRUE(bar.isActive());
  EXPECT_TRUE(shown(bar).empty()) << "it had ended a millisecond ago";
}

TEST_F(ProgressbarTest, TakesAnyRecord) {
  const SKIA_Text endless = endlessText('x');
  const SKIA_Rect huge = {INT_MAX, INT_MAX, INT_MIN, INT_MAX, 1};
  Progressbar bar(0, &huge, &endless);
  bar.onProgressbar(10);
  std::vector<Drawing> drawn = shown(bar);
  ASSERT_EQ(drawn.size(), 4U);
  EXPECT_EQ(drawn.at(0).rect, (SKIA_Rect{INT_MAX, INT_MAX, INT_MIN, INT_MAX, 0xFF4F4F4F}));
  EXPECT_EQ(drawn.at(2).text.text, std::string(127, 'x'));
  bar.setRect(0, nullptr);
  EXPECT_EQ(shown(bar).at(3).rect.y, INT_MAX);
  Progressbar empty(0, nullptr, nullptr);
  empty.onProgressbar(10);
  EXPECT_EQ(shown(empty).at(3), textbox({}, {"*", 0xFFFFFFFF, 5, 0}));
}

}  // namespace
