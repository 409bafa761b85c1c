// What every class bears when the machine fails it: each allocation, each drawing and property call
// of a session in turn, and all calls.

#include <MW/event_service.h>

#include <algorithm>
#include <array>
#include <memory_resource>
#include <random>
#include <set>
#include <string>

#include "core/dispatch_thread.h"
#include "support/failing_malloc.h"
#include "support/widget_test.h"
#include "widget_classes.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words

// The session of a class in a window that runs: a widget is made, drawn, set and offered events in
// all ways that it has, by the queue too, and deleted. Its arguments need none of the memory that
// fails.
class Session {
 public:
  Session(const WidgetClass& played, MW::func_dispatchEvent& itsDispatcher)
      : itsClass(played), dispatcher(itsDispatcher) {
    std::minstd_rand random(7);
    // Small numbers and short texts, so that all of it takes part.
    for (uint8_t& each : bytes) each = static_cast<uint8_t>(random() % 14);
  }

  // Throws what the toolkit throws.
  void play() {
    Arguments from(bytes, arena);
    std::unique_ptr<MW::Widget> widget;
    const bool isOwnBlock = FailingAllocation::isNext();  // make_unique's, before the constructor's
    try {
      widget = itsClass.make(from);
    } catch (const std::bad_alloc&) {
      if (!isOwnBlock) throw;
      return;
    }
    itsClass.listen(*widget);
    widget->setActive(1);
    for (const auto* const operations : {&baseOperations(), &itsClass.operations}) {
      for (const Operation& each : *operations) {
        each(*widget, from);
        widget->onRecvEvent(from.take<MW::event_data*>(), 0);
        widget->show(platform().ticks += 100);
        widget->updateTimer(platform().ticks);
        const Event input = from.take<Event>();
        MW::EventService::sendEvent(&input);
        dispatcher.threadLoop();
      }
    }
  }

 private:
  const WidgetClass& itsClass;
  MW::func_dispatchEvent& dispatcher;
  std::array<uint8_t, 8192> bytes = {};
  std::array<std::byte, std::size_t{1} << 18> block = {};
  std::pmr::monotonic_buffer_resource arena{block.data(), block.size(),
                                            std::pmr::null_memory_resource()};
};

class EveryClass : public LiveWindowTest, public testing::WithParamInterface<WidgetClass> {
 protected:
  void SetUp() override {
    LiveWindowTest::SetUp();
    platform().records = false;
    MW::WidgetList::init();
  }
  std::unique_ptr<Session> session() { return std::make_unique<Session>(GetParam(), *dispatcher); }

 private:
  android::sp<MW::func_dispatchEvent> dispatcher = new MW::func_dispatchEvent;
};
const auto kClassName = [](const auto& info) { return std::string(info.param.name); };
INSTANTIATE_TEST_SUITE_P(, EveryClass, testing::ValuesIn(widgetClasses()), kClassName);

TEST_P(EveryClass, BearsThatAnyAllocationOfASessionFails) {
  constexpr int kMost = 2000;
  int nth = 0;
  bool hasFailed = true;
  while (hasFailed && ++nth < kMost) {
    const auto played = session();
    const FailingAllocation failure(nth);
    EXPECT_NO_THROW(played->play()) << "allocation " << nth;
    hasFailed = FailingAllocation::hasFailed();
  }
  EXPECT_LT(nth, kMost);
  EXPECT_GT(nth, 1) << "not even the widget was allocated";
}

TEST_P(EveryClass, DrawsTheSameWhicheverCallFails) {
  const auto drawingsOf = [this](int failingCall) {
    platform().reset();
    MW::WidgetList::destroy();
    MW::WidgetList::init();
    platform().failingCall = failingCall;
    session()->play();
    return platform().takeDrawings();
  };
  const std::vector<Drawing> whole = drawingsOf(0);
  int nth = 0;
  do {
    ASSERT_EQ(drawingsOf(++nth), whole) << "call " << nth << " failed";
  } while (platform().failingCall == 0);
  EXPECT_GE(nth, std::ssize(whole));
}

// What a menu or a dialog is made of stands in no layer of its own, and answers 0 when it draws.
TEST_P(EveryClass, StandsInItsLayerAnswersThatItDrewAndIsCountedAsItGoes) {
  const std::set<std::string> parts = {"Box", "Image", "Label", "Line", "Textbox", "WidgetRcui"};
  const std::set<std::string> covers = {"AutoCapScreen", "FullScreen"};
  const std::string name = GetParam().name;
  Arguments from({});
  auto widget = GetParam().make(from);
  if (!parts.contains(name)) {
    const bool isOnTop = covers.contains(name) || name.starts_with("Dialog");
    EXPECT_EQ(widget->type(), isOnTop ? MW::kTopLayer : MW::kBaseLayer);
  }
  for (const int delayMs : {0, 0, 9}) {
    if (delayMs != 0) widget->onShowTimer(delayMs);
    EXPECT_EQ(widget->show(++platform().ticks), parts.contains(name) ? 0 : 1);
  }
  EXPECT_EQ(widget->onRecvEvent(nullptr, 0), name == "StaticText") << "which does not scroll";
  platform().records = true;
  widget.reset();
  const bool isCounted = std::ranges::any_of(platform().takeLog(), [](const LogLine& line) {
    return line.message.starts_with("[WINDOW] unregisterWidget: num_widget=");
  });
  EXPECT_EQ(isCounted, !parts.contains(name) && !name.starts_with("Button"));
}

TEST_P(EveryClass, DrawsTheSameWhateverThePlatformAnswers) {
  const auto drawingsOf = [this](bool isWhole) {
    platform().reset();
    MW::WidgetList::destroy();
    platform().nextHandle = isWhole ? 1 : -1;
    platform().hasProperties = isWhole;
    session()->play();
    return platform().takeDrawings();
  };
  EXPECT_EQ(drawingsOf(false), drawingsOf(true));
}

}  // namespace
