#include "core/layer_walk.h"

#include <algorithm>
#include <atomic>
#include <optional>
#include <thread>

#include "support/widget_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::Window;

using LayerWalkTest = WidgetTest;

TEST_F(LayerWalkTest, ChangesDuringAPassSkipAndRepeatNothing) {
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
  EXPECT_EQ(callsWith([&] { all[1]->enter(), all[1].reset(); }), "ac ac") << "both its entries";
  EXPECT_EQ(callsWith(addMany), "abc abc" + std::string(40, 'n'));
  EXPECT_EQ(callsWith([&] { unregister(1), addMany(); }), "ac ac" + std::string(40, 'n'));
  EXPECT_EQ(callsWith([&] { addMany(), all.erase(++all.begin(), all.end()), add('l'); }), "a al");
  EXPECT_EQ(all[1]->id(), 2) << "the number that its layer then holds";
}

// A widget that, when it is drawn within so many drawing passes, goes and is followed by another
// one in the same place, which another thread takes away before the handler returns.
class Heir : public MW::Widget {
 public:
  explicit Heir(int passesWithin) : depth(passesWithin) {
    type_ = MW::kBaseLayer;
    setActive(1);
    Window::registerWidget(this);
  }
  ~Heir() override { leaveLayers(); }
  int show(unsigned int) override;

 private:
  int depth;
};
std::optional<Heir> place;

int Heir::show(unsigned int) {
  if (--depth > 0) return Window::show(0), 0;
  place.emplace(0);
  std::jthread([] { place.reset(); }).join();
  return 0;
}

TEST_F(LayerWalkTest, ACallOfADeletedWidgetIsNoCallOfTheNextOneThere) {
  for (const int depth : {1, 2, 9}) {
    place.emplace(depth);
    Window::show(0);
    EXPECT_FALSE(place.has_value());
  }
}

// The widget stands in the layer twice, and is called again as soon as a call ends.
TEST_F(LayerWalkTest, ARemovalWaitsForOneCallAlone) {
  constexpr int kCalls = 50;
  constexpr int kTurns = 20'000;  // given to the other thread in each call
  std::atomic<int> calls = 0;
  std::atomic<bool> isRemoved = false;
  ProbeWidget widget;
  widget.onShow = [&](unsigned int) {
    ++calls;
    calls.notify_all();
    for (int i = 0; i < kTurns && !isRemoved; ++i) std::this_thread::yield();
  };
  widget.enter();
  widget.enter();
  const std::jthread remover([&] {
    calls.wait(0);
    Window::unregisterWidget(&widget);
    isRemoved = true;
  });
  while (calls < kCalls && !isRemoved) Window::show(0);
  EXPECT_LT(calls, kCalls);
}

}  // namespace
