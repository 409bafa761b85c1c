// Pictures on which a pixel that is dead, or always lit, can be seen.
#include <MW/records.h>

#include <array>
#include <memory>

#include "language/language.h"
#include "layout.h"
#include "pages/table.h"
#include "step_page.h"

namespace factory_test {

namespace {

constexpr int kShades = 256;

SKIA_Rect wholeScreen(uint32_t color) {
  const ScreenSize screen = screenSize();
  return {0, 0, screen.width, screen.height, color};
}

void fill(uint32_t color) { skia_add_box_c(wholeScreen(color)); }

// A shade of a colour that has only full and empty parts.
uint32_t shadeOf(uint32_t color, int shade) {
  constexpr uint32_t kEveryPart = 0x00010101;
  return MW::kColorBlack | (color & (kEveryPart * static_cast<uint32_t>(shade)));
}

void rampAcross(const SKIA_Rect& area) {
  for (int i = 0; i < kShades; ++i) {
    const int left = area.w * i / kShades;
    skia_add_box_c(
        {area.x + left, area.y, area.w * (i + 1) / kShades - left, area.h, shadeOf(area.color, i)});
  }
}

void rampDown(const SKIA_Rect& area) {
  for (int i = 0; i < kShades; ++i) {
    const int top = area.h * i / kShades;
    skia_add_box_c(
        {area.x, area.y + top, area.w, area.h * (i + 1) / kShades - top, shadeOf(area.color, i)});
  }
}

void colorRamps() {
  constexpr auto kColors =
      std::to_array<uint32_t>({MW::kColorRed, MW::kColorGreen, MW::kColorBlue});
  const SKIA_Rect whole = wholeScreen(0);
  constexpr int kCount = kColors.size();
  for (int i = 0; i < kCount; ++i) {
    const int top = whole.h * i / kCount;
    rampAcross({0, top, whole.w, whole.h * (i + 1) / kCount - top,
                kColors.at(static_cast<std::size_t>(i))});
  }
}

// Black lines of one pixel, every other one.
void blackColumns(int first) {
  const SKIA_Rect whole = wholeScreen(0);
  for (int x = first; x < whole.w; x += 2) skia_add_box_c({x, 0, 1, whole.h, MW::kColorBlack});
}

void blackRows(int first) {
  const SKIA_Rect whole = wholeScreen(0);
  for (int y = first; y < whole.h; y += 2) skia_add_box_c({0, y, whole.w, 1, MW::kColorBlack});
}

// A quarter of the pixels is lit, each alone.
void pixelGrid(int first) {
  fill(MW::kColorWhite);
  blackColumns(first);
  blackRows(first);
}

constexpr auto kPatterns = std::to_array<void (*)()>({
    [] { fill(MW::kColorWhite); },
    [] { fill(MW::kColorBlack); },
    [] { fill(MW::kColorRed); },
    [] { fill(MW::kColorGreen); },
    [] { fill(MW::kColorBlue); },
    [] { rampAcross(wholeScreen(MW::kColorWhite)); },
    [] { rampDown(wholeScreen(MW::kColorWhite)); },
    [] { colorRamps(); },
    [] {
      fill(MW::kColorWhite);
      blackColumns(0);
    },
    [] {
      fill(MW::kColorWhite);
      blackRows(0);
    },
    [] { pixelGrid(0); },
    [] { pixelGrid(1); },
});

class DeadPixelsPage : public StepPage {
 public:
  explicit DeadPixelsPage(const Context& program)
      : StepPage(program, {.test = "dead_pixels",
                           .title = tr("Dead pixels"),
                           .words = tr("Look for pixels that differ,\nin each of twelve pictures.\n"
                                       "Tap: the next one."),
                           .value = "patterns confirmed",
                           .question = tr("Was every picture even?"),
                           .count = kPatterns.size()}) {}

 protected:
  void drawStep(int picture) override { kPatterns.at(static_cast<std::size_t>(picture))(); }
};

}  // namespace

std::unique_ptr<Test> makeDeadPixels(const Context& program) {
  return std::make_unique<DeadPixelsPage>(program);
}

}  // namespace factory_test
