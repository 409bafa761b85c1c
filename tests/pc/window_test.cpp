// The window on a real X server, seen from outside: what the desktop shows, clicks on it, and the
// window manager's wish to close it. To be run on a desktop of 800 x 900.
#include <brimol/frame.h>
#include <brimol/host.h>
#include <brimol/input.h>
#include <brimol/scene.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <chrono>
#include <cstdlib>
#include <memory>
#include <string>
#include <vector>

#include "open_platform.h"
#include "record_text.h"

// Last, since Xlib's macros have such names as None.
#include <X11/Xlib.h>
#include <X11/Xutil.h>

namespace brimol::pc {
namespace {

constexpr std::uint32_t kRed = 0xFF0000;
constexpr std::uint32_t kBlue = 0x0000FF;
constexpr std::uint32_t kOpaque = 0xFF000000;
constexpr Size kScreen = {1440, 2560};
constexpr Size kShown = {506, 900};  // the screen's share of the desktop's height

struct XDisplayDeleter {
  void operator()(::Display* display) const { XCloseDisplay(display); }
};
struct XImageDeleter {
  void operator()(XImage* image) const { XDestroyImage(image); }
};

/// The desktop as another program sees it.
class Desktop {
 public:
  /// The only window on it, and where it stands.
  Window findWindow(XWindowAttributes& place) const {
    Window ignored = 0;
    Window* windows = nullptr;
    unsigned int count = 0;
    XQueryTree(x.get(), root(), &ignored, &ignored, &windows, &count);
    Window found = 0;
    for (unsigned int i = 0; i < count; ++i) {
      XWindowAttributes attributes = {};
      XGetWindowAttributes(x.get(), windows[i], &attributes);
      if (attributes.map_state != IsViewable) continue;
      found = windows[i];
      place = attributes;
    }
    XFree(windows);
    return found;
  }

  std::uint32_t colourAt(int left, int top) const {
    const std::unique_ptr<XImage, XImageDeleter> image(
        XGetImage(x.get(), root(), left, top, 1, 1, AllPlanes, ZPixmap));
    return static_cast<std::uint32_t>(XGetPixel(image.get(), 0, 0)) & ~kOpaque;
  }

  void askToClose(Window window) const {
    XEvent event = {};
    event.xclient.type = ClientMessage;
    event.xclient.window = window;
    event.xclient.message_type = XInternAtom(x.get(), "WM_PROTOCOLS", False);
    event.xclient.format = 32;
    event.xclient.data.l[0] = static_cast<long>(XInternAtom(x.get(), "WM_DELETE_WINDOW", False));
    XSendEvent(x.get(), window, False, NoEventMask, &event);
    XFlush(x.get());
  }

 private:
  Window root() const { return DefaultRootWindow(x.get()); }

  std::unique_ptr<::Display, XDisplayDeleter> x{XOpenDisplay(nullptr)};
};

class WindowTest : public testing::Test {
 protected:
  WindowTest() {
    setenv("BRIMOL_DISPLAY", "window", 1);
    unsetenv("BRIMOL_SCREEN");
    EXPECT_EQ(brimol_host_open(), 1) << brimol_host_error();
    window = desktop.findWindow(place);
  }
  ~WindowTest() override { EventQuit(); }

  /// Shows a blue screen with a red box, and returns when it is presented.
  static void show(SKIA_Rect box) {
    box.color = kOpaque | kRed;
    skia_begin_frame_c();
    skia_add_box_c({0, 0, kScreen.w, kScreen.h, kOpaque | kBlue});
    skia_add_box_c(box);
    skia_end_frame_c();
    EXPECT_NE(openedPlatform()->copyPicture(std::chrono::seconds(60)), nullptr);
  }

  /// The next two input records.
  static std::vector<std::string> takeTwo() {
    std::vector<std::string> taken;
    while (taken.size() < 2) {
      Event record = {};
      if (PollEvent(&record) != 0) {
        taken.push_back(textOf(record));
      } else {
        Delay(60'000);
      }
    }
    return taken;
  }

  std::uint32_t shownAt(int x, int y) const { return desktop.colourAt(place.x + x, place.y + y); }

  const Desktop desktop;
  XWindowAttributes place = {};
  Window window = 0;
};

TEST_F(WindowTest, ShowsTheWholeScreenScaledDown) {
  EXPECT_EQ((Size{place.width, place.height}), kShown);
  show({0, 0, kScreen.w / 2, kScreen.h / 2, 0});
  EXPECT_EQ(shownAt(0, 0), kRed);
  EXPECT_EQ(shownAt(kShown.w / 2 - 2, kShown.h / 2 - 2), kRed);
  EXPECT_EQ(shownAt(kShown.w / 2 + 2, kShown.h / 2 - 2), kBlue);
  EXPECT_EQ(shownAt(kShown.w - 1, kShown.h - 1), kBlue);
  show({kScreen.w - 20, kScreen.h - 20, 20, 20, 0});
  EXPECT_EQ(shownAt(0, 0), kBlue) << "what the frame before showed is gone";
  EXPECT_EQ(shownAt(kShown.w - 1, kShown.h - 1), kRed);
}

TEST_F(WindowTest, MapsClicksToTheScreen) {
  const std::string lastPixel =
      std::to_string(place.x + kShown.w - 1) + " " + std::to_string(place.y + kShown.h - 1);
  ASSERT_EQ(std::system(("xdotool mousemove " + lastPixel + " click 1").c_str()), 0);
  EXPECT_THAT(takeTwo(), testing::ElementsAre("down 0 at 1439,2559", "up 0 at 1439,2559"));
}

TEST_F(WindowTest, TellsThatItIsToBeClosed) {
  EXPECT_EQ(brimol_host_close_requested(), 0);
  openedPlatform()->act([](InputTranslator& input) { input.keyDown(SDLK_UP); });
  desktop.askToClose(window);
  EXPECT_THAT(takeTwo(), testing::ElementsAre("key down 273", "key up 273"));
  openedPlatform()->copyPicture(std::chrono::seconds(60));
  EXPECT_NE(brimol_host_close_requested(), 0);
}

}  // namespace
}  // namespace brimol::pc
