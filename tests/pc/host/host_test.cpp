// The platform as applications and users meet it, without a window or with one on SDL's dummy
// driver.
#include <brimol/display.h>
#include <brimol/frame.h>
#include <brimol/host.h>
#include <brimol/input.h>
#include <gmock/gmock.h>
#include <unistd.h>

#include <array>
#include <atomic>
#include <cstdlib>
#include <filesystem>
#include <latch>
#include <thread>

#include "host/open_platform.h"
#include "input/input_service.h"
#include "pc/support/painting.h"
#include "pc/support/record_text.h"
#include "scene/recorder.h"

namespace brimol::pc {
namespace {

namespace fs = std::filesystem;
using std::chrono::milliseconds;

constexpr Size kScreen = {200, 300};
constexpr milliseconds kLong{60'000};  // longer than anything takes here
const Frame kRedFrame = {boxItem({10, 20, 30, 40, kRed})};
const Frame kBlueFrame = {boxItem({0, 0, 200, 300, kBlue})};

void show(const Frame& frame) {
  skia_begin_frame_c();
  for (const SKIA_Item& item : frame) skia_add_widget_c(&item);
  skia_end_frame_c();
}

void setEnvironment(const char* display, const char* screen) {
  setenv("BRIMOL_DISPLAY", display, 1);
  setenv("BRIMOL_SCREEN", screen, 1);
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

  static Picture screen() {
    const CairoSurface copy = openedPlatform()->copyPicture(kLong);
    return copy ? pictureOf(copy.get()) : Picture{};
  }
  /// Keeps the platform's thread busy until `release` counts down.
  void keepBusy() {
    std::latch begun(1);
    openedPlatform()->act([this, &begun](InputTranslator&) {
      begun.count_down();
      release.wait();
    });
    begun.wait();
  }

  const fs::path folder = fs::path(testing::TempDir()) / ("host_test." + std::to_string(getpid()));
  const fs::path shot = folder / "shot.png";
  std::latch release{1};
};

TEST_F(HostTest, OpensShowsAndClosesAgainAndAgain) {
  setenv("SDL_VIDEODRIVER", "dummy", 1);
  for (const char* const display : {"headless", "window", "headless"}) {
    setEnvironment(display, "3000x2000");
    EXPECT_EQ(brimol_host_open(), 1) << brimol_host_error();
    EXPECT_EQ(EventInit(0), 1) << "open already";
    setEnvironment(display, "77x77");
    setenv("BRIMOL_DEVICE", "wvga-4.0", 1);
    float density = 0;
    getDpi(&density, nullptr);
    EXPECT_EQ(density, kDefaultDensity) << "what the open screen has";
    Size size = {};
    brimol_host_screen_size(&size.w, nullptr);
    brimol_host_screen_size(nullptr, &size.h);
    EXPECT_EQ(size, (Size{3000, 2000}));
    show(kBlueFrame);
    show(kRedFrame);
    ASSERT_EQ(brimol_host_screenshot(shot.c_str()), 1) << brimol_host_error();
    const CairoSurface file(cairo_image_surface_create_from_png(shot.c_str()));
    EXPECT_EQ(pictureOf(file.get()), painted(kRedFrame, {3000, 2000})) << "in full size";
    EXPECT_EQ(std::distance(fs::directory_iterator(folder), {}), 1) << "nothing else was left";
    EXPECT_NE(skia_live_widget_c(), 0);
    EventQuit();
    EventQuit();
    EXPECT_NE(brimol_host_density(), kDefaultDensity) << "what the next one will have";
    unsetenv("BRIMOL_DEVICE");
    EXPECT_EQ(skia_live_widget_c(), 0);
  }
}

TEST_F(HostTest, CutsAFigureAtAWholeCharacter) {
  constexpr int kRoom = 4;
  std::array<char, kRoom> told = {'x'};
  EXPECT_EQ(brimol_host_figure("load", "ab", told.data(), 0), 2);
  EXPECT_EQ(told.front(), 'x') << "no room";
  EXPECT_EQ(brimol_host_figure("load", "ab", nullptr, kRoom), 2);
  EXPECT_EQ(brimol_host_figure("load", "a\u20acb", told.data(), kRoom), 5);
  EXPECT_STREQ(told.data(), "a");
  EXPECT_EQ(brimol_host_figure(nullptr, nullptr, told.data(), kRoom), 0);
  EXPECT_STREQ(told.data(), "");
}

TEST_F(HostTest, SaysWhyItDoesNotOpenOrWriteAScreenshot) {
  const auto expectError = [](int result, const char* error) {
    EXPECT_EQ(result, 0);
    EXPECT_THAT(brimol_host_error(), testing::HasSubstr(error));
  };
  expectError(brimol_host_screenshot(shot.c_str()), "no screen is open");
  setenv("SDL_VIDEODRIVER", "none", 1);
  setEnvironment("window", "200x300");
  expectError(brimol_host_open(), "cannot open a window");
  setEnvironment("headless", "abc");
  expectError(brimol_host_open(), "BRIMOL_SCREEN=abc: wanted WIDTHxHEIGHT, each 1 to 16384");
  for (int (*const open)() : {+[] { return EventInit(0); }, &brimol_host_open}) {
    testing::internal::CaptureStderr();
    EXPECT_EQ(open(), 0);
    EXPECT_EQ(testing::internal::GetCapturedStderr(), std::string(brimol_host_error()) + "\n");
  }
  setEnvironment("headless", "200x300");
  ASSERT_EQ(brimol_host_open(), 1);
  expectError(brimol_host_screenshot(nullptr), "needs a file name");
  expectError(brimol_host_screenshot("/none/shot.png"), "/none/shot.png: No such file");
  expectError(brimol_host_screenshot("/dev/null"), "is not a file");
}

TEST_F(HostTest, EachDrawingCallShowsItsKind) {
  ASSERT_EQ(brimol_host_open(), 1);
  const SKIA_Text text = textOf("words");
  const SKIA_Point point = {150, 6, 190, 280, kBlue, 9};
  Frame frame;
  for (int i = 0; i <= 10; ++i) frame.push_back({i, {i * 3, i * 25, 120, 24, kRed}, point, text});
  skia_begin_frame_c();
  skia_add_label_c(frame[SKIA_LABEL].rect, text);
  skia_add_textbox_c(frame[SKIA_TEXTBOX].rect, text);
  skia_add_buttonbox_c(frame[SKIA_BUTTONBOX].rect, text);
  skia_add_box_c(frame[SKIA_BOX].rect);
  skia_add_roundbox_c(frame[SKIA_ROUNDBOX].rect);
  skia_add_staticbox_c(frame[SKIA_STATICBOX].rect, text);
  skia_add_line_c(point);
  skia_add_widget_c(&frame[SKIA_IMAGE]);
  skia_add_roundtextbox_c(frame[SKIA_ROUNDTEXTBOX].rect, text);
  skia_add_roundbuttonbox_c(frame[SKIA_ROUNDBUTTONBOX].rect, text);
  EXPECT_EQ(skia_add_arrow_c(frame[SKIA_ARROW].rect, point), 10);
  skia_end_frame_c();
  const Picture shown = screen();
  EventQuit();  // one thread at a time uses the fonts
  EXPECT_EQ(shown, painted(frame, kScreen));
}

TEST_F(HostTest, TakesItemsOnlyIntoTheThreadsOwnFrameWithRoom) {
  ASSERT_EQ(brimol_host_open(), 1);
  const SKIA_Rect box = {0, 0, 9, 9, kRed};
  const auto expectNotTaken = [&box] { EXPECT_EQ(skia_add_box_c(box), kNotTaken); };
  expectNotTaken();
  skia_end_frame_c();
  skia_begin_frame_c();
  skia_add_box_c(box);
  skia_begin_frame_c();  // drops the frame that was not ended
  const SKIA_Item unknown = boxItem(box, SKIA_ARROW + 1);
  EXPECT_EQ(skia_add_widget_c(&unknown), kNotTaken);
  EXPECT_EQ(skia_add_widget_c(nullptr), kNotTaken);
  std::thread(expectNotTaken).join();
  for (int i = 0; i < kMostItems; ++i) ASSERT_EQ(skia_add_box_c({}), i);
  expectNotTaken();
  skia_end_frame_c();
  expectNotTaken();
  EXPECT_EQ(screen(), painted({}, kScreen));
}

TEST_F(HostTest, ShowsTheNewestFrameAndKeepsNobodyWaiting) {
  ASSERT_EQ(brimol_host_open(), 1);
  EXPECT_EQ(screen(), painted({}, kScreen)) << "before any frame";
  keepBusy();
  for (int i = 0; i < 1000; ++i) show(kRedFrame);
  show(kBlueFrame);
  EXPECT_EQ(openedPlatform()->copyPicture(milliseconds(1)), nullptr) << "the thread is busy";
  release.count_down();
  EXPECT_EQ(screen(), painted(kBlueFrame, kScreen));
}

TEST_F(HostTest, LightsTheScreenAsItIsTold) {
  brimol_host_set_brightness(50);
  ASSERT_EQ(brimol_host_open(), 1);
  const auto lightAt = [](int percent) {
    brimol_host_set_brightness(percent);
    show({boxItem({0, 0, 200, 300, kWhite})});
    return screen().at(100, 100) & 0xFF;
  };
  EXPECT_EQ(lightAt(101), 255);
  EXPECT_NEAR(lightAt(60), 153, 1);
  EXPECT_EQ(lightAt(-1), 0);
}

TEST_F(HostTest, AnswersWhoWaitsForAPictureAsItCloses) {
  ASSERT_EQ(brimol_host_open(), 1);
  const auto platform = openedPlatform();
  keepBusy();
  std::thread waiter([&] { EXPECT_EQ(platform->copyPicture(kLong), nullptr); });
  std::thread closer([] { EventQuit(); });
  const auto notAnyMore = [](InputTranslator&) { ADD_FAILURE() << "done though it closes"; };
  while (platform->act(notAnyMore)) std::this_thread::yield();
  release.count_down();
  closer.join();
  waiter.join();
  EXPECT_EQ(platform->copyPicture(kLong), nullptr) << "closed";
}

TEST_F(HostTest, ReportsALongPressByHandAndByItself) {
  ASSERT_EQ(EventInit(0), 1);
  inputService().takeHand(1000);
  for (const uint32_t advance : {500U, 0U}) {
    openedPlatform()->act([](InputTranslator& in) {
      in.pointerDown(kMouse, {999, 7}, GetTicks());
    });
    expectNext("down 0 at 199,7");
    inputService().advance(advance);
    expectNext("long 0 at 199,7");
    openedPlatform()->act([](InputTranslator& in) { in.releaseAll(); });
    expectNext("up 0 at 199,7");
    inputService().letGo();
  }
}

TEST_F(HostTest, SurvivesDrawingAndPollingWhileItOpensAndCloses) {
  std::atomic<bool> isOver = false;
  std::thread drawer([&] {
    while (!isOver) show(kRedFrame);
  });
  std::thread poller([&] {
    for (Event record = {}; !isOver; Delay(1)) PollEvent(&record);
  });
  for (int round = 0; round < 20; ++round) {
    EXPECT_EQ(brimol_host_open(), 1);
    EXPECT_EQ(brimol_host_screenshot(shot.c_str()), 1);
    inputService().takeHand(GetTicks());
    EventQuit();  // makes the clock real again, so that no thread waits for the hand
  }
  isOver = true;
  drawer.join();
  poller.join();
}

}  // namespace
}  // namespace brimol::pc
