// The C calls as an application makes them, without a window or with one that nobody sees.
#include <brimol/display.h>
#include <brimol/frame.h>
#include <brimol/host.h>
#include <brimol/input.h>
#include <brimol/scene.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <unistd.h>

#include <atomic>
#include <cmath>
#include <cstdlib>
#include <filesystem>
#include <thread>

#include "cairo_handles.h"
#include "input/input_service.h"
#include "open_platform.h"
#include "painting.h"
#include "record_text.h"

namespace brimol::pc {
namespace {

namespace fs = std::filesystem;
using testing::HasSubstr;

constexpr std::uint32_t kGreen = 0xFF00FF00;

void showBox(const SKIA_Rect& box) {
  skia_begin_frame_c();
  skia_add_box_c(box);
  skia_end_frame_c();
}

/// The colour of a pixel in a picture file; 0 where there is none.
std::uint32_t colourAt(const fs::path& file, int x, int y) {
  const CairoSurface surface(cairo_image_surface_create_from_png(file.c_str()));
  if (cairo_surface_status(surface.get()) != CAIRO_STATUS_SUCCESS) return 0;
  const Picture picture = pictureOf(surface.get());
  return x < picture.size.w && y < picture.size.h ? kBlack | picture.at(x, y) : 0;
}

class HostTest : public testing::Test {
 protected:
  HostTest() {
    setEnvironment("headless", "200x300");
    fs::create_directory(folder);
  }
  ~HostTest() override {
    EventQuit();
    fs::remove_all(folder);
  }

  static void setEnvironment(const char* display, const char* screen) {
    setenv("BRIMOL_DISPLAY", display, 1);
    setenv("BRIMOL_SCREEN", screen, 1);
  }

