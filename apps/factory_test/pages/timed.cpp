// What shows for a while and goes away by itself: a toast and a progress bar.
#include <MW/button.h>
#include <MW/timed.h>

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

constexpr int kToastMs = 2000;
constexpr int kProgressMs = 3000;

/// Two buttons, or the keys up and down, start them.
class TimedTest : public PageTest {
 public:
  TimedTest()
      : PageTest(
            tr("Toast and progress"),
            tr("Each button shows something for a while.\nKey up: toast. Key down: progress.")) {}

  void enter() override {
    page.ask().otherKey = [](unsigned int code) { Current<TimedTest>::get().followKey(code); };
    const int gap = gapOf(screenSize());
    // A progress bar is twice as high as its area.
    const auto [row, above, lower, under] = rowsOf<4>(contentArea(), 2 * gap, {3, 3, 2, 3});
    const auto [left, right] = columnsOf<2>(inColor(row, kButtonInk.ground), gap, {1, 1});
    placeButton(toastButton, left, tr("Toast"));
    placeButton(progressButton, right, tr("Progress"));
    toastButton->clickCallback = [](int) { Current<TimedTest>::get().startToast(); };
    progressButton->clickCallback = [](int) { Current<TimedTest>::get().startProgress(); };
    placeToast(inColor(above, kRowInk.ground));
    placeProgress(inColor(lower, kHeadInk.ground));
  }

  bool isComplete() const override { return toasted && progressed; }

  void leave() override {
    progress.reset();
    toast.reset();
    progressButton.reset();
    toastButton.reset();
    page.endAsking();
  }

 private:
  static void placeButton(std::optional<MW::Button>& button, const SKIA_Rect& area,
                          const char* words) {
    const SKIA_Text caption = captionIn(area, words, kButtonInk.text);
    button.emplace(&area, &caption).setActive(1);
  }

  void placeToast(const SKIA_Rect& area) {
    const SKIA_Text first = captionIn(area, tr("A toast"), kRowInk.text);
    const SKIA_Text second = captionIn(area, tr("goes in two seconds"), kRowInk.text);
    toast.emplace(&area, &first, &second);
  }

  void placeProgress(const SKIA_Rect& area) {
    const SKIA_Text caption = captionIn(area, tr("Three seconds of work"), kHeadInk.text);
    progress.emplace(MW::kUnused, &area, &caption);
  }

  void startToast() {
    toasted = true;
    toast->onHideTimer(kToastMs);
    page.say(tr("Toast for two seconds"));
  }

  void startProgress() {
    progressed = true;
    progress->onProgressbar(kProgressMs);
    page.say(tr("Progress for three seconds"));
  }

  void followKey(unsigned int code) {
    if (code == MW::kKeyUp) startToast();
    if (code == MW::kKeyDown) startProgress();
  }

  Current<TimedTest> current{this};
  std::atomic<bool> toasted = false;
  std::atomic<bool> progressed = false;
  std::optional<MW::Button> toastButton;
  std::optional<MW::Button> progressButton;
  std::optional<MW::Toastbox> toast;
  std::optional<MW::Progressbar> progress;
};

}  // namespace

std::unique_ptr<Test> makeTimed(const Context&) { return std::make_unique<TimedTest>(); }

}  // namespace factory_test
