#include <MW/event_service.h>
#include <MW/window.h>

#include <cmath>
#include <limits>
#include <memory>
#include <utility>

#include "support/widget_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::Window;

using WindowTest = WidgetTest;

// The count that the last line tells; the count goes on from test to test.
int toldCount(const std::vector<LogLine>& lines) {
  const std::string& last = lines.back().message;
  return std::stoi(last.substr(last.find('=') + 1));
}

TEST_F(WindowTest, NumbersWidgetsByTheLayersSize) {
  ProbeWidget first;
  ProbeWidget second;
  ProbeWidget third;
  ProbeWidget fourth;
  ProbeWidget dialog(0);
  for (ProbeWidget* each : {&first, &second, &third}) {
    EXPECT_EQ(Window::registerWidget(each), 1);
    EXPECT_FALSE(each->isActive());
  }
  EXPECT_EQ(third.id(), 3);
  Window::registerWidget(&dialog);
  EXPECT_EQ(dialog.id(), 1) << "layers are numbered apart";
  EXPECT_EQ(Window::unregisterWidget(&second), 1);
  Window::registerWidget(&fourth);
  EXPECT_EQ(fourth.id(), 3);
}

TEST_F(WindowTest, UnregisteringRemovesTheFirstOfEqualIds) {
  std::string drawn;
  const JournalWidget a(drawn, 'a');
  JournalWidget b(drawn, 'b');
  const JournalWidget c(drawn, 'c');
  Window::unregisterWidget(&b);
  JournalWidget d(drawn, 'd');
  ASSERT_EQ(c.id(), d.id());
  Window::unregisterWidget(&d);
  Window::show(1);
  EXPECT_EQ(drawn, "ad") << "c left in place of d";
}

TEST_F(WindowTest, AWidgetCanStandInALayerTwice) {
  std::string drawn;
  {
    JournalWidget twice(drawn, 'a');
    Window::registerWidget(&twice);
    EXPECT_EQ(twice.id(), 2);
    Window::show(1);
    EXPECT_EQ(drawn, "aa");
    Window::unregisterWidget(&twice);
    Window::show(1);
    EXPECT_EQ(drawn, "aaa");
    Window::registerWidget(&twice);
  }
  Window::show(1);
  EXPECT_EQ(drawn, "aaa") << "its destructor took every entry out";
}

TEST_F(WindowTest, LogsAndCountsRegistrations) {
  ProbeWidget widget;
  ProbeWidget stranger;
  Window::registerWidget(&widget);
  const std::vector<LogLine> entered = platform().takeLog();
  ASSERT_EQ(entered.size(), 2U);
  EXPECT_EQ(entered[0], logLines(kWarning, {"[WINDOW] registerWidget: type=1"})[0]);
  const int count = toldCount(entered);
  EXPECT_EQ(entered[1],
            logLines(kDebug, {"[WINDOW] registerWidget: num_widget=" + std::to_string(count)})[0]);
  stranger.setId(99);
  Window::unregisterWidget(&stranger);
  EXPECT_EQ(platform().takeLog(), logLines(kDebug, {"[WINDOW] unregisterWidget: num_widget=" +
                                                    std::to_string(count - 1)}));
  EXPECT_EQ(layerSize(1), 1) << "counted down though nothing left";
}

TEST_F(WindowTest, RefusesWhatIsNoLayersWidget) {
  for (const int type : {-1, 2, 3, std::numeric_limits<int>::min()}) {
    ProbeWidget widget(type);
    EXPECT_EQ(Window::registerWidget(&widget), 1);
    EXPECT_EQ(widget.id(), 0);
    EXPECT_EQ(Window::unregisterWidget(&widget), 1);
  }
  EXPECT_EQ(Window::registerWidget(nullptr), 1);
  EXPECT_EQ(Window::unregisterWidget(nullptr), 1);
}

// A widget whose type changes while it is registered is still found when it ends.
TEST_F(WindowTest, AWidgetLeavesTheLayerThatItEntered) {
  ProbeWidget widget(1);
  Window::registerWidget(&widget);
  widget.setType(0);
}

