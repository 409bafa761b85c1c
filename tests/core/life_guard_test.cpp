#include "core/life_guard.h"

#include <array>
#include <barrier>
#include <thread>

#include "support/widget_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::LifeGuard;

using LifeGuardTest = WidgetTest;

TEST_F(LifeGuardTest, KnowsItsOwnWidget) {
  auto widget = std::make_unique<MW::Widget>();
  const MW::Widget other;
  const LifeGuard first(widget.get());
  const LifeGuard others(&other);
  { const LifeGuard within(widget.get()); }
  const LifeGuard second(widget.get());
  EXPECT_TRUE(first.isAlive());
  std::jthread([&] { widget.reset(); }).join();
  EXPECT_FALSE(first.isAlive() || second.isAlive()) << "whichever thread deleted it";
  EXPECT_TRUE(others.isAlive());
}

// Deletes another widget when it is drawn, and leaves behind whether it was there itself after
// that.
class Rival : public MW::Widget {
 public:
  Rival(std::unique_ptr<Rival>& otherOne, bool& whetherAlive)
      : other(otherOne), survives(whetherAlive) {
    type_ = MW::kBaseLayer;
    setActive(1);
    MW::Window::registerWidget(this);
  }
  ~Rival() override { leaveLayers(); }
  int show(unsigned int) override {
    if (drawn != this) return 0;
    bool& told = survives;  // outlives this widget, as `other` does not
    const LifeGuard self(this);
    bothInside.arrive_and_wait();
    other.reset();
    told = self.isAlive();
    return 0;
  }

  static inline thread_local const Rival* drawn = nullptr;  // the one of this thread
  static inline std::barrier<> bothInside{2};

 private:
  std::unique_ptr<Rival>& other;
  bool& survives;
};

TEST_F(LifeGuardTest, OneOfTwoThatDeleteEachOtherIsGoneAndKnowsIt) {
  std::array<std::unique_ptr<Rival>, 2> rivals;
  std::array<bool, 2> survived = {};
  rivals[0] = std::make_unique<Rival>(rivals[1], survived[0]);
  rivals[1] = std::make_unique<Rival>(rivals[0], survived[1]);
  const auto draw = [](const Rival* own) {
    Rival::drawn = own;
    MW::Window::show(0);
  };
  {
    const std::jthread first(draw, rivals[0].get());
    const std::jthread second(draw, rivals[1].get());
  }
  EXPECT_NE(survived[0], survived[1]);
  EXPECT_EQ(rivals[0], nullptr);
  EXPECT_EQ(rivals[1], nullptr);
}

}  // namespace
