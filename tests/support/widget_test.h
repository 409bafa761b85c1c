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
std::ostream& operator<<(std::ostream& out, const Row& row);

/// Names a table's tests after its rows.
inline constexpr auto kRowName = [](const auto& info) { return std::string(info.param.name); };

/// A place on the screen, in pixels.
struct Spot {
  int x, y;
};

MW::event_data pointerEvent(MW::EventCode code, Spot spot, unsigned int finger = 0);
MW::event_data keyEvent(MW::EventCode code, unsigned int key);
/// The platform's record of a pointer.
Event pointerInput(BrimolEventType type, Spot spot, unsigned int finger = 0);

/// Offers a widget an event as the dispatcher does. The widget's answer.
bool offer(MW::Widget& widget, MW::event_data event);
bool press(MW::Widget& widget, Spot spot, unsigned int finger = 0);
bool drag(MW::Widget& widget, Spot to, unsigned int finger = 0);
bool release(MW::Widget& widget, Spot spot, unsigned int finger = 0);
bool longPress(MW::Widget& widget, Spot spot, unsigned int finger = 0);

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
  explicit ProbeWidget(int layer = 1);
  ~ProbeWidget() override;
  int show(unsigned int ticks) override;
  void updateTimer(unsigned int ticks) override;
  bool onRecvEvent(MW::event_data* event, unsigned int arg) override;

  std::function<bool(MW::event_data*, unsigned int)> onEvent;
  std::function<void(unsigned int)> onShow;
  std::function<void(unsigned int)> onTimer;
};

/// A registered and active probe that writes `name` behind `journal` for every call, and answers
/// `taken` to events.
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
