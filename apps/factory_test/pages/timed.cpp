// What shows for a while and goes away by itself: a toast and a progress bar.
#include <MW/button.h>
#include <MW/timed.h>

#include <array>
#include <memory>
#include <optional>

#include "current.h"
#include "layout.h"
#include "page_test.h"
#include "pages/table.h"

namespace factory_test {

namespace {

constexpr int kToastMs = 2000;
constexpr int kProgressMs = 3000;
constexpr uint32_t kToastColor = 0xFF505A6C;

/// Two buttons, or the keys up and down, start them.
class TimedTest : public PageTest {
 public:
  TimedTest()
      : PageTest("Toast and progress",
                 "Each button shows something for a while.\nKey up: toast. Key down: progress.") {}

  void enter() override {
    page.ask().otherKey = [](unsigned int code) { Current<TimedTest>::get().followKey(code); };
    const ScreenSize screen = screenSize();
    const SKIA_Rect row = rowOf(screen, kContentTop, 11, kButtonColor);
    placeButton(toastButton, cellOf(row, 0, 2), "Toast");
    placeButton(progressButton, cellOf(row, 1, 2), "Progress");
    toastButton->clickCallback = [](int) { Current<TimedTest>::get().startToast(); };
    progressButton->clickCallback = [](int) { Current<TimedTest>::get().startProgress(); };
    placeToast(rowOf(screen, 47, 9, kToastColor));
    placeProgress(rowOf(screen, 60, 7, kTitleColor));
  }

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
    const SKIA_Text caption = captionOf(words);
    button.emplace(&area, &caption).setActive(1);
  }

  void placeToast(const SKIA_Rect& area) {
    const SKIA_Text first = captionOf("A toast", MW::kColorWhite);
    const SKIA_Text second = captionOf("goes in two seconds", MW::kColorWhite);
    toast.emplace(&area, &first, &second);
  }

  void placeProgress(const SKIA_Rect& area) {
    const SKIA_Text caption = captionOf("Three seconds of work", MW::kColorWhite);
    progress.emplace(MW::kUnused, &area, &caption);
  }

  void startToast() {
    toast->onHideTimer(kToastMs);
    page.say("Toast for two seconds");
  }

  void startProgress() {
    progress->onProgressbar(kProgressMs);
    page.say("Progress for three seconds");
  }

  void followKey(unsigned int code) {
    if (code == MW::kKeyUp) startToast();
    if (code == MW::kKeyDown) startProgress();
  }

  Current<TimedTest> current{this};
  std::optional<MW::Button> toastButton;
  std::optional<MW::Button> progressButton;
  std::optional<MW::Toastbox> toast;
  std::optional<MW::Progressbar> progress;
};

}  // namespace

std::unique_ptr<Test> makeTimed(const Context&) { return std::make_unique<TimedTest>(); }

}  // namespace factory_test
