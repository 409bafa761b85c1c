#include "input/keymap.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <sstream>

namespace brimol::pc {
namespace {

TEST(Keymap, PlaysTheDocumentedKeys) {
  EXPECT_EQ(phoneKey(SDLK_UP), 273u);
  EXPECT_EQ(phoneKey(SDLK_DOWN), 274u);
  EXPECT_EQ(phoneKey(SDLK_RIGHT), 275u);
  EXPECT_EQ(phoneKey(SDLK_LEFT), 276u);
  EXPECT_EQ(phoneKey(SDLK_h), 323u);
  EXPECT_EQ(phoneKey(SDLK_RETURN), 327u);
  EXPECT_EQ(phoneKey(SDLK_KP_ENTER), 327u);
  EXPECT_EQ(phoneKey(SDLK_UNKNOWN), std::nullopt);
  EXPECT_EQ(phoneKey(SDLK_LSHIFT), std::nullopt);
}

TEST(Keymap, HelpHasALineForEveryKeyAndTheMouse) {
  std::istringstream help(helpText());
  std::vector<std::string> lines;
  for (std::string line; std::getline(help, line);) lines.push_back(line);
  EXPECT_THAT(lines, testing::Contains("  Up                  up (273)"));
  EXPECT_THAT(lines, testing::Contains("  Keypad Enter        select (327)"));
  EXPECT_THAT(lines, testing::Contains(testing::HasSubstr("500 ms: a long press")));
  EXPECT_THAT(lines, testing::Each(testing::SizeIs(testing::Le(80u))));
}

}  // namespace
}  // namespace brimol::pc