TEST_F(WindowTest, DrawsAndTimesTheBaseLayerFirst) {
  std::string calls;
  const JournalWidget dialog(calls, 'D', 0);
  JournalWidget a(calls, 'a');
  JournalWidget hidden(calls, 'h');
  const JournalWidget b(calls, 'b');
  hidden.setActive(0);
  Window::show(5);
  EXPECT_EQ(calls, "abD");
  calls.clear();
  Window::updateTimer(5);
  EXPECT_EQ(calls, "abD");
}

TEST_F(WindowTest, PassesTellTheTime) {
  std::vector<unsigned int> told;
  ProbeWidget widget;
  widget.onShow = [&](unsigned int ticks) { told.push_back(ticks); };
  widget.onTimer = widget.onShow;
  widget.setActive(1);
  Window::registerWidget(&widget);
  platform().ticks = 70;
  Window::show(5);
  Window::show();
  Window::updateTimer(5);
  EXPECT_EQ(told, (std::vector<unsigned int>{5, 70, 70})) << "the timer pass reads the clock";
}

using Widgets = std::vector<std::unique_ptr<JournalWidget>>;

void unregisterFirst(Widgets& all, std::string&) { Window::unregisterWidget(all[0].get()); }
void unregisterSecond(Widgets& all, std::string&) { Window::unregisterWidget(all[1].get()); }
void deleteSecond(Widgets& all, std::string&) { all[1].reset(); }
void deleteAllBehind(Widgets& all, std::string&) { all.resize(1); }
void drawOnceMore(Widgets&, std::string&) { Window::show(1); }

void addMany(Widgets& all, std::string& calls) {
  for (int i = 0; i < 40; ++i) all.push_back(std::make_unique<JournalWidget>(calls, 'n'));
}

void moveSecondToTheEnd(Widgets& all, std::string&) {
  Window::unregisterWidget(all[1].get());
  Window::registerWidget(all[1].get());
}

// What is done to a layer of three widgets a, b, c while a is drawn.
struct ChangeCase : Row {
  void (*change)(Widgets&, std::string& calls);
  std::string first, next;  // calls of this pass and of the next
};

class WindowChange : public WidgetTest, public testing::WithParamInterface<ChangeCase> {};

TEST_P(WindowChange, DuringAPassSkipsAndRepeatsNothing) {
  std::string calls;
  Widgets widgets;
  for (const char name : {'a', 'b', 'c'}) {
    widgets.push_back(std::make_unique<JournalWidget>(calls, name));
  }
  bool changed = false;
  widgets[0]->onShow = [&](unsigned int) {
    calls += 'a';
    if (!std::exchange(changed, true)) GetParam().change(widgets, calls);
  };
  Window::show(1);
  EXPECT_EQ(calls, GetParam().first);
  calls.clear();
  Window::show(2);
  EXPECT_EQ(calls, GetParam().next);
}

INSTANTIATE_TEST_SUITE_P(
    Changes, WindowChange,
    testing::Values(ChangeCase{"UnregistersTheNext", unregisterSecond, "ac", "ac"},
                    ChangeCase{"DeletesTheNext", deleteSecond, "ac", "ac"},
                    ChangeCase{"UnregistersItself", unregisterFirst, "abc", "bc"},
                    ChangeCase{"DeletesAllBehind", deleteAllBehind, "a", "a"},
                    ChangeCase{"AddsMany", addMany, "abc", "abc" + std::string(40, 'n')},
                    ChangeCase{"MovesTheNextToTheEnd", moveSecondToTheEnd, "ac", "acb"},
                    ChangeCase{"DrawsOnceMore", drawOnceMore, "aabcbc", "abc"}),
    kRowName);

TEST_F(WindowTest, KnowsADefaultSize) {
  int width = 0;
  int height = 0;
  Window::height = 77;
  EXPECT_EQ(Window::getwindowsize(&width, &height), 1);
  EXPECT_EQ(width, 1440);
  EXPECT_EQ(height, 2560);
  Window::width = 720;
  Window::getwindowsize(&width, nullptr);
  Window::getwindowsize(nullptr, &height);
  EXPECT_EQ(width, 720);
  EXPECT_EQ(height, 2560) << "kept";
}

