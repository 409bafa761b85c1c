// The whole application without a window: what the user does goes in where a window's input would,
// and what the user sees is compared with the picture of what is to be seen.
#include <brimol/host.h>
#include <gtest/gtest.h>

#include <chrono>
#include <cstdlib>
#include <filesystem>
#include <functional>
#include <string>
#include <thread>

#include "application.h"
#include "e2e/eventually.h"
#include "layout.h"
#include "open_platform.h"
#include "pc/painting.h"

namespace factory_test {
namespace {

using brimol::pc::InputTranslator;
using brimol::pc::kMouse;
using brimol::pc::ScreenPoint;
using brimol::test::eventually;

constexpr ScreenSize kScreen = {720, 1280};
constexpr Layout kLayout = layOut(kScreen);
constexpr const char* kScreenSetting = "720x1280";
constexpr uint32_t kOpaque = 0xFF000000;

enum Place { kPress, kClick, kLongPress, kDoubleClick, kDelayedShow, kLate };

ScreenPoint centreOf(const SKIA_Rect& area) { return {area.x + area.w / 2, area.y + area.h / 2}; }

const SKIA_Rect& button(Place place) { return kLayout.buttons.at(place); }

/// The user at the screen.
class User {
 public:
  static bool waitForScreen() {
    return eventually([] { return brimol::pc::openedPlatform() != nullptr; }) &&
           eventually([] { return screenColour(kLayout.title) == kLayout.title.color; });
  }

  static void down(const SKIA_Rect& area) {
    act([at = centreOf(area)](InputTranslator& input, uint32_t now) {
      input.pointerDown(kMouse, at, now);
    });
  }
  static void up(const SKIA_Rect& area) {
    act([at = centreOf(area)](InputTranslator& input, uint32_t now) {
      input.pointerUp(kMouse, at, now);
    });
  }
  static void click(const SKIA_Rect& area) {
    down(area);
    up(area);
  }

  /// The colour just within the area's corner, where no text stands.
  static uint32_t screenColour(const SKIA_Rect& area) {
    return screen().at(area.x + 1, area.y + 1) | kOpaque;
  }
  static bool sees(const SKIA_Rect& area, uint32_t colour) {
    return eventually([&] { return screenColour(area) == colour; });
  }
  /// Whether the status line comes to say the words.
  static bool reads(const std::string& words) {
    const SKIA_Item line = brimol::pc::textItem(
        SKIA_TEXTBOX, kLayout.status,
        brimol::pc::textOf(words, kLayout.textSize, kOpaque, SKIA_ALIGN_CENTRE));
    const auto expected = brimol::pc::painted({line}, {kScreen.w, kScreen.h});
    return eventually([&] { return isSame(screen(), expected, kLayout.status); });
  }

 private:
  static void act(const std::function<void(InputTranslator&, uint32_t)>& action) {
    const auto platform = brimol::pc::openedPlatform();
    ASSERT_NE(platform, nullptr);
    EXPECT_TRUE(platform->act(
        [=](InputTranslator& input) { action(input, brimol::pc::inputService().now()); }));
  }

  static brimol::pc::Picture screen() {
    const auto platform = brimol::pc::openedPlatform();
    const auto copy = platform ? platform->copyPicture(std::chrono::seconds(30)) : nullptr;
    if (!copy) return brimol::pc::painted({}, {kScreen.w, kScreen.h});
    return brimol::pc::pictureOf(copy.get());
  }

  static bool isSame(const brimol::pc::Picture& one, const brimol::pc::Picture& other,
                     const SKIA_Rect& area) {
    for (int y = area.y; y < area.y + area.h; ++y) {
      for (int x = area.x; x < area.x + area.w; ++x) {
        if (one.at(x, y) != other.at(x, y)) return false;
      }
    }
    return true;
  }
};

/// Runs the application on this thread, as its main function does, and the user on another.
void runWith(const std::function<void()>& user) {
  setenv("BRIMOL_SCREEN", kScreenSetting, 1);
  std::thread other([&] {
    EXPECT_TRUE(User::waitForScreen());
    user();
    User::click(kLayout.end);
  });
  EXPECT_EQ(runApplication({.headless = true}), EXIT_SUCCESS);
  other.join();
}

TEST(HeadlessApplication, LightsTheButtonThatIsHeld) {
  runWith([] {
    const uint32_t normal = button(kPress).color;
    User::down(button(kPress));
    EXPECT_TRUE(User::sees(button(kPress), MW::kColorHighlight));
    EXPECT_TRUE(User::reads("Press: 1"));
    User::up(button(kPress));
    EXPECT_TRUE(User::sees(button(kPress), normal));
  });
}

TEST(HeadlessApplication, TellsClicksDoubleClicksAndLongPresses) {
  runWith([] {
    User::click(button(kClick));
    EXPECT_TRUE(User::reads("Click: 1"));
    User::click(button(kClick));
    EXPECT_TRUE(User::reads("Click: 2"));
    User::click(button(kDoubleClick));
    User::click(button(kDoubleClick));
    EXPECT_TRUE(User::reads("Double click: 1"));
    User::down(button(kLongPress));
    EXPECT_TRUE(User::reads("Long press: 1"));
    User::up(button(kLongPress));
  });
}

TEST(HeadlessApplication, ShowsAButtonLateAndHidesIt) {
  runWith([] {
    User::click(button(kDelayedShow));
    EXPECT_TRUE(User::reads("Delayed show: 1"));
    EXPECT_TRUE(User::sees(button(kLate), button(kLate).color));
    User::click(button(kLate));
    EXPECT_TRUE(User::reads("Hide me: 1"));
    EXPECT_TRUE(User::sees(button(kLate), kLayout.ground.color));
  });
}

TEST(HeadlessApplication, WritesAPictureAndEnds) {
  setenv("BRIMOL_SCREEN", kScreenSetting, 1);
  const auto shot = std::filesystem::path(testing::TempDir()) / "factory_test_shot.png";
  EXPECT_EQ(runApplication({.headless = true, .shot = shot.string()}), EXIT_SUCCESS);
  const brimol::pc::CairoSurface picture(cairo_image_surface_create_from_png(shot.c_str()));
  ASSERT_EQ(cairo_surface_status(picture.get()), CAIRO_STATUS_SUCCESS);
  EXPECT_EQ(cairo_image_surface_get_width(picture.get()), kScreen.w);
  EXPECT_EQ(cairo_image_surface_get_height(picture.get()), kScreen.h);
  std::filesystem::remove(shot);
  EXPECT_EQ(runApplication({.headless = true, .shot = "/nonexistent/shot.png"}), EXIT_FAILURE);
}

}  // namespace
}  // namespace factory_test
