// The display's light in steps, from full to faint.
#include <MW/records.h>
#include <brimol/host.h>

#include <array>
#include <memory>
#include <string>

#include "language/language.h"
#include "layout.h"
#include "pages/table.h"
#include "step_page.h"

namespace factory_test {

namespace {

constexpr int kFull = 100;  // per cent
constexpr auto kSteps = std::to_array<int>({kFull, 75, 50, 25, 10});

/// The screen is bright again where the steps were judged, and behind the page.
class BacklightPage : public StepPage {
 public:
  explicit BacklightPage(const Context& program)
      : StepPage(program, {.test = "backlight",
                           .title = tr("Backlight"),
                           .words = tr("Each of five steps is darker\nthan the one before.\n"
                                       "Tap: the next one."),
                           .value = "steps confirmed",
                           .question = tr("Was every step darker, and even?"),
                           .count = kSteps.size()}) {}
  ~BacklightPage() override { brimol_host_set_brightness(kFull); }

 protected:
  void endLook() override {
    StepPage::endLook();
    brimol_host_set_brightness(kFull);
  }

  void beginStep(int picture) override {
    brimol_host_set_brightness(picture < 0 ? kFull : kSteps.at(static_cast<std::size_t>(picture)));
  }

  void drawStep(int picture) override {
    const ScreenSize screen = screenSize();
    const std::string words =
        tr("Light ") + std::to_string(kSteps.at(static_cast<std::size_t>(picture))) + " %";
    const int size = 4 * textSize(screen);
    skia_add_textbox_c({0, 0, screen.width, screen.height, MW::kColorWhite},
                       textOf(words.c_str(), MW::kColorBlack, SKIA_ALIGN_CENTRE, size));
  }
};

}  // namespace

std::unique_ptr<Test> makeBacklight(const Context& program) {
  return std::make_unique<BacklightPage>(program);
}

}  // namespace factory_test