constexpr float kInf = std::numeric_limits<float>::infinity();
constexpr float kNan = std::numeric_limits<float>::quiet_NaN();
constexpr int kIntMax = std::numeric_limits<int>::max();
constexpr int kIntMin = std::numeric_limits<int>::min();

struct MuraCase : Row {
  float dpi, mm, kept;
  int pixels;
};

class WindowMura : public WidgetTest, public testing::WithParamInterface<MuraCase> {};

TEST_P(WindowMura, TurnsMillimetresIntoPixels) {
  const MuraCase& row = GetParam();
  platform().xdpi = row.dpi;
  platform().ydpi = 300.7F;
  float x = 0;
  float y = 0;
  EXPECT_EQ(Window::getMura(&x, &y, row.mm), row.pixels);
  EXPECT_FLOAT_EQ(y, 300.7F);
  EXPECT_FLOAT_EQ(Window::ydpi, 300.7F) << "only the horizontal density is rounded";
  if (std::isnan(row.dpi)) return;
  EXPECT_FLOAT_EQ(x, row.dpi) << "told before it is rounded";
  EXPECT_FLOAT_EQ(Window::xdpi, row.kept);
}

INSTANTIATE_TEST_SUITE_P(Densities, WindowMura,
                         testing::Values(MuraCase{"RoundsUp", 401.6F, 10, 402, 158},
                                         MuraCase{"KeepsASmallFraction", 401.4F, 10, 401.4F, 158},
                                         MuraCase{"RoundsAHalfUp", 100.5F, 254, 101, 1010},
                                         MuraCase{"TruncatesTowardZero", 402, -10, 402, -158},
                                         MuraCase{"Unknown", 0, 10, 0, 0},
                                         MuraCase{"Negative", -401.6F, 10, -401.6F, -158},
                                         MuraCase{"Infinite", kInf, 10, kInf, kIntMax},
                                         MuraCase{"InfinitelyNegative", -kInf, 10, -kInf, kIntMin},
                                         MuraCase{"Huge", 3e9F, 100, 3e9F, kIntMax},
                                         MuraCase{"HugeLength", 400, 3e38F, 400, kIntMax},
                                         MuraCase{"NoDensity", kNan, 10, 0, 0},
                                         MuraCase{"NoLength", 400, kNan, 400, 0}),
                         kRowName);

TEST_F(WindowTest, AsksForTheDensityOnce) {
  platform().xdpi = platform().ydpi = 401.6F;
  Window::getMura(nullptr, nullptr, 10);
  platform().xdpi = 100;
  EXPECT_EQ(Window::getMura(nullptr, nullptr, 10), 158);
  EXPECT_EQ(platform().takeLog(),
            logLines(kError, {"[WINDOW] getMura[402.000000 dpi] 10.000000mm = 158 pixel",
                              "[WINDOW] getMura[402.000000 dpi] 10.000000mm = 158 pixel"}));
}

TEST_F(WindowTest, RedrawFlagIsTestedAndCleared) {
  EXPECT_EQ(MW::isDisplayUpdate(0), 0);
  EXPECT_EQ(MW::isDisplayUpdate(-5), 1);
  EXPECT_EQ(MW::isDisplayUpdate(1), 1);
  EXPECT_EQ(MW::isDisplayUpdate(0), 1);
  EXPECT_EQ(MW::isDisplayUpdate(0), 0);
}

TEST_F(WindowTest, LogsEventsOfItsOwn) {
  for (int code = 0; code <= 8; ++code) {
    MW::event_data event = {.type = code, .value = 0};
    EXPECT_EQ(Window::onRecvEvent(&event, 0), code <= 5 ? 1 : 0) << code;
  }
  EXPECT_EQ(Window::onRecvEvent(nullptr, 0), 0);
  EXPECT_EQ(platform().takeLog(),
            logLines(kDebug, {"[WINDOW] over!!", "[WINDOW] pressed!!", "[WINDOW] released!!",
                              "[WINDOW] long pressed!!", "[WINDOW] key pressed!!",
                              "[WINDOW] key released!!"}));
}

}  // namespace
