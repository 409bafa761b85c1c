/// The fixtures of the toolkit's tests, and widgets that do what a test says.
#pragma once

#include <MW/widget.h>
#include <MW/widget_list.h>
#include <MW/window.h>
#include <gtest/gtest.h>

#include <functional>
#include <memory>
#include <utility>

#include <brimol3_widget_test/input.h>

namespace brimol::test {

/// What the rows of a table of cases begin with.
struct Row {
  constexpr Row(const char* rowsName) : name(rowsName) {}  // a table begins its rows with the text
  const char* name;
};
inline std::ostream& operator<<(std::ostream& out, const Row& row) { return out << row.name; }

/// Names a table's tests after its rows.
inline constexpr auto kRowName = [](const auto& info) { return std::string(info.param.name); };

/// A widget that does what a test says. Its layer is the base one.
class ProbeWidget : public MW::Widget {
 public:
  explicit ProbeWidget(int layer = 1) { type_ = layer; }
  ~ProbeWidget() override { leaveLayers(); }
  int show(unsigned int ticks) override { return onShow(ticks), 0; }
  void updateTimer(unsigned int ticks) override { onTimer(ticks); }
  bool onRecvEvent(MW::event_data* event, unsigned int arg) override { return onEvent(event, arg); }
  /// Activates and registers it.
  void enter() {
    setActive(1);
    MW::Window::registerWidget(this);
  }

  std::function<bool(MW::event_data*, unsigned int)> onEvent = [](auto*, auto) { return false; };
  std::function<void(unsigned int)> onShow = [](auto) {};
  std::function<void(unsigned int)> onTimer = onShow;
};

/// A probe that has entered, writes `name` behind `journal` for every call, and answers `taken` to
/// events.
class JournalWidget : public ProbeWidget {
 public:
  JournalWidget(std::string& journal, char name, int layer = 1, bool taken = false)
      : ProbeWidget(layer) {
    onShow = onTimer = [&journal, name](auto) { journal += name; };
    onEvent = [&journal, name, taken](auto*, auto arg) {
      journal += arg == 0 ? name : '!';
      return taken;
    };
    enter();
  }
};

/// How many widgets stand in a layer.
inline int layerSize(int type) {
  ProbeWidget last(type);
  last.enter();
  return last.id() - 1;
}

/// Resets the platform, the window and the display-item table before each test, and checks that
/// nothing stands in the window's layers behind it.
class WidgetTest : public testing::Test {
 protected:
  void SetUp() override {
    platform().reset();
    MW::isDisplayUpdate(0);
    MW::Window::width = MW::Window::height = 0;
    MW::Window::xdpi = MW::Window::ydpi = 0;
    MW::WidgetList::destroy();
    MW::WidgetList::index_num = 0;
  }
  void TearDown() override {
    MW::WidgetList::destroy();
    EXPECT_EQ(layerSize(0) + layerSize(1), 0);
  }
};

/// With Window::init done and both of its threads held after their first round, so that the test
/// takes the rounds itself.
class LiveWindowTest : public WidgetTest {
 protected:
  void SetUp() override {
    WidgetTest::SetUp();
    platform().turns.hold();
    ASSERT_EQ(MW::Window::init(), 1);
    platform().turns.await(2);
  }
  void TearDown() override {
    platform().turns.letGo();
    MW::Window::destroy();
    WidgetTest::TearDown();
  }
};

}  // namespace brimol::test
