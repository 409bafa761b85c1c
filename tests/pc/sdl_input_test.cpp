#include "sdl_input.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <limits>

#include "record_text.h"

namespace brimol::pc {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

// A screen of 400 x 800 in a window of half the size.
class SdlInputTest : public testing::Test {
 protected:
  SdlInputTest() { service.open(); }

  void pass(const SDL_Event& event) { passOn(event, fit, 0, input); }
  void button(Uint32 type, Uint8 which, WindowPoint at, Uint32 mouse = 0) {
    SDL_Event event = {};
    event.button.type = type;
    event.button.which = mouse;
    event.button.button = which;
    event.button.x = at.x;
    event.button.y = at.y;
    pass(event);
  }
  void touch(Uint32 type, SDL_FingerID finger, float x, float y, SDL_TouchID device = 7) {
    SDL_Event event = {};
    event.tfinger.type = type;
    event.tfinger.touchId = device;
    event.tfinger.fingerId = finger;
    event.tfinger.x = x;
    event.tfinger.y = y;
    pass(event);
  }
  void key(Uint32 type, SDL_Keycode code) {
    SDL_Event event = {};
    event.key.type = type;
    event.key.keysym.sym = code;
    pass(event);
  }

  InputService service;
  const WindowFit fit = WindowFit::of({400, 800}, {200, 400});
  InputTranslator input{fit.screen, service};
};

TEST_F(SdlInputTest, MapsTheLeftButtonToTheScreen) {
  button(SDL_MOUSEBUTTONDOWN, SDL_BUTTON_RIGHT, {0, 0});
  button(SDL_MOUSEBUTTONDOWN, SDL_BUTTON_LEFT, {0, 0}, SDL_TOUCH_MOUSEID);
  EXPECT_THAT(takeTexts(service), IsEmpty());
  button(SDL_MOUSEBUTTONDOWN, SDL_BUTTON_LEFT, {199, 399});
  SDL_Event motion = {};
  motion.motion.type = SDL_MOUSEMOTION;
  motion.motion.y = -20;
  pass(motion);
  button(SDL_MOUSEBUTTONUP, SDL_BUTTON_LEFT, {0, 0});
  EXPECT_THAT(takeTexts(service),
              ElementsAre("down 0 at 399,799", "motion 0 at 0,0 by -399,-799", "up 0 at 0,0"));
}

TEST_F(SdlInputTest, MapsTouchesToTheScreen) {
  const float noNumber = std::numeric_limits<float>::quiet_NaN();
  touch(SDL_FINGERDOWN, 5, 0.5f, 0.5f, SDL_MOUSE_TOUCHID);
  EXPECT_THAT(takeTexts(service), IsEmpty());
  touch(SDL_FINGERDOWN, 5, 1, std::numeric_limits<float>::infinity());
  touch(SDL_FINGERDOWN, 6, noNumber, -3);
  touch(SDL_FINGERMOTION, 6, 1, 0);
  touch(SDL_FINGERUP, 5, 1, 1);
  EXPECT_THAT(takeTexts(service), ElementsAre("down 0 at 399,799", "down 1 at 0,0",
                                              "motion 1 at 399,0 by 399,0", "up 0 at 399,799"));
}

TEST_F(SdlInputTest, PassesKeysOn) {
  key(SDL_KEYDOWN, SDLK_UP);
  key(SDL_KEYUP, SDLK_UP);
  EXPECT_THAT(takeTexts(service), ElementsAre("key down 273", "key up 273"));
}

}  // namespace
}  // namespace brimol::pc
