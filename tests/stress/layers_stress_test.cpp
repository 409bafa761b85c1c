// Widgets come and go from every side while the dispatch thread, a drawing pass and a timer pass
// walk over the layers. Nothing that has left may be called; the sanitizers see what is missed
// here.

#include <MW/button.h>
#include <MW/window.h>

#include <array>
#include <atomic>
#include <latch>
#include <memory>
#include <thread>
#include <vector>

#include "support/widget_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::Button;
using MW::Window;

constexpr int kRegistrations = 200'000;
constexpr int kOffers = 2'000;  // to the gardener, at least
constexpr int kFirstOwnId = 1'000'000;
constexpr SKIA_Rect kScreen = {0, 0, 1000, 1000, 0xFF000000};
constexpr Spot kSpot = {5, 5};

std::atomic<int> registrations;
std::atomic<int> offers;
std::atomic<int> faults;
std::atomic<int> lastOwnId;

void enter(MW::Widget& widget) {
  Window::registerWidget(&widget);
  ++registrations;
}

// Ids are numbers of a layer's size, and so others unregister this widget in place of theirs. With
// an id of its own that ends.
void enterWithOwnId(MW::Widget& widget) {
  enter(widget);
  widget.setId(++lastOwnId);
}

// Knows whether it is called after its end, or after it was told that it has left.
class Mortal : public MW::Widget {
 public:
  explicit Mortal(int layer = 1) { type_ = layer; }
  ~Mortal() override {
    leaveLayers();
    state = kDead;
  }
  int show(unsigned int) override { return check(); }
  void updateTimer(unsigned int) override { check(); }
  bool onRecvEvent(MW::event_data*, unsigned int) override {
    check();
    return false;
  }

  // Not for a widget that another one's removal may have hit: then it can be in the layer still.
  void unregisterForGood() {
    Window::unregisterWidget(this);
    if (inside != 0) ++faults;
    state = kLeft;
  }

 private:
  static constexpr unsigned int kLives = 0x600DF00D;
  static constexpr unsigned int kLeft = 0x1EF7;
  static constexpr unsigned int kDead = 0xDEAD;

  int check() {
    ++inside;
    if (state != kLives) ++faults;
    std::this_thread::yield();
    if (state != kLives) ++faults;
    --inside;
    return 0;
  }

  std::atomic<unsigned int> state = kLives;
  std::atomic<int> inside = 0;
};

// Registers and deletes others from inside its handlers, of the event and of the drawing pass.
class Gardener : public Mortal {
 public:
  Gardener() { setActive(1); }
  ~Gardener() override { leaveLayers(); }
  int show(unsigned int) override {
    plant(drawn);
    return 0;
  }
  bool onRecvEvent(MW::event_data*, unsigned int) override {
    ++offers;
    plant(offered);
    return false;
  }

 private:
  using Bed = std::array<std::unique_ptr<Mortal>, 3>;

  void plant(Bed& bed) {
    std::unique_ptr<Mortal>& place = bed.at(next++ % bed.size());
    place = std::make_unique<Mortal>();
    place->setActive(1);
    enter(*place);
  }

  std::atomic<std::size_t> next = 0;
  Bed drawn;    // of the application's thread
  Bed offered;  // of the dispatch thread
};

// Whoever takes the pointer out deletes: the widget itself from its handler, or the application.
class DeletesItself : public Mortal {
 public:
  ~DeletesItself() override { leaveLayers(); }
  bool onRecvEvent(MW::event_data*, unsigned int) override {
    delete one.exchange(nullptr);
    return false;
  }

  static std::atomic<DeletesItself*> one;
};
std::atomic<DeletesItself*> DeletesItself::one = nullptr;

std::atomic<Button*> doomedButton = nullptr;

