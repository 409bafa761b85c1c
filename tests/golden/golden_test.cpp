// Compares what the widgets draw with golden files: the items and the picture.
#include <brimol3_widget_test/golden.h>
#include <brimol3_widget_test/input.h>
#include <gtest/gtest.h>

#include "golden/golden_cases.h"

namespace brimol::test {
namespace {

Frame frameOf(const Case& drawn) {
  platform().reset();
  platform().ticks = kNow;
  MW::Window::width = drawn.screen.width;
  MW::Window::height = drawn.screen.height;
  drawn.draw();
  return itemsOf(platform().takeDrawings());
}

// So that black and shadows are seen.
Frame onGround(Frame frame, ScreenSize screen) {
  frame.insert(frame.begin(), {SKIA_BOX, {0, 0, screen.width, screen.height, 0xFF405060}, {}, {}});
  return frame;
}

class Golden : public testing::TestWithParam<Case> {
 protected:
  Goldens goldens{GOLDEN_DATA, GOLDEN_WORK "/failed"};
};

TEST_P(Golden, AddsItsItems) { goldens.expectItems(GetParam().name, frameOf(GetParam())); }

TEST_P(Golden, LooksAsBefore) {
  const Case& drawn = GetParam();
  const Frame frame = onGround(frameOf(drawn), drawn.screen);
  if (goldens.expectPicture(drawn.name, frame, drawn.screen) == Compared::OtherRenderer) {
    GTEST_SKIP() << "another renderer: it paints canary.png otherwise than the reference did";
  }
}

INSTANTIATE_TEST_SUITE_P(Widgets, Golden, testing::ValuesIn(goldenCases()),
                         [](const auto& row) { return std::string(row.param.name); });

}  // namespace
}  // namespace brimol::test
