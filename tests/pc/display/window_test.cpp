// The window on a real X server, seen from outside: what the desktop shows, clicks on it, and the
// window manager's wish to close it. To be run on a desktop of 800 x 900.
#include <brimol/frame.h>
#include <brimol/host.h>
#include <brimol/scene.h>
#include <gtest/gtest.h>

#include <cstdlib>

#include "host/open_platform.h"
#include "pc/support/record_text.h"
#include "support/desktop.h"

namespace brimol::pc {
namespace {

constexpr std::uint32_t kRed = 0xFFFF0000;
constexpr std::uint32_t kBlue = 0xFF0000FF;
constexpr std::uint32_t kRgb = 0xFFFFFF;

/// Returns once everything so far is presented.
void settle() { openedPlatform()->copyPicture(std::chrono::seconds(60)); }

TEST(Window, ShowsTheScreenScaledDownAndTellsWhatTheUserDoesThere) {
  setenv("BRIMOL_DISPLAY", "window", 1);
  ASSERT_EQ(brimol_host_open(), 1) << brimol_host_error();
  const test::Desktop desktop;
  const auto [window, x, y, width, height] = desktop.findWindow();
  EXPECT_EQ((Size{width, height}), (Size{506, 900})) << "the desktop's height";
  for (const bool isFirst : {true, false}) {
    skia_begin_frame_c();
    skia_add_box_c({0, 0, 1440, 2560, kBlue});
    skia_add_box_c({isFirst ? 0 : 720, 0, 720, 2560, kRed});
    skia_end_frame_c();
    settle();
    const std::vector red(252, kRed & kRgb);
    const std::vector blue(252, kBlue & kRgb);
    EXPECT_EQ(desktop.row(x, y, 252), isFirst ? red : blue);
    EXPECT_EQ(desktop.row(x + 254, y + 899, 252), isFirst ? blue : red);
  }
  const std::string lastPixel = std::to_string(x + 505) + " " + std::to_string(y + 899);
  ASSERT_EQ(std::system(("xdotool mousemove " + lastPixel + " click 1").c_str()), 0);
  expectNext("down 0 at 1439,2559");
  expectNext("up 0 at 1439,2559");
  EXPECT_EQ(brimol_host_close_requested(), 0);
  openedPlatform()->act([](InputTranslator& input) { input.keyDown(SDLK_UP); });
  expectNext("key down 273");
  desktop.askToClose(window);
  expectNext("key up 273");
  settle();
  EXPECT_NE(brimol_host_close_requested(), 0);
  EventQuit();
}

}  // namespace
}  // namespace brimol::pc