  const fs::path folder = fs::path(testing::TempDir()) / ("host_test." + std::to_string(getpid()));
  const fs::path shot = folder / "shot.png";
};

TEST_F(HostTest, ShowsFramesAndTakesScreenshots) {
  ASSERT_EQ(brimol_host_open(), 1);
  showBox({0, 0, 200, 300, kGreen});
  showBox({10, 20, 30, 40, kRed});
  ASSERT_EQ(brimol_host_screenshot(shot.c_str()), 1) << brimol_host_error();
  EXPECT_EQ(colourAt(shot, 10, 20), kRed);
  EXPECT_EQ(colourAt(shot, 39, 59), kRed);
  EXPECT_EQ(colourAt(shot, 40, 60), kBlack) << "the frame before is gone";
  EXPECT_EQ(colourAt(shot, 199, 299), kBlack) << "the picture has the screen's size";
  EXPECT_EQ(std::distance(fs::directory_iterator(folder), {}), 1) << "nothing else was left";
}

TEST_F(HostTest, OpensOnceAndAgainAfterItWasClosed) {
  for (const int side : {100, 250}) {
    const std::string size = std::to_string(side) + "x80";
    setEnvironment("headless", size.c_str());
    EXPECT_EQ(brimol_host_open(), 1);
    EXPECT_EQ(EventInit(0), 1) << "open already";
    EXPECT_EQ(brimol_host_open(), 1) << "open already";
    EXPECT_NE(skia_live_widget_c(), 0);
    showBox({side - 1, 79, 1, 1, kRed});
    EXPECT_EQ(brimol_host_screenshot(shot.c_str()), 1);
    EXPECT_EQ(colourAt(shot, side - 1, 79), kRed);
    EventQuit();
    EXPECT_EQ(skia_live_widget_c(), 0);
    EventQuit();
  }
}

TEST_F(HostTest, SaysWhatIsWrongWithTheEnvironment) {
  setEnvironment("headless", "abc");
  EXPECT_EQ(brimol_host_open(), 0);
  EXPECT_STREQ(brimol_host_error(), "BRIMOL_SCREEN=abc: wanted WIDTHxHEIGHT, each 1 to 16384");
  testing::internal::CaptureStderr();
  EXPECT_EQ(EventInit(0), 0);
  EXPECT_EQ(testing::internal::GetCapturedStderr(), std::string(brimol_host_error()) + "\n");
}

TEST_F(HostTest, SaysThatThereIsNoDisplay) {
  setEnvironment("window", "200x300");
  setenv("SDL_VIDEODRIVER", "none", 1);
  EXPECT_EQ(brimol_host_open(), 0);
  EXPECT_THAT(brimol_host_error(), HasSubstr("cannot open a window"));
  unsetenv("SDL_VIDEODRIVER");
}

TEST_F(HostTest, WritesNoBrokenScreenshot) {
  EXPECT_EQ(brimol_host_screenshot(shot.c_str()), 0);
  EXPECT_STREQ(brimol_host_error(), "no screen is open");
  ASSERT_EQ(brimol_host_open(), 1);
  EXPECT_EQ(brimol_host_screenshot(nullptr), 0);
  EXPECT_EQ(brimol_host_screenshot(""), 0);
  EXPECT_EQ(brimol_host_screenshot((folder / "none" / "shot.png").c_str()), 0);
  EXPECT_THAT(brimol_host_error(), HasSubstr("none/shot.png: No such file or directory"));
  EXPECT_EQ(brimol_host_screenshot(folder.c_str()), 0);
  EXPECT_THAT(brimol_host_error(), HasSubstr("is not a file"));
  EXPECT_EQ(brimol_host_screenshot("/dev/null"), 0) << "a device is not replaced";
  EXPECT_TRUE(fs::is_empty(folder));
}

TEST_F(HostTest, TellsSizeAndDensityOpenOrNot) {
  int width = 0;
  int height = 0;
  brimol_host_screen_size(&width, &height);
  EXPECT_EQ((Size{width, height}), (Size{200, 300})) << "what it would be";
  ASSERT_EQ(brimol_host_open(), 1);
  setEnvironment("headless", "77x77");
  brimol_host_screen_size(&width, nullptr);
  brimol_host_screen_size(nullptr, &height);
  EXPECT_EQ((Size{width, height}), (Size{200, 300})) << "what is open";
  float xdpi = 0;
  float ydpi = 0;
  getDpi(&xdpi, nullptr);
  getDpi(nullptr, &ydpi);
  EXPECT_NEAR(std::hypot(1440 / xdpi, 2560 / ydpi), 6, 0.01) << "inches of the default screen";
  EXPECT_EQ(brimol_host_close_requested(), 0);
}

TEST_F(HostTest, DeliversInputUntilItIsClosed) {
  ASSERT_EQ(EventInit(0), 1);
  openedPlatform()->act([](InputTranslator& input) { input.pointerDown(kMouse, {500, 7}, 0); });
  Event record = {};
  while (PollEvent(&record) == 0) Delay(60'000);
  EXPECT_EQ(textOf(record), "down 0 at 199,7");
  inputService().takeHand(GetTicks());
  std::thread waiter([] { Delay(200); });
  EventQuit();
  waiter.join();  // the hand is gone: nobody waits for it any more
  EXPECT_EQ(PollEvent(&record), 0);
}

// SDL's own driver without a screen: everything but the pixels on a desktop.
TEST_F(HostTest, RunsAWindowThatNobodySees) {
  setEnvironment("window", "3000x3000");
  setenv("SDL_VIDEODRIVER", "dummy", 1);
  for (int round = 0; round < 3; ++round) {
    ASSERT_EQ(brimol_host_open(), 1) << brimol_host_error();
    showBox({0, 0, 3000, 3000, kGreen});
    showBox({2999, 2999, 1, 1, kRed});
    ASSERT_EQ(brimol_host_screenshot(shot.c_str()), 1) << brimol_host_error();
    EXPECT_EQ(colourAt(shot, 2999, 2999), kRed) << "in full size, whatever the window's";
    EventQuit();
  }
  unsetenv("SDL_VIDEODRIVER");
}

TEST_F(HostTest, SurvivesDrawingAndPollingWhileItOpensAndCloses) {
  std::atomic<bool> isOver = false;
  std::thread drawer([&] {
    while (!isOver) showBox({0, 0, 200, 300, kRed});
  });
  std::thread poller([&] {
    Event record = {};
    while (!isOver) {
      if (PollEvent(&record) == 0) Delay(1);
      skia_live_widget_c();
    }
  });
  for (int round = 0; round < 20; ++round) {
    EXPECT_EQ(brimol_host_open(), 1);
    EXPECT_EQ(brimol_host_screenshot(shot.c_str()), 1);
    EventQuit();
  }
  isOver = true;
  drawer.join();
  poller.join();
}

TEST(HostHelp, HasAShortLineForEachKeyAndForTheMouse) {
  const std::string help = brimol_host_help();
  EXPECT_THAT(help, HasSubstr("Left button"));
  EXPECT_THAT(help, HasSubstr("Enter"));
  EXPECT_EQ(help.back(), '\n');
}

}  // namespace
}  // namespace brimol::pc
