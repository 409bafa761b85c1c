#include <MW/button.h>
#include <MW/event_service.h>
#include <MW/window.h>

#include <memory>

#include "core/dispatch_thread.h"
#include "support/widget_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words

class DispatchTest : public LiveWindowTest {
 protected:
  void SetUp() override {
    LiveWindowTest::SetUp();
    round();
    platform().takeDelays();
    platform().takeLog();
  }

  void dispatch() {
    MW::Window::getEventService()->AppEvent(1);
    round();
  }
  void round() { EXPECT_TRUE(dispatcher->threadLoop()); }

  const android::sp<MW::func_dispatchEvent> dispatcher = new MW::func_dispatchEvent;
};

struct Member {
  char name;
  int layer;
  bool active, selected, takes;
};

constexpr Member kDialog = {'D', 0, true, false, false};
constexpr Member kTakingDialog = {'T', 0, true, false, true};
constexpr Member kHiddenDialog = {'H', 0, false, true, true};
constexpr Member kWidget = {'w', 1, true, false, false};
constexpr Member kTaking = {'t', 1, true, false, true};
constexpr Member kHidden = {'h', 1, false, false, true};
constexpr Member kSelected = {'s', 1, true, true, false};
constexpr Member kSelectedTaking = {'S', 1, true, true, true};
constexpr Member kSelectedHidden = {'i', 1, false, true, false};

struct RouteCase : Row {
  std::vector<Member> members;  // in the order of registering
  int live;
  const char* offered;
  int redraw;
  int asked;  // how often the display was asked whether it is live
};

class DispatchRoute : public DispatchTest, public testing::WithParamInterface<RouteCase> {};

TEST_P(DispatchRoute, OffersAnEvent) {
  const RouteCase& row = GetParam();
  std::string offered;
  std::vector<std::unique_ptr<JournalWidget>> widgets;
  for (const Member& member : row.members) {
    auto& added = widgets.emplace_back(
        std::make_unique<JournalWidget>(offered, member.name, member.layer, member.takes));
    added->setActive(member.active ? 1 : 0);
    added->setSelect(member.selected ? 1 : 0);
  }
  platform().live = row.live;
  dispatch();
  EXPECT_EQ(offered, row.offered);
  EXPECT_EQ(MW::isDisplayUpdate(0), row.redraw);
  EXPECT_EQ(platform().liveAsked, row.asked);
  EXPECT_EQ(platform().takeDelays(), std::vector{1U});
}

INSTANTIATE_TEST_SUITE_P(
    Layers, DispatchRoute,
    testing::Values(
        RouteCase{"NoWidgets", {}, 1, "", 0, 0},
        RouteCase{"NobodyTakes", {kWidget, kWidget}, 1, "ww", 0, 1},
        RouteCase{"FirstTakes", {kWidget, kTaking, kWidget}, 1, "wt", 1, 1},
        RouteCase{"DarkDisplay", {kTaking}, 0, "", 0, 1},
        RouteCase{"DarkDisplayWithDialog", {kTakingDialog, kTaking}, 0, "", 0, 1},
        RouteCase{"DarkDisplayWithHiddenDialog", {kHiddenDialog, kTaking}, 0, "", 0, 1},
        RouteCase{"HiddenIsSkipped", {kHidden, kWidget}, 1, "w", 0, 1},
        RouteCase{"DialogDeafensTheBase", {kTaking, kDialog}, 1, "D", 0, 1},
        RouteCase{"DialogTakes", {kTaking, kDialog, kTakingDialog, kDialog}, 1, "DT", 1, 1},
        RouteCase{"HiddenDialogLetsThrough", {kTaking, kHiddenDialog}, 1, "t", 1, 2},
        RouteCase{"OneActiveDialogIsEnough", {kTaking, kHiddenDialog, kDialog}, 1, "D", 0, 1},
        RouteCase{"SelectedFirstAndTwice", {kWidget, kSelected}, 1, "sws", 0, 1},
        RouteCase{"SelectedTakes", {kTaking, kSelected, kSelectedTaking, kSelected}, 1, "sS", 1, 1},
        RouteCase{"SelectedHidden", {kSelectedHidden, kWidget}, 1, "iw", 0, 1},
        RouteCase{
            "NoSelectedPassForDialogs", {kDialog, {'s', 0, true, true, true}}, 1, "Ds", 1, 1}),
    kRowName);

TEST_F(DispatchTest, PassesTheEventWithZero) {
  int calls = 0;
  ProbeWidget widget;
  widget.onEvent = [&calls](const MW::event_data* event, unsigned int arg) {
    ++calls;
    EXPECT_EQ(event->type, MW::kEventApplication);
    EXPECT_EQ(event->value, 1);
    EXPECT_EQ(arg, 0U);
    return true;
  };
  widget.setActive(1);
  MW::Window::registerWidget(&widget);
  dispatch();
  EXPECT_EQ(calls, 1);
}

TEST_F(DispatchTest, TakesOneEventARound) {
  std::string offered;
  const JournalWidget widget(offered, 'w');
  MW::Window::getEventService()->AppEvent(1);
  MW::Window::getEventService()->AppEvent(2);
  round();
  EXPECT_EQ(offered, "w");
  round();
  EXPECT_EQ(offered, "ww");
  round();
  EXPECT_EQ(offered, "ww");
  EXPECT_EQ(platform().takeDelays(), std::vector(3, 1U));
}

// Input of a type that nobody knows reaches the widgets, and no widget acts on it.
TEST_F(DispatchTest, UnknownInputIsTakenByNobody) {
  const SKIA_Rect area = {0, 0, 100, 100, 0};
  MW::Button button(&area, nullptr);
  button.setActive(1);
  button.setSelect(1);
  Event input = pointerInput(BRIMOL_POINTER_DOWN, {5, 5});
  input.type = 99;
  MW::Window::getEventService()->sendEvent(&input);
  round();
  EXPECT_EQ(MW::isDisplayUpdate(0), 0);
}

TEST_F(DispatchTest, AnEndingRoundLogs) {
  dispatcher->requestExit();
  round();
  EXPECT_EQ(platform().takeLog(),
            logLines(kDebug, {"[WINDOW] func_dispatchEvent->threadLoop exitPending: 1"}));
}

// What the first handler does to the others of a walk; each event is offered to a, b and c.
TEST_F(DispatchTest, HandlersMayChangeTheLayers) {
  std::string offered;
  auto a = std::make_unique<JournalWidget>(offered, 'a');
  auto b = std::make_unique<JournalWidget>(offered, 'b');
  const JournalWidget c(offered, 'c');
  std::unique_ptr<JournalWidget> d;
  a->onEvent = [&](MW::event_data*, unsigned int) {
    b.reset();
    d = std::make_unique<JournalWidget>(offered, 'd');
    a.reset();  // its own widget
    return false;
  };
  dispatch();
  EXPECT_EQ(offered, "c");
  dispatch();
  EXPECT_EQ(offered, "ccd");
}

// The base layer is walked for the selected widgets and once more for the active ones.
TEST_F(DispatchTest, ASelectedWidgetMayDeleteItself) {
  std::string offered;
  auto selected = std::make_unique<JournalWidget>(offered, 's');
  const JournalWidget other(offered, 'o');
  selected->setSelect(1);
  selected->onEvent = [&](MW::event_data*, unsigned int) {
    selected.reset();
    return false;
  };
  dispatch();
  EXPECT_EQ(offered, "o");
}

}  // namespace
