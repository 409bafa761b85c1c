/// The fixture of the toolkit's tests, and what they do to widgets.
#pragma once

#include <MW/records.h>
#include <MW/widget.h>
#include <brimol/input.h>
#include <gtest/gtest.h>

#include <functional>
#include <ostream>
#include <string>
#include <vector>

#include "support/recording_platform.h"

namespace brimol::test {

/// What the rows of a table of cases begin with.
struct Row {
  constexpr Row(const char* rowsName) : name(rowsName) {}  // a table begins its rows with the text
  const char* name;
};
inline std::ostream& operator<<(std::ostream& out, const Row& row) { return out << row.name; }

/// Names a table's tests after its rows.
inline constexpr auto kRowName = [](const auto& info) { return std::string(info.param.name); };

/// A place on the screen, in pixels.
struct Spot {
  int x, y;
};

inline MW::event_data pointerEvent(MW::EventCode code, Spot spot, unsigned int finger = 0) {
  return {.type = code, .mouse = {0, finger, spot.x, spot.y, 0, 0}};
}
inline MW::event_data keyEvent(MW::EventCode code, unsigned int key) {
  return {.type = code, .key = {0, key}};
}
/// The platform's record of the first finger.
Event pointerInput(BrimolEventType type, Spot spot);

/// Offers a widget an event as the dispatcher does. The widget's answer.
inline bool offer(MW::Widget& widget, MW::event_data event) {
  return widget.onRecvEvent(&event, 0);
}
inline bool press(MW::Widget& widget, Spot spot, unsigned int finger = 0) {
  return offer(widget, pointerEvent(MW::kEventPress, spot, finger));
}
inline bool drag(MW::Widget& widget, Spot to, unsigned int finger = 0) {
  return offer(widget, pointerEvent(MW::kEventMotion, to, finger));
}
inline bool release(MW::Widget& widget, Spot spot, unsigned int finger = 0) {
  return offer(widget, pointerEvent(MW::kEventRelease, spot, finger));
}
inline bool longPress(MW::Widget& widget, Spot spot, unsigned int finger = 0) {
  return offer(widget, pointerEvent(MW::kEventLongPress, spot, finger));
}

/// The drawing calls of one show(ticks), at the platform's time.
std::vector<Drawing> shown(MW::Widget& widget);

/// The log since the last look, as lines of one priority and tag.
std::vector<LogLine> logLines(int priority, const std::vector<std::string>& messages);
inline constexpr int kDebug = 3;
inline constexpr int kWarning = 5;
inline constexpr int kError = 6;

/// How many widgets stand in a layer.
int layerSize(int type);

/// A widget that does what a test says. Its layer is the base one.
class ProbeWidget : public MW::Widget {
 public:
  explicit ProbeWidget(int layer = 1) { type_ = layer; }
  ~ProbeWidget() override { leaveLayers(); }
  int show(unsigned int ticks) override { return onShow(ticks), 0; }
  void updateTimer(unsigned int ticks) override { onTimer(ticks); }
  bool onRecvEvent(MW::event_data* event, unsigned int arg) override { return onEvent(event, arg); }
  /// Activates and registers it.
  void enter();

  std::function<bool(MW::event_data*, unsigned int)> onEvent = [](auto*, auto) { return false; };
  std::function<void(unsigned int)> onShow = [](auto) {};
  std::function<void(unsigned int)> onTimer = onShow;
};

/// A probe that has entered, writes `name` behind `journal` for every call, and answers `taken` to
/// events.
class JournalWidget : public ProbeWidget {
 public:
  JournalWidget(std::string& journal, char name, int layer = 1, bool taken = false);
};

/// Resets the platform, the window and the display-item table before each test, and checks that
/// nothing stands in the window's layers behind it.
class WidgetTest : public testing::Test {
 protected:
  void SetUp() override;
  void TearDown() override;
};

/// With Window::init done and both of its threads parked after their first round, so that the test
/// takes the rounds itself.
class LiveWindowTest : public WidgetTest {
 protected:
  void SetUp() override;
  void TearDown() override;
};

}  // namespace brimol::test
