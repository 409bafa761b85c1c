// The window on a real X server, seen from outside: what the desktop shows, mouse and keys in it,
// its size, and the window manager's wish to close it. To be run on a desktop of 800 x 900.
#include <brimol/frame.h>
#include <brimol/host.h>
#include <brimol/scene.h>
#include <gtest/gtest.h>
#include <unistd.h>

#include <algorithm>
#include <cstdlib>
#include <filesystem>

#include "host/open_platform.h"
#include "pc/support/painting.h"
#include "pc/support/record_text.h"
#include "support/desktop.h"

namespace brimol::pc {
namespace {

namespace fs = std::filesystem;

constexpr std::uint32_t kRgb = 0xFFFFFF;

/// Returns once everything so far is presented.
void settle() { openedPlatform()->copyPicture(std::chrono::seconds(60)); }

class Window : public testing::Test {
 protected:
  Window() {
    fs::create_directory(folder);
    fs::current_path(folder);
    setenv("BRIMOL_DISPLAY", "window", 1);
    EXPECT_EQ(brimol_host_open(), 1) << brimol_host_error();
    place = desktop.findWindow();
  }
  ~Window() override {
    EventQuit();
    fs::current_path("/");
    fs::remove_all(folder);
  }

  static void show(const SKIA_Rect& red) {
    skia_begin_frame_c();
    skia_add_box_c({0, 0, 1440, 2560, kBlue});
    skia_add_box_c(red);
    skia_end_frame_c();
    settle();
  }
  /// Returns once the window has done what it was asked to before.
  static void play(const std::string& actions) {
    ASSERT_EQ(std::system(("xdotool " + actions + " key Up").c_str()), 0);
    expectNext("key down 273");
    expectNext("key up 273");
    settle();
  }
  std::string at(int x, int y) const {
    return "mousemove " + std::to_string(place.x + x) + " " + std::to_string(place.y + y) + " ";
  }
  static Picture pictureIn(const std::string& file) {
    const CairoSurface surface(cairo_image_surface_create_from_png(file.c_str()));
    return pictureOf(surface.get());
  }
  static Picture screenshot(const char* file) {
    EXPECT_EQ(brimol_host_screenshot(file), 1) << brimol_host_error();
    return pictureIn(file);
  }

  const fs::path folder =
      fs::path(testing::TempDir()) / ("window_test." + std::to_string(getpid()));
  const test::Desktop desktop;
  test::Desktop::Place place;
};

TEST_F(Window, ShowsTheScreenScaledDownAndTellsWhatTheUserDoesThere) {
  const auto [window, x, y, width, height] = place;
  EXPECT_EQ((Size{width, height}), (Size{506, 900})) << "the desktop's height";
  for (const bool isFirst : {true, false}) {
    show({isFirst ? 0 : 720, 0, 720, 2560, kRed});
    const std::vector red(252, kRed & kRgb);
    const std::vector blue(252, kBlue & kRgb);
    EXPECT_EQ(desktop.row(x, y, 252), isFirst ? red : blue);
    EXPECT_EQ(desktop.row(x + 254, y + 899, 252), isFirst ? blue : red);
  }
  ASSERT_EQ(std::system(("xdotool " + at(505, 899) + "click 1").c_str()), 0);
  expectNext("down 0 at 1439,2559");
  expectNext("up 0 at 1439,2559");
  EXPECT_EQ(brimol_host_close_requested(), 0);
  openedPlatform()->act([](InputTranslator& input) { input.keyDown(SDLK_UP); });
  expectNext("key down 273");
  desktop.askToClose(window);
  expectNext("key up 273");
  settle();
  EXPECT_NE(brimol_host_close_requested(), 0);
}

TEST_F(Window, KeepsTheProportionsInAnySize) {
  show({0, 0, 1440, 1280, kRed});
  const std::string window = std::to_string(place.window);
  play("windowmove " + window + " 0 0 windowsize " + window + " 700 450");
  place = desktop.findWindow();
  ASSERT_EQ((Size{place.width, place.height}), (Size{700, 450}));
  std::vector expected(700, 0U);
  std::fill_n(expected.begin() + 223, 253, kRed & kRgb);
  EXPECT_EQ(desktop.row(place.x, place.y + 100, 700), expected);
  ASSERT_EQ(std::system(("xdotool " + at(223, 449) + "click 1").c_str()), 0);
  expectNext("down 0 at 0,2559");
  expectNext("up 0 at 0,2559");
}

TEST_F(Window, ShowsItsOwnListsOnTheDesktopAlone) {
  show({0, 0, 1440, 1280, kRed});
  const auto line = [this] { return desktop.row(place.x, place.y + 450, 506); };
  const auto top = [this] { return desktop.row(place.x, place.y + 20, 506); };
  const auto plain = line();
  const auto plainTop = top();
  const Picture screen = screenshot("before.png");
  play("key F1");
  EXPECT_NE(line(), plain) << "the list of keys";
  play("key F10");
  EXPECT_NE(top(), plainTop) << "the figures";
  EXPECT_EQ(screenshot("with.png"), screen);
  show({0, 0, 1440, 1270, kRed});
  EXPECT_NE(line(), plain) << "still there on a new frame";
  play("key F12");
  play("key F12");
  int saved = 0;
  for (const auto& entry : fs::directory_iterator(folder)) {
    if (!entry.path().filename().native().starts_with("brimol-")) continue;
    EXPECT_EQ(pictureIn(entry.path()), screenshot("now.png"));
    ++saved;
  }
  EXPECT_EQ(saved, 2) << "none replaces another";
  show({0, 0, 1440, 1280, kRed});
  play("key F1 key F10");
  EXPECT_EQ(line(), plain);
  EXPECT_EQ(top(), plainTop);
}

TEST_F(Window, PlaysTheWheelAndASecondFinger) {
  const auto run = [](const std::string& actions) {
    ASSERT_EQ(std::system(("xdotool " + actions).c_str()), 0);
  };
  play(at(190, 300));  // the window has heard where the mouse is before it hears of keys
  run(at(200, 300) + "keydown ctrl " + at(210, 300) + "mousedown 1 mouseup 1 keyup ctrl");
  expectNext("down 0 at 598,854");
  expectNext("down 1 at 542,854");
  expectNext("up 0 at 598,854");
  expectNext("up 1 at 542,854");
  run(at(0, 0) + "click 5 click 4");  // up there is no room, and no tap either
  expectNext("down 0 at 0,0");
  int moved = 0;  // in as many records as the test is quick to take
  while (moved < 204) {
    Event record = {};
    while (PollEvent(&record) == 0) Delay(60'000);
    ASSERT_EQ(record.type, BRIMOL_POINTER_MOTION);
    moved += record.pointer.yrel;
    EXPECT_EQ(record.pointer.y, moved);
  }
  expectNext("up 0 at 0,204");
}

}  // namespace
}  // namespace brimol::pc
