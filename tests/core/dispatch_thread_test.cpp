#include "core/dispatch_thread.h"

#include <MW/event_service.h>

#include <cctype>

#include "support/widget_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::event_data;

using DispatchTest = LiveWindowTest;

// Who is offered an event, ! when that raises the redraw flag, and how often the display is asked
// whether it is live. The members are registered in this order. Capitals stand in the top layer;
// t, x and h take what they are offered, s, x and i are selected, h and i are hidden.
std::string route(const std::string& members) {
  const android::sp<MW::func_dispatchEvent> dispatcher = new MW::func_dispatchEvent;
  std::string offered;
  std::vector<std::unique_ptr<JournalWidget>> widgets;
  for (const char name : members) {
    const auto isOneOf = [name](std::string_view names) { return names.find(name) < names.size(); };
    const int layer = std::isupper(name) != 0 ? 0 : 1;
    widgets.push_back(std::make_unique<JournalWidget>(offered, name, layer, isOneOf("txhTXH")));
    widgets.back()->setActive(isOneOf("hiHI") ? 0 : 1);
    widgets.back()->setSelect(isOneOf("sxiSXI") ? 1 : 0);
  }
  platform().liveAsked = 0;
  MW::EventService::AppEvent(1);
  EXPECT_TRUE(dispatcher->threadLoop());
  EXPECT_EQ(std::exchange(platform().paused, 0), 1U);
  return offered + (MW::isDisplayUpdate(0) != 0 ? "!" : "") + std::to_string(platform().liveAsked);
}

TEST_F(DispatchTest, EventsGoThroughTheLayersByTheRules) {
  EXPECT_EQ(route(""), "0");
  EXPECT_EQ(route("ww"), "ww1");
  EXPECT_EQ(route("wtw"), "wt!1");
  EXPECT_EQ(route("tW"), "W1") << "an active dialog deafens the base layer";
  EXPECT_EQ(route("tWTW"), "WT!1");
  EXPECT_EQ(route("tIH"), "t!2") << "a hidden one does not";
  EXPECT_EQ(route("ws"), "sws1") << "the selected first, and once more";
  EXPECT_EQ(route("tsxs"), "sx!1");
  EXPECT_EQ(route("iw"), "iw1") << "the selected even while hidden";
  EXPECT_EQ(route("WX"), "WX!1") << "no such pass among dialogs";
  platform().live = 0;
  EXPECT_EQ(route("t"), "1");
  EXPECT_EQ(route("tH"), "1");
}

TEST_F(DispatchTest, ARunningHandlersEventIsItsOwn) {
  const android::sp<MW::func_dispatchEvent> dispatcher = new MW::func_dispatchEvent;
  int seen = 0;
  ProbeWidget widget;
  widget.onEvent = [&](const event_data* event, unsigned int) {
    MW::EventService::AppEvent(9);
    EXPECT_EQ(MW::EventService::recvEvent()->value, 9)
        << "as a window that was started anew would take it";
    seen = event->value;
    return true;
  };
  widget.enter();
  MW::EventService::AppEvent(5);
  dispatcher->threadLoop();
  EXPECT_EQ(seen, 5);
}

}  // namespace
