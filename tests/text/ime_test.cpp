#include <MW/ime.h>

#include <array>

#include <brimol3_widget_test/drawings.h>
#include "support/play_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using ImeTest = WidgetTest;
using MW::Ime;

constexpr SKIA_Rect kArea = {0, 0, 720, 600, 5};  // keys of 72 x 100

struct Keyboard : Ime {
  explicit Keyboard(SKIA_Rect area = kArea) : Ime(&area, nullptr) {}
  // Presses the keys of these labels.
  void touch(const std::string& labels) {
    std::istringstream each(labels);
    for (std::string label; each >> label;) {
      const SKIA_Rect key = placeOf(shown(*this), label);
      EXPECT_TRUE(press(*this, {key.x + key.w / 2, key.y + key.h / 2})) << label;
    }
  }
  std::string bar() { return shown(*this).at(1).text.text; }
};

struct Typing : Row {
  const char* touches;
  const char* bar;
  const char* result;
};
constexpr auto kTypings = std::to_array<Typing>({
    {"ShiftGoesThroughTheLayouts", "1 shift 1 Q shift 1 \\ ? shift 1 q enter", "11Q1\\?1q",
     "11Q1\\?1q"},
    {"FifteenBytesAreKept", "q w e r t y u i o p a s d f g h enter space", "qwertyuiopasdfg",
     "qwertyuiopasdfg"},
    {"BackInAFullBar", "q w e r t y u i o p a s d f g back z back back", "qwertyuiopasd", ""},
    {"AShorterResultKeepsTheOldTail", "a b c d enter fold x y enter", "xy", "xycd"},
});
class ImeTyping : public WidgetTest, public testing::WithParamInterface<Typing> {};

TEST_P(ImeTyping, TypesWhatTheTouchedKeysSay) {
  Keyboard keyboard;
  keyboard.touch(GetParam().touches);
  EXPECT_EQ(keyboard.bar(), GetParam().bar);
  EXPECT_STREQ(keyboard.getResultString(), GetParam().result);
  keyboard.typing_reset();
  EXPECT_STREQ(keyboard.getResultString(), "");
}
INSTANTIATE_TEST_SUITE_P(, ImeTyping, testing::ValuesIn(kTypings), kRowName);

void noteDouble(int zero, Ime*) { noteZero("double", zero); }
Step listen(void (*doubleTap)(int, Ime*)) {
  return call<Keyboard>([=](Keyboard& keyboard) { keyboard.double_tap_cb = doubleTap; });
}

std::unique_ptr<MW::Widget> keyboard() {
  auto keyboard = std::make_unique<Keyboard>();
  keyboard->press_cb = [](int zero, Ime*) { noteZero("press", zero); };
  keyboard->release_cb = [](int zero, Ime* sender) {
    noteZero(sender == stage.widget.get() ? "release" : "stranger", zero);
  };
  keyboard->long_press_cb = [](int zero, Ime*) { noteZero("long", zero); };
  keyboard->double_tap_cb = noteDouble;
  return keyboard;
}
// What no event reaches.
Step pressByHand() {
  return call([](MW::Widget& keyboard) {
    MW::event_data event = pointerEvent(MW::kEventPress, {9, 9});
    keyboard.onPress(&event);
  });
}

const PlaysOn kKeyboard = {keyboard};
const PlayTests kPlays = {
    kKeyboard("ReleaseFollowsAKey", {press(9, 150), release(9, 600), release(9, 9)},
              "+ - release+"),
    kKeyboard("ALongPressIsTold", {longPress(9, 150), moveTo(9, 151)}, "long+ -"),
    kKeyboard(
        "APressByHandHoldsAndCountsTaps",
        {pressByHand(), lookAtHold(), moveTo(900, 900), release(9, 9), pressByHand(), release()},
        "press <held 1> + release+ press release double+"),
    kKeyboard(
        "CountsTapsWhileADoubleTapIsWanted",
        {listen(nullptr), pressByHand(), listen(noteDouble), release(), pressByHand(), release()},
        "press release+ press release+"),
    kKeyboard("TakesNothingOnceItHasATime", {call(&MW::Widget::onShowTimer, 5), press(9, 150)},
              "-"),
};

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
}

TEST_F(ImeTest, EachLayoutTypesByHand) {
  Keyboard keyboard;
  const SKIA_Rect key = placeOf(shown(keyboard), "q");
  MW::event_data event = pointerEvent(MW::kEventPress, {key.x + 9, key.y + 9});
  keyboard.onPressKey_small(&event);
  keyboard.onPressKey_big(&event);
  keyboard.onPressKey_special(&event);
  keyboard.onPressKey_only_num(&event);
  EXPECT_EQ(keyboard.bar(), "qQ[");
}

TEST_F(ImeTest, AResultIsKeptUntilTypingStartsOver) {
  Keyboard keyboard;
  keyboard.setResultString("abc");
  EXPECT_STREQ(keyboard.getResultString(), "abc");
  keyboard.typing_reset();
  EXPECT_STREQ(keyboard.getResultString(), "");
}

TEST_F(ImeTest, RowsOfKeysAreStaggered) {
  struct KeyRow {
    int left;
    std::vector<int> widths;
  };
  const std::vector<int> tenKeys(10, 72);
  const auto rows = std::to_array<KeyRow>({{0, {720}},
                                           {0, tenKeys},
                                           {0, tenKeys},
                                           {36, std::vector<int>(9, 72)},
                                           {0, {108, 72, 72, 72, 72, 72, 72, 72, 108}},
                                           {0, {180, 360, 180}}});
  std::ostringstream wanted("0,0 720x600|", std::ios::ate);
  for (int y = 0; auto [x, widths] : rows) {
    for (const int w : widths) wanted << std::exchange(x, x + w) << ',' << y << ' ' << w << "x100|";
    y += 100;
  }
  Keyboard keyboard;
  EXPECT_EQ(places(shown(keyboard)), wanted.str());
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
