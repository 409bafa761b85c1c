
#include <algorithm>
#include <climits>
#include <cmath>

#include "support/widget_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::Window;

using WindowTest = WidgetTest;

TEST_F(WindowTest, UnregisteringTakesTheFirstOfEqualIds) {
  std::string drawn;
  const JournalWidget a(drawn, 'a');
  JournalWidget b(drawn, 'b');
  const JournalWidget c(drawn, 'c');
  EXPECT_EQ(Window::unregisterWidget(&b), 1);
  JournalWidget d(drawn, 'd');
  EXPECT_EQ(std::pair(c.id(), d.id()), std::pair(3, 3));
  EXPECT_EQ(JournalWidget(drawn, 'D', 0).id(), 1) << "layers are numbered apart";
  Window::unregisterWidget(&d);
  Window::show(1);
  EXPECT_EQ(drawn, "ad") << "c left in place of d";
}

TEST_F(WindowTest, AWidgetCanStandInALayerTwice) {
  std::string drawn;
  JournalWidget twice(drawn, 'a');
  twice.enter();
  Window::unregisterWidget(&twice);
  Window::show(1);
  EXPECT_EQ(drawn, "a");
  twice.enter();
  Window::show(1);
  EXPECT_EQ(drawn, "aaa");
  twice.setType(0);  // its destructor finds both entries all the same
}

TEST_F(WindowTest, CountsAndRefuses) {
  ProbeWidget widget;
  EXPECT_EQ(Window::registerWidget(&widget), 1);
  const std::vector<LogLine> entered = platform().takeLog();
  EXPECT_EQ(entered.at(0), logLines(kWarning, {"[WINDOW] registerWidget: type=1"})[0]);
  const std::string counted = "[WINDOW] registerWidget: num_widget=";
  EXPECT_TRUE(entered.at(1).message.starts_with(counted));
  const int count = std::stoi(entered.at(1).message.substr(counted.size()));
  for (const int type : {-1, 2, INT_MIN, 1}) {  // no such layers, and no such id
    ProbeWidget stranger(type);
    if (type != 1) Window::registerWidget(&stranger);
    EXPECT_EQ(stranger.id(), 0);
    EXPECT_EQ(Window::unregisterWidget(&stranger), 1);
  }
  const std::string left = "[WINDOW] unregisterWidget: num_widget=" + std::to_string(count - 4);
  EXPECT_EQ(platform().takeLog().back(), logLines(kDebug, {left})[0]) << "counted all the same";
  EXPECT_EQ(Window::registerWidget(nullptr) + Window::unregisterWidget(nullptr), 2);
}

TEST_F(WindowTest, DrawsAndTimesTheBaseLayerFirst) {
  std::string calls;
  const JournalWidget dialog(calls, 'D', 0);
  JournalWidget a(calls, 'a');
  JournalWidget hidden(calls, 'h');
  const JournalWidget b(calls, 'b');
  hidden.setActive(0);
  a.onShow = a.onTimer = [&](unsigned int ticks) { calls += std::to_string(ticks); };
  platform().ticks = 70;
  Window::show(5);
  Window::show();
  Window::updateTimer(5);
  EXPECT_EQ(calls, "5bD70bD70bD") << "the timer pass reads the clock";
}

TEST_F(WindowTest, ChangesDuringAPassSkipAndRepeatNothing) {
  std::string calls;
  std::vector<std::unique_ptr<JournalWidget>> all;
  const auto add = [&](char name) { all.push_back(std::make_unique<JournalWidget>(calls, name)); };
  const auto unregister = [&](std::size_t i) { Window::unregisterWidget(all[i].get()); };
  // Widgets a, b and c are drawn twice; what a does when it is drawn first.
  const auto callsWith = [&](const std::function<void()>& change) {
    all.clear();
    calls.clear();
    for (const char name : {'a', 'b', 'c'}) add(name);
    bool changed = false;
    all[0]->onShow = [&](unsigned int) {
      calls += 'a';
      if (!std::exchange(changed, true)) change();
    };
    Window::show(1);
    calls += ' ';
    Window::show(2);
    return calls;
  };
  EXPECT_EQ(callsWith([&] { unregister(0); }), "abc bc");
  EXPECT_EQ(callsWith([&] { unregister(1); }), "ac ac");
  EXPECT_EQ(callsWith([&] { all.resize(1); }), "a a");
  EXPECT_EQ(callsWith([&] { Window::show(1); }), "aabcbc abc");
  EXPECT_EQ(callsWith([&] { unregister(1), all[1]->enter(); }), "ac acb");
  const auto addMany = [&] { std::ranges::for_each(std::string(40, 'n'), add); };
  EXPECT_EQ(callsWith(addMany), "abc abc" + std::string(40, 'n'));
}

TEST_F(WindowTest, KnowsADefaultSize) {
  int width = 0;
  int height = 0;
  Window::getwindowsize(&width, &height);
  EXPECT_EQ(std::pair(width, height), std::pair(1440, 2560));
  Window::width = 720;
  Window::getwindowsize(&width, nullptr);
  EXPECT_EQ(width, 720);
}

TEST_F(WindowTest, TurnsMillimetresIntoPixels) {
  using Pixels = std::pair<float, int>;  // the density as it is kept, and the length
  const auto pixels = [](float dpi, float mm) {
    Window::xdpi = 0;
    platform().xdpi = platform().ydpi = dpi;
    float told = 0;
    const int count = Window::getMura(&told, nullptr, mm);
    EXPECT_EQ(told, dpi) << "before it is rounded";
    EXPECT_EQ(Window::ydpi, dpi) << "only the horizontal density is rounded";
    platform().xdpi = 9;
    EXPECT_EQ(Window::getMura(nullptr, nullptr, mm), count) << "not asked for again";
    return Pixels(Window::xdpi, count);
  };
  EXPECT_EQ(pixels(401.6F, 10), Pixels(402, 158));
  EXPECT_EQ(pixels(401.4F, 10), Pixels(401.4F, 158));
  EXPECT_EQ(pixels(100.5F, 254), Pixels(101, 1010));
  EXPECT_EQ(pixels(402, -10), Pixels(402, -158));
  EXPECT_EQ(pixels(INFINITY, 10), Pixels(INFINITY, INT_MAX));
  EXPECT_EQ(pixels(-3e9F, 100), Pixels(-3e9F, INT_MIN));
  EXPECT_EQ(pixels(400, NAN), Pixels(400, 0));
  EXPECT_EQ(platform().takeLog()[0],
            logLines(kError, {"[WINDOW] getMura[402.000000 dpi] 10.000000mm = 158 pixel"})[0]);
}

}  // namespace
