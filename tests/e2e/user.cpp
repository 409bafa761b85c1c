#include "e2e/user.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <chrono>
#include <cstdlib>
#include <stdexcept>
#include <thread>

#include "application.h"
#include "e2e/app_screens.h"
#include "e2e/eventually.h"
#include "host/open_platform.h"
#include "options.h"
#include "test.h"

namespace factory_test {

namespace {

using brimol::pc::InputTranslator;
using brimol::pc::kMouse;
using brimol::pc::Picture;
using brimol::pc::ScreenPoint;
using brimol::test::eventually;
using namespace screens;

constexpr uint32_t kOpaque = 0xFF000000;
constexpr int kInset = 8;  // a look at an area falls this part of it from its corner
constexpr brimol::pc::Size kPixels = {kScreen.width, kScreen.height};

ScreenPoint centreOf(const SKIA_Rect& area) { return {area.x + area.w / 2, area.y + area.h / 2}; }

void act(const std::function<void(InputTranslator&, uint32_t)>& action) {
  const auto platform = brimol::pc::openedPlatform();
  ASSERT_NE(platform, nullptr);
  EXPECT_TRUE(platform->act(
      [=](InputTranslator& input) { action(input, brimol::pc::inputService().now()); }));
}

bool isSame(const Picture& one, const Picture& other, const SKIA_Rect& area) {
  for (int y = area.y; y < area.y + area.h; ++y) {
    for (int x = area.x; x < area.x + area.w; ++x) {
      if (one.at(x, y) != other.at(x, y)) return false;
    }
  }
  return true;
}

}  // namespace

bool User::seesMenu() {
  constexpr SKIA_Rect kHeader = {0, 0, kScreen.width, 340, kOpaque};
  constexpr SKIA_Rect kTitle = {0, 110, 370, 120, 0};
  constexpr int kTitleSize = 70;
  const SKIA_Item title = brimol::pc::textItem(
      SKIA_TEXTBOX, kHeader,
      brimol::pc::textOf("Factory test", kTitleSize, MW::kColorWhite, SKIA_ALIGN_LEFT));
  const Picture expected = brimol::pc::painted({title}, kPixels);
  return eventually([] { return brimol::pc::openedPlatform() != nullptr; }) &&
         eventually([&] { return isSame(screen(), expected, kTitle); });
}

void User::down(const SKIA_Rect& area) {
  act([at = centreOf(area)](InputTranslator& input, uint32_t now) {
    input.pointerDown(kMouse, at, now);
  });
}

void User::up(const SKIA_Rect& area) {
  act([at = centreOf(area)](InputTranslator& input, uint32_t now) {
    input.pointerUp(kMouse, at, now);
  });
}

void User::click(const SKIA_Rect& area) {
  down(area);
  up(area);
}

void User::dragFrom(const SKIA_Rect& area, int byX) {
  const ScreenPoint from = centreOf(area);
  const ScreenPoint to = {from.x + byX, from.y};
  act([from, to](InputTranslator& input, uint32_t now) {
    input.pointerDown(kMouse, from, now);
    input.pointerMove(kMouse, to, now);
    input.pointerUp(kMouse, to, now);
  });
}

void User::key(SDL_Keycode key) {
  act([key](InputTranslator& input, uint32_t) {
    input.keyDown(key);
    input.keyUp(key);
  });
}

void User::later(uint32_t ms) {
  brimol::pc::InputService& service = brimol::pc::inputService();
  service.takeHand(service.now());
  service.advance(ms);
  service.letGo();
}

void User::start(std::string_view test) {
  const auto& entries = testEntries();
  const auto place = std::ranges::find(entries, test, &TestEntry::id) - entries.begin();
  for (; marked < place; ++marked) key(SDLK_DOWN);
  for (; marked > place; --marked) key(SDLK_UP);
  key(SDLK_RETURN);
}

bool User::sees(const SKIA_Rect& area, uint32_t colour) {
  const ScreenPoint place = {area.x + area.w / kInset, area.y + area.h / kInset};
  return eventually([&] { return (screen().at(place.x, place.y) | kOpaque) == colour; });
}

bool User::reads(const std::string& words) {
  const SKIA_Item line = brimol::pc::textItem(
      SKIA_TEXTBOX, kPage.line,
      brimol::pc::textOf(words, textSize(kScreen), kOpaque, SKIA_ALIGN_CENTRE));
  const Picture expected = brimol::pc::painted({line}, kPixels);
  return eventually([&] { return isSame(screen(), expected, kPage.line); });
}

Picture User::screen() {
  const auto platform = brimol::pc::openedPlatform();
  const auto copy = platform ? platform->copyPicture(std::chrono::seconds(30)) : nullptr;
  return copy ? brimol::pc::pictureOf(copy.get()) : brimol::pc::painted({}, kPixels);
}

int runWith(const std::vector<std::string>& arguments, const std::function<void()>& user) {
  setenv("BRIMOL_SCREEN", kScreenSetting, 1);
  std::vector<const char*> given = {"--headless"};
  for (const std::string& each : arguments) given.push_back(each.c_str());
  std::string error;
  const auto options = parseOptions(given, error);
  if (!options) throw std::invalid_argument(error);
  User::marked = -1;
  std::thread other([&] {
    EXPECT_TRUE(User::seesMenu());
    user();
    EXPECT_TRUE(User::seesMenu());
    User::key(SDLK_ESCAPE);
    EXPECT_TRUE(User::sees(kDialogOk, MW::kColorWhite));
    User::click(kDialogOk);
  });
  const int code = runApplication(*options);
  other.join();
  return code;
}

}  // namespace factory_test
