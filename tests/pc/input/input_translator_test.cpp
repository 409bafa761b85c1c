// What the user does with mouse, fingers and keys, and the records that come of it.
#include "input/input_translator.h"

#include <gmock/gmock.h>

#include <algorithm>
#include <array>
#include <iterator>
#include <limits>

#include "display/sdl_input.h"
#include "pc/support/record_text.h"

namespace brimol::pc {
namespace {

using testing::ElementsAre;

constexpr Size kScreen = {1000, 2000};
constexpr Size kWindow = {500, 1000};
constexpr float kNoNumber = std::numeric_limits<float>::quiet_NaN();
constexpr float kInfinity = std::numeric_limits<float>::infinity();

SDL_Event mouse(Uint32 type, int x, int y, Uint8 which = SDL_BUTTON_LEFT, Uint32 device = 0) {
  SDL_Event event = {};
  event.button = {type, 0, 0, device, which, 0, 0, 0, x, y};  // a motion has them in the same place
  return event;
}
SDL_Event touch(Uint32 type, SDL_FingerID finger, float x, float y, SDL_TouchID device = 7) {
  SDL_Event event = {};
  event.tfinger = {type, 0, device, finger, x, y, 0, 0, 0, 0};
  return event;
}
SDL_Event wheel(float right, float up) {
  SDL_Event event = {};
  event.wheel.type = SDL_MOUSEWHEEL;
  event.wheel.preciseX = right;
  event.wheel.preciseY = up;
  return event;
}
SDL_Event key(Uint32 type, SDL_Keycode code) {
  SDL_Event event = {};
  event.key = {type, 0, 0, 0, 0, 0, 0, {SDL_SCANCODE_UNKNOWN, code, 0, 0}};
  return event;
}

struct Play {
  const char* name;
  std::vector<SDL_Event> events;
  std::vector<std::string> records;  // and those of a lost focus at the end
};

constexpr Uint32 kDown = SDL_MOUSEBUTTONDOWN;
constexpr Uint32 kMove = SDL_MOUSEMOTION;
constexpr Uint32 kUp = SDL_MOUSEBUTTONUP;

const auto kPlays = std::to_array<Play>({
    {"the left button alone, and no mouse that a touch plays",
     {mouse(kMove, 1, 1), mouse(kDown, 0, 0, SDL_BUTTON_RIGHT),
      mouse(kDown, 0, 0, SDL_BUTTON_LEFT, SDL_TOUCH_MOUSEID), mouse(kDown, 499, 999),
      mouse(kMove, -9, 999), mouse(kMove, -99, 999), mouse(kUp, 0, 0), mouse(kUp, 0, 0)},
     {"down 0 at 999,1999", "motion 0 at 0,1999 by -999,0", "up 0 at 0,0"}},
    {"touches, the lowest free finger each, and none that the mouse plays",
     {touch(SDL_FINGERDOWN, 5, 0, 0, SDL_MOUSE_TOUCHID), touch(SDL_FINGERDOWN, 5, 1, kInfinity),
      touch(SDL_FINGERDOWN, 6, kNoNumber, -3), touch(SDL_FINGERDOWN, 5, 0, 0, 8),
      touch(SDL_FINGERUP, 5, 1, 1), touch(SDL_FINGERMOTION, 6, 1, 0), mouse(kDown, 0, 0)},
     {"down 0 at 999,1999", "down 1 at 0,0", "down 2 at 0,0", "up 0 at 999,1999",
      "motion 1 at 999,0 by 999,0", "down 0 at 0,0", "up 0 at 0,0", "up 1 at 999,0",
      "up 2 at 0,0"}},
    {"Shift pins the mouse's fingers",
     {key(SDL_KEYDOWN, SDLK_LSHIFT), mouse(kDown, 0, 0), mouse(kUp, 499, 0), mouse(kDown, 0, 999),
      touch(SDL_FINGERDOWN, 5, 0, 0), touch(SDL_FINGERUP, 5, 0, 0), key(SDL_KEYDOWN, SDLK_RSHIFT),
      key(SDL_KEYUP, SDLK_LSHIFT), mouse(kMove, 0, 0), key(SDL_KEYUP, SDLK_RSHIFT),
      mouse(kUp, 0, 0)},
     {"down 0 at 0,0", "motion 0 at 999,0 by 999,0", "down 1 at 0,1999", "down 2 at 0,0",
      "up 2 at 0,0", "motion 1 at 0,0 by 0,-1999", "up 0 at 999,0", "up 1 at 0,0"}},
    {"Ctrl plays a second finger opposite the place where the mouse was",
     {mouse(kMove, 50, 60), key(SDL_KEYDOWN, SDLK_LCTRL), mouse(kMove, 60, 60),
      mouse(kDown, 60, 60), key(SDL_KEYUP, SDLK_LCTRL), mouse(kMove, 160, 60), mouse(kUp, 160, 60),
      mouse(kDown, 0, 0)},
     {"down 0 at 120,120", "down 1 at 80,120", "motion 0 at 320,120 by 200,0",
      "motion 1 at 0,120 by -80,0", "up 0 at 320,120", "up 1 at 0,120", "down 0 at 0,0",
      "up 0 at 0,0"}},
    {"keys, once however they repeat",
     {key(SDL_KEYUP, SDLK_UP), key(SDL_KEYDOWN, SDLK_UP), key(SDL_KEYDOWN, SDLK_UP),
      key(SDL_KEYDOWN, SDLK_q), key(SDL_KEYDOWN, SDLK_RETURN), key(SDL_KEYDOWN, SDLK_KP_ENTER),
      key(SDL_KEYUP, SDLK_RETURN), key(SDL_KEYUP, SDLK_KP_ENTER), key(SDL_KEYUP, SDLK_UP)},
     {"key down 273", "key down 327", "key up 327", "key up 273"}},
    {"a lost focus lifts everything",
     {key(SDL_KEYDOWN, SDLK_LSHIFT), key(SDL_KEYDOWN, SDLK_h), mouse(kDown, 0, 0), mouse(kUp, 0, 0),
      mouse(kDown, 499, 0)},
     {"key down 323", "down 0 at 0,0", "down 1 at 999,0", "key up 323", "up 0 at 0,0",
      "up 1 at 999,0"}},
});

class TranslatorTest : public testing::Test {
 protected:
  TranslatorTest() { service.open(); }

