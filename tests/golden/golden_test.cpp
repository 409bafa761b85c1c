// Compares what the widgets draw with golden files: the items and the picture.
#include <brimol3_widget_test/golden.h>
#include <brimol3_widget_test/input.h>
#include <gtest/gtest.h>

#include <algorithm>

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

// What the view shows of the frame, on a ground, so that black and shadows are seen.
Frame seen(Frame frame, const Case& drawn) {
  const auto& [width, height] = drawn.screen;
  frame.insert(frame.begin(), {SKIA_BOX, {0, 0, width, height, 0xFF405060}, {}, {}});
  for (SKIA_Item& item : frame) {
    item.rect.y -= drawn.view.top;
    item.point.y1 -= drawn.view.top;
    item.point.y2 -= drawn.view.top;
  }
  return frame;
}

Picture drawnPicture(const Case& drawn) {
  const int bottom = std::min(drawn.view.bottom, drawn.screen.height);
  return paint(seen(frameOf(drawn), drawn), {drawn.screen.width, bottom - drawn.view.top});
}

class Golden : public testing::TestWithParam<Case> {
 protected:
  Goldens goldens{GOLDEN_DATA, GOLDEN_WORK "/failed"};
};

TEST_P(Golden, AddsItsItems) { goldens.expectItems(GetParam().name, frameOf(GetParam())); }

TEST_P(Golden, LooksAsBefore) {
  const Case& drawn = GetParam();
  if (goldens.expectPicture(drawn.name, drawnPicture(drawn)) == Compared::OtherRenderer) {
    GTEST_SKIP() << "another renderer: it paints canary.png otherwise than the reference did";
  }
}

INSTANTIATE_TEST_SUITE_P(Widgets, Golden, testing::ValuesIn(goldenCases()),
                         [](const auto& row) { return std::string(row.param.name); });

}  // namespace
}  // namespace brimol::test
