// The slide switches, one of them locked.
#include <MW/slide.h>

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

/// Tells every change. A double tap unlocks the third switch; the up key moves the others.
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
    place(full, 0, MW::Slide::kFullLeft, tr("Full way"));
    place(half, 1, MW::Slide::kHalfLeft, tr("Half way"));
    place(locked, 2, MW::Slide::kFullLeft, tr("Locked"));
    locked->Lock();
    locked->doubleClickCallback = [](MW::mouse_event*) { Current<SwitchTest>::get().unlock(); };
  }

  void leave() override {
    locked.reset();
    half.reset();
    full.reset();
    page.endAsking();
  }

 private:
  template <typename Kind>
  static void place(std::optional<Kind>& slide, int row, MW::Slide::State state,
                    const char* words) {
    const auto rows = rowsOf<5>(contentArea(), 2 * gapOf(screenSize()), {1, 2, 2, 2, 1});
    const SKIA_Rect& area = rows.at(static_cast<std::size_t>(row) + 1);
    const SKIA_Text caption = captionOf(words);
    slide.emplace(state, &area, &caption, nullptr);
    slide->leftCallback = [](int) { Current<SwitchTest>::get().page.say(tr("Left")); };
    slide->rightCallback = [](int) { Current<SwitchTest>::get().page.say(tr("Right")); };
    slide->setActive(1);
  }

  void moveAll() {
    std::atomic_ref(full->state).fetch_xor(kRightBit);
    std::atomic_ref(half->state).fetch_xor(kRightBit);
    page.say((full->state & kRightBit) != 0 ? tr("Right") : tr("Left"));
  }

  void unlock() {
    locked->unLock();
    page.say(tr("Unlocked"));
  }

  Current<SwitchTest> current{this};
  std::optional<MW::Slide> full;
  std::optional<MW::SlideV> half;
  std::optional<MW::Slide> locked;
};

}  // namespace

std::unique_ptr<Test> makeSwitches(const Context&) { return std::make_unique<SwitchTest>(); }

}  // namespace factory_test
