#include "input/keymap.h"

#include <gmock/gmock.h>

namespace brimol::pc {
namespace {

TEST(Keymap, PlaysTheKeysOfThePhoneAndSaysWhich) {
  for (const char* const line :
       {"Up                  up (273)", "Down                down (274)",
        "Right               right (275)", "Keypad Enter        select (327)",
        "F12                 save a picture"}) {
    EXPECT_THAT(helpText(), testing::HasSubstr(line));
  }
  EXPECT_EQ(phoneKey(SDLK_LEFT), 276U);
}

}  // namespace
}  // namespace brimol::pc
