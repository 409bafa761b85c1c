#include "display/overlay.h"

#include <gtest/gtest.h>

#include "display/window_canvas.h"
#include "pc/support/painting.h"

namespace brimol::pc {
namespace {

constexpr Size kScreen = {400, 600};
constexpr Size kWindow = {300, 300};  // the screen stands at 50,0 in half its size
const Frame kFrame = {boxItem({100, 300, 200, 200, kBlue})};

class OverlayTest : public testing::Test {
 protected:
  OverlayTest() {
    painter.paint(kFrame);
    canvas.update(painter.picture(), {{0, 0, kScreen.w, kScreen.h}});
    clean = pictureOf(canvas.pixels());
  }
  Picture drawn() { return pictureOf(overlay.drawOver(canvas.pixels(), canvas.fit())); }
  /// What of `from` differs from the content without an overlay.
  Area changedIn(const Picture& from) const {
    Picture difference = from;
    for (std::size_t i = 0; i < from.pixels.size(); ++i) difference.pixels[i] ^= clean.pixels[i];
    return difference.inked();
  }

  Painter painter{kScreen};
  WindowCanvas canvas{kScreen, kWindow};
  Picture clean;
  Overlay overlay;
};

TEST_F(OverlayTest, OutlinesWhatIsDrawnAndTintsWhatWasRepainted) {
  const Region changed = {{200, 400, 20, 40}};
  overlay.note({painter.frame(), changed, std::chrono::microseconds(1500), {}});
  EXPECT_TRUE(overlay.isEmpty());
  overlay.toggleFigures();
  const Picture figures = drawn();
  const Area box = {100, 150, 100, 100};
  EXPECT_NE(figures.at(box.x, 240), clean.at(box.x, 240)) << "its left edge";
  EXPECT_NE(figures.at(199, 240), clean.at(199, 240)) << "its right edge";
  EXPECT_EQ(figures.at(110, 240), clean.at(110, 240)) << "inside it";
  EXPECT_NE(figures.at(155, 210), clean.at(155, 210)) << "what was repainted";
  EXPECT_EQ(pictureOf(canvas.pixels()), clean) << "the content stays as it is";
  overlay.toggleFigures();
  EXPECT_TRUE(overlay.isEmpty());
}

TEST_F(OverlayTest, ListsTheKeysWhollyWithinTheWindow) {
  overlay.toggleKeys();
  for (const Size window : {kWindow, Size{200, 900}, Size{900, 280}, Size{1500, 2000}}) {
    WindowCanvas content(kScreen, window);
    clean = pictureOf(content.pixels());
    const Area list = changedIn(pictureOf(overlay.drawOver(content.pixels(), content.fit())));
    EXPECT_GT(list.width, window.w / 4);
    EXPECT_GT(list.x, 0) << window.w;
    EXPECT_GT(list.y, 0) << window.w;
    EXPECT_LT(list.x + list.width, window.w);
    EXPECT_LT(list.y + list.height, window.h) << window.w;
  }
}

TEST_F(OverlayTest, ShowsBothFingersWhereTheyAre) {
  const TwoFingerMouse::Fingers fingers = {{100, 300}, {300, 500}, {200, 400}, true};
  EXPECT_TRUE(overlay.setFingers(fingers));
  EXPECT_FALSE(overlay.setFingers(fingers)) << "nothing new";
  const Area shown = changedIn(drawn());
  EXPECT_NEAR(2 * shown.x + shown.width, 2 * 150, 2) << "between 100 and 200";
  EXPECT_NEAR(2 * shown.y + shown.height, 2 * 200, 2) << "between 150 and 250";
}

}  // namespace
}  // namespace brimol::pc
