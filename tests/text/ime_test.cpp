#include <MW/ime.h>

#include <array>

#include "support/drawings.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using ImeTest = WidgetTest;

struct Keyboard : MW::Ime {
  explicit Keyboard(SKIA_Rect area = {0, 0, 720, 600, 5}) : Ime(&area, nullptr) {}
  void touch(const char* labels) {
    std::istringstream each(labels);
    for (std::string label; each >> label;) {
      const SKIA_Rect at = placeOf(shown(*this), label);
      EXPECT_TRUE(press(*this, {at.x + at.w / 2, at.y + at.h / 2})) << label;
    }
  }
  std::string bar() { return shown(*this).at(1).text.text; }
};

TEST_F(ImeTest, TypesWhatTheTouchedKeysSay) {
  static constexpr auto kTypings = std::to_array<std::array<const char*, 3>>({
      {"back fold a space b enter", "a b", "a b"},
      {"1 shift 1 Q shift 1 \\ ? shift 1 q enter", "11Q1\\?1q", "11Q1\\?1q"},
      {"q w e r t y u i o p a s d f g h enter space", "qwertyuiopasdfg", "qwertyuiopasdfg"},
      {"q w e r t y u i o p a s d f g back z back back", "qwertyuiopasd", ""},
      {"a b c d enter fold x y enter", "xy", "xycd"},  // the old tail
  });
  for (const auto& [touches, bar, result] : kTypings) {
    Keyboard keyboard;
    keyboard.touch(touches);
    EXPECT_EQ(keyboard.bar(), bar);
    EXPECT_STREQ(keyboard.getResultString(), result);
    keyboard.typing_reset();
    keyboard.touch("7 enter");
    EXPECT_STREQ(keyboard.getResultString(), "7");
  }
}

TEST_F(ImeTest, DigitsAloneGreyTheRest) {
  Keyboard keyboard;
  for (const unsigned int type : {2U, 3U, 4U, UINT_MAX}) keyboard.keyboard_change(type);
  for (const unsigned int type : {3U, 4U, UINT_MAX}) keyboard.presskey_set(type);
  std::vector<Drawing> grey = shown(keyboard);
  std::erase_if(grey, [](const Drawing& each) { return each.rect.color != 0xFF7F7F7F; });
  EXPECT_EQ(words(grey), "[|]|{|}|(|)|<|>|_|-|+|=|%|:|~|#|^|&|*|shift|\\|/|;|,|.|?|!|space|");
  keyboard.touch("1 [ space shift 2");
  EXPECT_EQ(keyboard.bar(), "12");
  keyboard.touch("fold");
  EXPECT_TRUE(keyboard.get_fold_status());
  EXPECT_EQ(platform().properties["brimol.info_1.ime_flag"], "true");
  keyboard.keyboard_change(0);
  EXPECT_EQ(placeOf(shown(keyboard), "q").color, MW::kColorWhite);
}

TEST_F(ImeTest, KeysStandInHalvesAndTheirBordersTakeNothing) {
  Keyboard keyboard({10, 20, 735, 605, 5});  // 73 x 100, and 36 are a half
  EXPECT_NE(places(shown(keyboard)).find("|192,520 365x100|557,520 182x100|"), std::string::npos);
  for (const Spot spot : {Spot{10, 150}, {83, 150}, {84, 120}, {84, 220}}) press(keyboard, spot);
  EXPECT_EQ(keyboard.bar(), "");
  for (const Spot spot : {Spot{11, 121}, {82, 219}, {84, 150}}) press(keyboard, spot);
  EXPECT_EQ(keyboard.bar(), "112");
  for (const int w : {INT_MIN, 0, 9, INT_MAX}) EXPECT_EQ(Keyboard({INT_MAX, w, w, w, 0}).bar(), "");
}

}  // namespace
