#include "support/widget_test.h"

#include <MW/widget_list.h>
#include <MW/window.h>

namespace brimol::test {

Event pointerInput(BrimolEventType type, Spot spot) {
  const auto place = [](int pixels) { return static_cast<uint16_t>(pixels); };
  return {.pointer = {static_cast<uint8_t>(type), 0, 0, 0, place(spot.x), place(spot.y), 0, 0}};
}

std::vector<Drawing> shown(MW::Widget& widget) {
  platform().takeDrawings();
  widget.show(platform().ticks);
  return platform().takeDrawings();
}

std::vector<LogLine> logLines(int priority, const std::vector<std::string>& messages) {
  std::vector<LogLine> lines;
  lines.reserve(messages.size());
  for (const std::string& message : messages) lines.push_back({priority, "BRIMOL_WIDGET", message});
  return lines;
}

int layerSize(int type) {
  ProbeWidget last(type);
  last.enter();
  return last.id() - 1;
}

void ProbeWidget::enter() {
  setActive(1);
  MW::Window::registerWidget(this);
}

JournalWidget::JournalWidget(std::string& journal, char name, int layer, bool taken)
    : ProbeWidget(layer) {
  onShow = onTimer = [&journal, name](auto) { journal += name; };
  onEvent = [&journal, name, taken](auto*, auto) {
    journal += name;
    return taken;
  };
  enter();
}

void WidgetTest::SetUp() {
  platform().reset();
  MW::isDisplayUpdate(0);
  MW::Window::width = MW::Window::height = 0;
  MW::Window::xdpi = MW::Window::ydpi = 0;
  MW::WidgetList::destroy();
  MW::WidgetList::index_num = 0;
}

void WidgetTest::TearDown() {
  MW::WidgetList::destroy();
  EXPECT_EQ(layerSize(0) + layerSize(1), 0);
}

void LiveWindowTest::SetUp() {
  WidgetTest::SetUp();
  platform().parks = true;
  ASSERT_EQ(MW::Window::init(), 1);
  for (int parked = 0; parked != 2; parked = platform().parked) platform().parked.wait(parked);
}

void LiveWindowTest::TearDown() {
  platform().parks = false;
  platform().parks.notify_all();
  MW::Window::destroy();
  WidgetTest::TearDown();
}

}  // namespace brimol::test