  InputService service;
  InputTranslator input{kScreen, service};
};

TEST_F(TranslatorTest, MakesRecordsOfWhatTheUserDoes) {
  for (const auto& [name, events, records] : kPlays) {
    SdlInput sdl(kScreen, input);
    for (const SDL_Event& event : events) {
      sdl.take(event, {WindowFit::of(kScreen, kWindow), kWindow}, 0);
    }
    sdl.releaseAll();
    input.tick(1000);
    EXPECT_EQ(takeTexts(service), records) << name;
  }
}

TEST_F(TranslatorTest, DragsByWheelAndGoesOnFromTheEdge) {
  const WindowView view = {WindowFit::of(kScreen, kWindow), kWindow};
  SdlInput sdl(kScreen, input);
  uint32_t now = 0xFFFFFFF0;
  const auto play = [&] {
    auto texts = takeTexts(service);
    for (auto ms = sdl.msToTick(now); ms; ms = sdl.msToTick(now)) {
      sdl.tick(now += *ms);
      std::ranges::move(takeTexts(service), std::back_inserter(texts));
    }
    return texts;
  };
  sdl.take(mouse(kMove, 0, 70), view, now);
  sdl.take(wheel(0, -0.2F), view, now);
  EXPECT_THAT(play(), ElementsAre()) << "less than a drag";
  sdl.take(wheel(0, -0.3F), view, now);
  EXPECT_THAT(play(), ElementsAre("down 0 at 0,140", "motion 0 at 0,120 by 0,-20",
                                  "motion 0 at 0,100 by 0,-20", "motion 0 at 0,80 by 0,-20",
                                  "motion 0 at 0,60 by 0,-20", "up 0 at 0,60"));
  sdl.take(wheel(0, -1), view, now);
  const auto records = play();
  EXPECT_EQ(std::ranges::count(records, "down 0 at 0,140"), 2);
  EXPECT_EQ(std::ranges::count(records, "up 0 at 0,0"), 1);
  EXPECT_EQ(records.back(), "up 0 at 0,120");
  sdl.take(wheel(5, 0), view, now);
  EXPECT_THAT(play(), ElementsAre()) << "no room, and no tap";
}

TEST_F(TranslatorTest, ReportsLongPressesInTheOrderOfTime) {
  for (const uint32_t start : {0U, 0xFFFFFF00U}) {
    input.pointerDown(kMouse, {1, 1}, start);
    input.pointerDown({1, 40}, {2, 2}, start + 200);
    EXPECT_EQ(input.msToLongPress(start + 300), 200U);
    input.tick(start + 499);
    input.pointerMove(kMouse, {2, 1}, start + 499);
    input.pointerUp(kMouse, {2, 1}, start + 500);
    EXPECT_EQ(input.msToLongPress(start + 600), 100U);
    input.pointerUp({1, 40}, {2, 2}, start + 699);
    EXPECT_EQ(input.msToLongPress(start + 800), std::nullopt);
    EXPECT_THAT(takeTexts(service),
                ElementsAre("down 0 at 1,1", "down 1 at 2,2", "motion 0 at 2,1 by 1,0",
                            "long 0 at 2,1", "up 0 at 2,1", "up 1 at 2,2"));
  }
}

}  // namespace
}  // namespace brimol::pc
