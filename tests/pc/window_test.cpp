// The window on a real X server, seen from outside: what the desktop shows, clicks on it, and the
// window manager's wish to close it. To be run on a desktop of 800 x 900.
#include <brimol/frame.h>
#include <brimol/host.h>
#include <brimol/scene.h>
#include <gtest/gtest.h>

#include <array>
#include <cstdlib>

#include "open_platform.h"
#include "record_text.h"
#include "support/desktop.h"

namespace brimol::pc {
namespace {

constexpr std::uint32_t kRed = 0xFFFF0000;
constexpr std::uint32_t kBlue = 0xFF0000FF;
constexpr Size kShown = {506, 900};  // the share of the desktop's height that the screen gets

class WindowTest : public testing::Test {
 protected:
  WindowTest() {
    setenv("BRIMOL_DISPLAY", "window", 1);
    unsetenv("BRIMOL_SCREEN");
    EXPECT_EQ(brimol_host_open(), 1) << brimol_host_error();
    place = desktop.findWindow();
  }
  ~WindowTest() override { EventQuit(); }

  /// Returns once everything so far is presented.
  static void settle() { openedPlatform()->copyPicture(std::chrono::seconds(60)); }

  /// The next two input records.
  static std::string takeTwo() {
    std::string taken;
    Event record = {};
    for (int count = 0; count < 2; ++count) {
      while (PollEvent(&record) == 0) Delay(60'000);
      taken += textOf(record) + "; ";
    }
    return taken;
  }

  const test::Desktop desktop;
  test::Desktop::Place place;
};

TEST_F(WindowTest, ShowsTheWholeScreenScaledDown) {
  EXPECT_EQ((Size{place.width, place.height}), kShown);
  for (const auto& [x, first, last] :
       {std::array{0U, kRed, kBlue}, std::array{720U, kBlue, kRed}}) {
    const auto start = static_cast<int>(x);
    skia_begin_frame_c();
    skia_add_box_c({0, 0, 1440, 2560, kBlue});
    skia_add_box_c({start, 0, 720, 2560, kRed});
    skia_end_frame_c();
    settle();
    EXPECT_EQ(desktop.row(place.x, place.y + 450, 252), std::vector(252, first & 0xFFFFFF));
    EXPECT_EQ(desktop.row(place.x + 254, place.y + 899, 252), std::vector(252, last & 0xFFFFFF));
  }
}

TEST_F(WindowTest, MapsClicksToTheScreen) {
  const std::string lastPixel =
      std::to_string(place.x + kShown.w - 1) + " " + std::to_string(place.y + kShown.h - 1);
  ASSERT_EQ(std::system(("xdotool mousemove " + lastPixel + " click 1").c_str()), 0);
  EXPECT_EQ(takeTwo(), "down 0 at 1439,2559; up 0 at 1439,2559; ");
}

TEST_F(WindowTest, ReleasesKeysAndTellsWhenItIsToBeClosed) {
  openedPlatform()->act([](InputTranslator& input) { input.keyDown(SDLK_UP); });
  desktop.askToClose(place.window);
  EXPECT_EQ(takeTwo(), "key down 273; key up 273; ");
  settle();
  EXPECT_NE(brimol_host_close_requested(), 0);
}

}  // namespace
}  // namespace brimol::pc
