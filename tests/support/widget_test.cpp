#include "support/widget_test.h"

#include <MW/widget_list.h>
#include <MW/window.h>

namespace brimol::test {

using MW::event_data;
using MW::Widget;

std::ostream& operator<<(std::ostream& out, const Row& row) { return out << row.name; }

event_data pointerEvent(MW::EventCode code, Spot spot, unsigned int finger) {
  return {.type = code, .mouse = {0, finger, spot.x, spot.y, 0, 0}};
}

event_data keyEvent(MW::EventCode code, unsigned int key) {
  return {.type = code, .key = {0, key}};
}

Event pointerInput(BrimolEventType type, Spot spot, unsigned int finger) {
  Event event = {};
  event.pointer.type = static_cast<uint8_t>(type);
  event.pointer.finger = static_cast<uint8_t>(finger);
  event.pointer.x = static_cast<uint16_t>(spot.x);
  event.pointer.y = static_cast<uint16_t>(spot.y);
  return event;
}

bool offer(Widget& widget, event_data event) { return widget.onRecvEvent(&event, 0); }

bool press(Widget& widget, Spot spot, unsigned int finger) {
  return offer(widget, pointerEvent(MW::kEventPress, spot, finger));
}

bool drag(Widget& widget, Spot to, unsigned int finger) {
  return offer(widget, pointerEvent(MW::kEventMotion, to, finger));
}

bool release(Widget& widget, Spot spot, unsigned int finger) {
  return offer(widget, pointerEvent(MW::kEventRelease, spot, finger));
}

bool longPress(Widget& widget, Spot spot, unsigned int finger) {
  return offer(widget, pointerEvent(MW::kEventLongPress, spot, finger));
}

std::vector<Drawing> shown(Widget& widget) {
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
  Widget last;
  last.setType(type);
  MW::Window::registerWidget(&last);
  return last.id() - 1;
}

ProbeWidget::ProbeWidget(int layer) { type_ = layer; }
ProbeWidget::~ProbeWidget() { leaveLayers(); }

int ProbeWidget::show(unsigned int ticks) {
  if (onShow) onShow(ticks);
  return 0;
}

void ProbeWidget::updateTimer(unsigned int ticks) {
  if (onTimer) onTimer(ticks);
}

bool ProbeWidget::onRecvEvent(event_data* event, unsigned int arg) {
  return onEvent && onEvent(event, arg);
}

JournalWidget::JournalWidget(std::string& journal, char name, int layer, bool taken)
    : ProbeWidget(layer) {
  const auto write = [&journal, name](unsigned int) { journal += name; };
  onShow = write;
  onTimer = write;
  onEvent = [write, taken](event_data*, unsigned int arg) {
    write(arg);
    return taken;
  };
  setActive(1);
  MW::Window::registerWidget(this);
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
  EXPECT_EQ(layerSize(0), 0);
  EXPECT_EQ(layerSize(1), 0);
}

void LiveWindowTest::SetUp() {
  WidgetTest::SetUp();
  platform().setPauses(Pauses::Parked);
  ASSERT_EQ(MW::Window::init(), 1);
  platform().awaitParked(2);
}

void LiveWindowTest::TearDown() {
  platform().setPauses(Pauses::Short);
  MW::Window::destroy();
  WidgetTest::TearDown();
}

}  // namespace brimol::test
