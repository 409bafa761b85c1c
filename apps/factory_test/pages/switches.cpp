// The slide switches, one of them locked.
#include <MW/slide.h>

#include <algorithm>
#include <array>
#include <atomic>
#include <memory>
#include <optional>

#include "current.h"
#include "language/language.h"
#include "layout.h"
#include "page_test.h"
#include "pages/table.h"

namespace factory_test {

namespace {

constexpr int kRightBit = MW::Slide::kFullLeft ^ MW::Slide::kFullRight;

/// Tells every change, and is complete once each switch was moved. A double tap unlocks the third
/// one; the up key moves the others.
class SwitchTest : public PageTest {
 public:
  SwitchTest()
      : PageTest(tr("Slide switches"),
                 tr("Drag the switches to and fro.\nTap the locked one twice to unlock it.\n"
                    "Key up moves the first two.")) {}

  void enter() override {
    page.ask().otherKey = [](unsigned int code) {
      if (code == MW::kKeyUp) Current<SwitchTest>::get().moveAll();
    };
    place<0>(full, MW::Slide::kFullLeft, tr("Full way"));
    place<1>(half, MW::Slide::kHalfLeft, tr("Half way"));
    place<2>(locked, MW::Slide::kFullLeft, tr("Locked"));
    locked->Lock();
    locked->doubleClickCallback = [](MW::mouse_event*) { Current<SwitchTest>::get().unlock(); };
  }

  bool isComplete() const override {
    return std::ranges::all_of(moved, [](const auto& each) { return each.load(); });
  }

  void leave() override {
    locked.reset();
    half.reset();
    full.reset();
    page.endAsking();
  }

 private:
  template <std::size_t index, typename Kind>
  static void place(std::optional<Kind>& slide, MW::Slide::State state, const char* words) {
    const auto rows = rowsOf<5>(contentArea(), 2 * gapOf(screenSize()), {1, 2, 2, 2, 1});
    const SKIA_Rect& area = rows.at(index + 1);
    const SKIA_Text caption = captionOf(words);
    slide.emplace(state, &area, &caption, nullptr);
    slide->leftCallback = [](int) { Current<SwitchTest>::get().follow(index, tr("Left")); };
    slide->rightCallback = [](int) { Current<SwitchTest>::get().follow(index, tr("Right")); };
    slide->setActive(1);
  }

  void follow(std::size_t index, const char* words) {
    moved.at(index) = true;
    page.say(words);
  }

  void moveAll() {
    moved[0] = true;
    moved[1] = true;
    std::atomic_ref(full->state).fetch_xor(kRightBit);
    std::atomic_ref(half->state).fetch_xor(kRightBit);
    page.say((full->state & kRightBit) != 0 ? tr("Right") : tr("Left"));
  }

  void unlock() {
    locked->unLock();
    page.say(tr("Unlocked"));
  }

  Current<SwitchTest> current{this};
  std::array<std::atomic<bool>, 3> moved = {};
  std::optional<MW::Slide> full;
  std::optional<MW::SlideV> half;
  std::optional<MW::Slide> locked;
};

}  // namespace

std::unique_ptr<Test> makeSwitches(const Context&) { return std::make_unique<SwitchTest>(); }

}  // namespace factory_test