// What one thread does until there were enough registrations.
void churn() {
  for (int i = 0; registrations < kRegistrations; ++i) {
    auto a = std::make_unique<Mortal>(i % 8 == 0 ? 0 : 1);
    auto b = std::make_unique<Mortal>();
    a->setActive(1);
    b->setActive(1);
    enter(*a);
    enter(*b);
    if (i % 3 == 0) enter(*a);
    if (i % 2 == 0) Window::unregisterWidget(a.get());
    if (i % 5 == 0) a.reset();
    Button button(&kScreen, nullptr);
    ++registrations;
    button.setActive(1);
    auto left = std::make_unique<Mortal>();
    left->setActive(1);
    enterWithOwnId(*left);
    left->unregisterForGood();
    std::this_thread::yield();
  }
}

// The application's own part besides the passes.
void replaceDoomed(int round) {
  if (round % 64 == 0) {
    delete DeletesItself::one.exchange(nullptr);
    delete doomedButton.exchange(nullptr);
  }
  if (DeletesItself::one == nullptr) {
    auto added = std::make_unique<DeletesItself>();
    added->setActive(1);
    enter(*added);
    DeletesItself::one = added.release();
  }
  if (doomedButton == nullptr) {
    auto added = std::make_unique<Button>(&kScreen, nullptr);
    ++registrations;
    added->clickCallback = [](int) { delete doomedButton.exchange(nullptr); };
    added->setActive(1);
    doomedButton = added.release();
  }
}

TEST_F(WidgetTest, WidgetsComeAndGoWhileWalksRun) {
  registrations = offers = faults = 0;
  lastOwnId = kFirstOwnId;
  platform().records = false;
  platform().feedOverAndOver({pointerInput(BRIMOL_POINTER_DOWN, kSpot),
                              pointerInput(BRIMOL_POINTER_MOTION, kSpot),
                              pointerInput(BRIMOL_POINTER_UP, kSpot)});
  {
    Gardener gardener;
    enterWithOwnId(gardener);
    ASSERT_EQ(Window::init(), 1);
    std::array<std::thread, 2> others = {std::thread(churn), std::thread(churn)};
    for (int i = 0; registrations < kRegistrations || offers < kOffers; ++i) {
      Window::show(0);
      replaceDoomed(i);
      Window::updateTimer(0);
    }
    for (std::thread& each : others) each.join();
    Window::destroy();
  }
  delete DeletesItself::one.exchange(nullptr);
  delete doomedButton.exchange(nullptr);
  EXPECT_EQ(faults, 0);
  EXPECT_EQ(MW::isDisplayUpdate(0), 1) << "buttons took events";
}

// Each of so many threads draws, and from inside its widget unregisters the next thread's one.
class Ring : public WidgetTest, public testing::WithParamInterface<std::size_t> {};

thread_local std::size_t ownWidget = 0;

TEST_P(Ring, OfThreadsThatUnregisterEachOthersWidgetDoesNotHang) {
  const std::size_t size = GetParam();
  std::latch allInside(static_cast<std::ptrdiff_t>(size));
  std::vector<std::unique_ptr<ProbeWidget>> widgets;
  std::atomic<int> calls = 0;
  for (std::size_t i = 0; i < size; ++i) {
    ProbeWidget& widget = *widgets.emplace_back(std::make_unique<ProbeWidget>());
    widget.onShow = [&, i](unsigned int) {
      ++calls;
      if (ownWidget != i) return;
      allInside.arrive_and_wait();
      Window::unregisterWidget(widgets[(i + 1) % size].get());
    };
    widget.setActive(1);
    Window::registerWidget(&widget);
  }
  std::vector<std::thread> threads;
  for (std::size_t i = 0; i < size; ++i) {
    threads.emplace_back([i] {
      ownWidget = i;
      Window::show(0);
    });
  }
  for (std::thread& each : threads) each.join();
  EXPECT_EQ(layerSize(1), 0);
  const int before = calls;
  Window::show(0);
  EXPECT_EQ(calls, before);
}

INSTANTIATE_TEST_SUITE_P(Sizes, Ring, testing::Values(2, 3, 5));

}  // namespace
