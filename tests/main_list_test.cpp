#include <MW/main_list.h>

#include <algorithm>
#include <memory>

#include "support/drawings.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::MainList;

constexpr unsigned int kWhite = 0xFFFFFFFF;
constexpr unsigned int kBlack = 0xFF000000;
constexpr unsigned int kGrey = 0xFF787878;

struct OpenList : MainList {
  using MainList::items;
  using MainList::MainList;
};

std::unique_ptr<OpenList> list;
std::string calls;

template <char letter>
void noteTouch(MW::mouse_event* mouse, MainList* from) {
  calls += from == list.get() && mouse->finger == 2 ? letter : '!';
}
template <char letter>
void noteKey(MW::kbd_event* key, MainList* from) {
  calls += from == list.get() && key->code == 5 ? letter : '!';
}

// On the default screen of 1440 x 2560: the list begins at 340 and is 2220 high. The finger is 2.
class MainListTest : public WidgetTest {
 protected:
  void SetUp() override {
    WidgetTest::SetUp();
    calls.clear();
  }
  void TearDown() override {
    list.reset();
    WidgetTest::TearDown();
  }
  static void open(int mode = 0) {
    list = std::make_unique<OpenList>("Menu", mode);
    list->clickCallback = noteTouch<'c'>;
    list->pressCallback = noteTouch<'p'>;
    list->releaseCallback = noteTouch<'r'>;
    list->scrollCallback = noteTouch<'s'>;
    list->keyPressCallback = noteKey<'k'>;
    list->keyReleaseCallback = noteKey<'K'>;
  }
  // Items 100 high of these kinds, captioned by their numbers, and the end.
  static void fill(const std::vector<int>& kinds) {
    for (std::size_t i = 0; i < kinds.size(); ++i) {
      const SKIA_Text caption = textRecord(std::to_string(i), 7, 1, 50);
      EXPECT_EQ(list->addIndex(kinds[i], &caption, 100), static_cast<int>(i));
    }
    list->initFinish();
    platform().takeLog();
  }
  static bool move(int dx, int dy, unsigned int finger = 2) {
    return offer(*list, {.type = MW::kEventMotion, .mouse = {0, finger, 9, 999, dx, dy}});
  }
  // What stands in front of the title bar: the items.
  static std::vector<Drawing> shownItems() {
    std::vector<Drawing> drawn = shown(*list);
    const auto isItem = [](const Drawing& each) { return each.call == Call::Textbox; };
    drawn.erase(std::find_if_not(drawn.begin(), drawn.end(), isItem), drawn.end());
    return drawn;
  }
  static int indexAt(int y) { return list->position2index({0, 2, 9, y, 0, 0}); }
};

struct StatusPlace {
  int x, w;
};

struct HeadCase : Row {
  int w, h;
  StatusPlace upper;                       // brightness, battery, charger
  StatusPlace operators, address, signal;  // the middle row
  StatusPlace testMode, ble;               // the lower one
};

class MainListHead : public MainListTest, public testing::WithParamInterface<HeadCase> {};

TEST_P(MainListHead, StandsByTheScreensWidth) {
  const HeadCase& at = GetParam();
  const auto status = [](StatusPlace place, int y, int h, const char* words, int align) {
    return label({place.x, y, place.w, h, 0}, {words, 0xFFFFFF00, align, 65});
  };
  setScreen(at.w, at.h);
  std::vector<Drawing> plain = {box({0, 0, at.w, 340, kBlack}),
                                label({0, 0, at.w, 340, kBlack}, {"Menu", kWhite, 1, 70}),
                                status(at.upper, 17, 130, "", 2), status(at.upper, 102, 130, "", 2),
                                status(at.upper, 187, 130, "", 2)};
  std::vector<Drawing> extended = plain;
  extended.front().rect.h = 510;
  extended.push_back(status(at.operators, 340, 65, " uVOR", 1));
  extended.push_back(status(at.address, 340, 65, "192.168.100.1", 5));
  extended.push_back(status(at.signal, 340, 65, "-120 dbm", 2));
  extended.push_back(status(at.testMode, 425, 65, "Testmode: ", 1));
  extended.push_back(status(at.ble, 425, 65, "BLE: ", 1));
  for (auto* const each : {&plain, &extended}) each->push_back(box({0, at.h, at.w, 2, kBlack}));
  open();
  fill({});
  EXPECT_EQ(shown(*list), plain);
  open(1);
  fill({});
  EXPECT_EQ(shown(*list), extended);
}

// clang-format off
INSTANTIATE_TEST_SUITE_P(
    Screens, MainListHead,
    testing::Values(
        HeadCase{{"Tall1440"}, 1440, 2560, {864, 576}, {0, 475}, {475, 475}, {950, 475}, {0, 576}, {576, 576}},
        HeadCase{{"Tall1080"}, 1080, 1920, {648, 432}, {0, 356}, {356, 356}, {712, 356}, {0, 432}, {432, 432}},
        HeadCase{{"Tall720"}, 720, 1280, {432, 288}, {0, 237}, {237, 237}, {474, 237}, {0, 288}, {288, 288}},
        HeadCase{{"Wide"}, 2560, 1440, {1536, 1024}, {0, 844}, {844, 844}, {1688, 844}, {0, 1024}, {1024, 1024}},
        HeadCase{{"Odd"}, 1081, 1921, {648, 433}, {0, 356}, {356, 356}, {712, 356}, {0, 432}, {432, 432}}),
    rowName);
// clang-format on

TEST_F(MainListTest, IsFilledAndThenShown) {
  open();
  EXPECT_TRUE(shown(*list).empty()) << "not even a title before it is finished";
  fill({2, 3, 1});
  const SKIA_Text late = textRecord("late");
  EXPECT_EQ(list->addIndex(1, &late, 100), -1);
  shown(*list);
  shown(*list);
  list->setActive(1);
  EXPECT_EQ(list->hide(), 0);
  list->hide();
  EXPECT_FALSE(list->isActive());
  EXPECT_EQ(platform().takeLog(),
            logLines(kDebug, {"[MAINLIST] SHOW->Menu", "[MAINLIST] HIDE<-Menu"}));
  shown(*list);
  EXPECT_EQ(platform().takeLog(), logLines(kDebug, {"[MAINLIST] SHOW->Menu"}));
}

TEST_F(MainListTest, TheFirstSelectableItemIsTheCurrentOne) {
  open();
  const SKIA_Text caption = textRecord("x");
  for (const int kind : {2, 3, 1, 1}) list->addIndex(kind, &caption, 100);
  list->initFinish();
  EXPECT_EQ(platform().takeLog().back().message, "[MAINLIST] initFinish find first item #02 ");
  EXPECT_EQ(list->move_key_down(0), 3);
  MainList empty(nullptr);
  empty.initFinish();
  EXPECT_EQ(platform().takeLog().back().message, "[MAINLIST] initFinish find first item #-1 ");
  EXPECT_EQ(empty.Max_height(), -3);
  EXPECT_EQ(empty.move_key_down(0), -100);
  EXPECT_EQ(empty.move_key_up(0), -100);
}

// The first item's top is the list's edge, which does not belong to the list.
TEST_F(MainListTest, ItemsLookAsTheirKindSays) {
  open();
  fill({1, 1, 2, 3, 7, 0, 1});
  EXPECT_EQ(shownItems(),
            (std::vector{textbox({0, 443, 1440, 100, kGrey}, {"1", kWhite, 1, 50}),
                         textbox({0, 546, 1440, 100, kGrey}, {"2", 0xFF353535, 1, 50}),
                         textbox({0, 649, 1440, 100, 0xFF0F0F0F}, {"3", kWhite, 1, 50}),
                         textbox({0, 752, 1440, 100, kGrey}, {"4", kWhite, 1, 50})}));
  EXPECT_EQ(list->Max_height(), 615) << "six items with five gaps: the end has no height";
}

TEST_F(MainListTest, ItemsAreDrawnFromTheirTopsInTheList) {
  setScreen(720, 546);
  open();
  fill({1, 1, 1});
  EXPECT_EQ(shownItems().size(), 1U) << "the third one's top is the list's foot";
  setScreen(720, 547);
  list->setRect(0);
  EXPECT_EQ(shownItems().size(), 2U);
}

TEST_F(MainListTest, IsFullAtSixtyFourItems) {
  open();
  const SKIA_Text caption = textRecord("x");
  for (int i = 0; i < 64; ++i) EXPECT_EQ(list->addIndex(1, &caption, 10), i);
  EXPECT_EQ(list->addIndex(1, &caption, 10), -1);
  list->initFinish();
  EXPECT_EQ(list->Max_height(), 829);
  EXPECT_EQ(shownItems().size(), 63U);
  EXPECT_EQ(indexAt(1160), 63);
  EXPECT_EQ(indexAt(1169), -100) << "below the last one of them";
  list->initIndex();
  EXPECT_EQ(indexAt(1160), -1);
}

TEST_F(MainListTest, RefusesTextsThatAreTooLong) {
  open();
  const SKIA_Text endless = endlessText('x');
  const SKIA_Text tooLong = textRecord(std::string(127, 'x'));
  const SKIA_Text longest = textRecord(std::string(126, 'x'));
  EXPECT_EQ(list->addIndex(1, nullptr, 1), -1);
  EXPECT_EQ(list->addIndex(1, &endless, 1), -1);
  EXPECT_EQ(list->addIndex(1, &tooLong, 1), -1);
  EXPECT_EQ(list->addIndex(1, &longest, 1), 0);
  MainList endlessTitle(std::string(300, 't').c_str());
  endlessTitle.initFinish();
  EXPECT_EQ(shown(endlessTitle).at(1).text.text, std::string(127, 't'));
}

TEST_F(MainListTest, ItemsAreChangedByNumber) {
  open();
  fill({1, 1});
  for (const int item : {1, 2, 63, 64, -1, INT_MIN, INT_MAX}) {
    list->setText(item, "Keys and more", 4);
    list->setFontSize(item, 9);
    list->setTextColor(item, 10);
    list->setBGColor(item, 11);
  }
  EXPECT_EQ(shownItems(), (std::vector{textbox({0, 443, 1440, 100, 11}, {"Keys", 10, 1, 9})}));
  list->setText(1, "Led", 3);
  EXPECT_EQ(shownItems().front().text.text, "Led");
  EXPECT_STREQ(list->items[1].text.text, "Leds") << "the old tail";
  for (const unsigned int length : {0U, 127U, UINT_MAX}) list->setText(1, "never", length);
  list->setText(1, nullptr, 3);
  EXPECT_EQ(shownItems().front().text.text, "Led");
  list->setText(1, std::string(126, 'y').c_str(), 126);
  EXPECT_EQ(shownItems().front().text.text, std::string(126, 'y'));
  list->setListType(1, 0);
  EXPECT_TRUE(shownItems().empty());
}

TEST_F(MainListTest, StatusTextsAreChangedByNumber) {
  open(1);
  fill({});
  list->setTextBattery("80 %, full", 4);
  list->setTextTa("USB", 3);
  list->setTextBrightness("50", 2);
  for (int option = 2; option < 8; ++option) list->setTextOption(option - 1, "status", option);
  for (const int option : {-1, 8, INT_MIN, INT_MAX}) list->setTextOption(option, "never", 5);
  for (const int length : {0, -1, 127, INT_MIN, INT_MAX}) list->setTextOption(0, "never", length);
  list->setTextOption(0, nullptr, 3);
  list->setTitleBGColor(5);
  std::string words;
  for (const Drawing& each : shown(*list)) words += each.text.text + '|';
  EXPECT_EQ(words, "|Menu|50|80 %|st|sta|stat|statu|status|status|" + std::string("|"));
}

struct SlopCase : Row {
  int pressedAt;
  std::vector<Spot> moves;
  int releasedAt;
  const char* calls;
};

class MainListSlop : public MainListTest, public testing::WithParamInterface<SlopCase> {};

// The slop is 28 pixels; the list is too short to scroll.
TEST_P(MainListSlop, TellsAClickFromADrag) {
  open();
  fill({1, 1, 2});
  EXPECT_TRUE(press(*list, {9, GetParam().pressedAt}, 2));
  for (const Spot& by : GetParam().moves) EXPECT_TRUE(move(by.x, by.y));
  EXPECT_TRUE(release(*list, {9, GetParam().releasedAt}, 2));
  EXPECT_EQ(calls, GetParam().calls);
}

INSTANTIATE_TEST_SUITE_P(
    Moves, MainListSlop,
    testing::Values(SlopCase{{"Still"}, 500, {}, 500, "pcr"},
                    SlopCase{{"AsFarAsAllowed"}, 500, {{14, -28}, {14, 0}}, 500, "pcr"},
                    SlopCase{{"OneMore"}, 500, {{0, 28}, {0, 1}}, 500, "pr"},
                    SlopCase{{"OneMoreBack"}, 500, {{-28, 0}, {-1, 0}}, 500, "pr"},
                    SlopCase{{"ThereAndBack"}, 500, {{0, 29}, {0, -29}}, 500, "pr"},
                    SlopCase{{"OnAnotherItem"}, 500, {}, 400, "pr"},
                    SlopCase{{"OnASeparator"}, 600, {}, 600, "pr"},
                    SlopCase{{"InTheGap"}, 500, {}, 543, "pr"},
                    SlopCase{{"OffTheScreen"}, 500, {}, INT_MAX, "pr"}),
    rowName);

TEST_F(MainListTest, ItemsAreHitWithinTheirEdges) {
  open();
  fill({1, 1});
  EXPECT_EQ(indexAt(340), -1);
  EXPECT_EQ(platform().takeLog(),
            logLines(kDebug, {"[MAINLIST] position2index= 0340 < 0340 > 0440",
                              "[MAINLIST] position2index= 0443 < 0340 > 0543"}));
  EXPECT_EQ(indexAt(341), 0);
  EXPECT_EQ(indexAt(439), 0);
  EXPECT_EQ(indexAt(440), -1);
  EXPECT_EQ(indexAt(444), 1);
  EXPECT_EQ(indexAt(INT_MIN), -1);
}

TEST_F(MainListTest, OneFingerHoldsIt) {
  open();
  fill({1, 1});
  EXPECT_FALSE(press(*list, {9, 339}, 2)) << "the title";
  EXPECT_TRUE(press(*list, {9, 340}, 2));
  EXPECT_EQ(list->isSelect(), 3);
  platform().takeLog();
  EXPECT_FALSE(press(*list, {9, 400}, 1));
  EXPECT_FALSE(move(0, 5, 1));
  EXPECT_FALSE(release(*list, {9, 400}, 1));
  EXPECT_EQ(platform().takeLog(), logLines(kDebug, {"[MAINLIST] onRecvEvent-> T:1, F:1",
                                                    "[MAINLIST] onRecvEvent-> T:2, F:1"}));
  EXPECT_FALSE(longPress(*list, {9, 400}, 2));
  EXPECT_TRUE(offer(*list, keyEvent(MW::kEventKeyPress, 5)));
  EXPECT_TRUE(offer(*list, keyEvent(MW::kEventKeyRelease, 5)));
  EXPECT_EQ(platform().takeLog(), logLines(kDebug, {"[MAINLIST] key pressed sym = 5",
                                                    "[MAINLIST] key onReleaseKey sym = 5"}));
  EXPECT_TRUE(release(*list, {9, 10}, 2));
  EXPECT_EQ(calls, "pkKr");
  EXPECT_EQ(list->isSelect(), 0);
  press(*list, {9, 400}, 2);
  list->lcdOn(1);
  EXPECT_EQ(list->isSelect(), 3) << "the panel was on";
  list->lcdOn(0);
  EXPECT_EQ(list->isSelect(), 0);
  EXPECT_FALSE(offer(*list, keyEvent(MW::kEventUser, 5)));
  EXPECT_FALSE(list->onRecvEvent(nullptr, 0));
}

TEST_F(MainListTest, ScrollsBetweenItsEnds) {
  open();
  fill(std::vector<int>(30, 1));  // 3087 high, 867 too many
  const auto dragged = [](int by) {
    EXPECT_TRUE(move(0, by));
    return 100 + 340 - shownItems().front().rect.y;  // how much of the first one is out of view
  };
  press(*list, {9, 400}, 2);
  EXPECT_EQ(dragged(50), -3) << "the top: the second item is the first that is drawn";
  EXPECT_EQ(dragged(-10), -3 + 10);
  EXPECT_EQ(dragged(-10000), -3 + 867 - 8 * 103);
  EXPECT_EQ(dragged(INT_MIN), -3 + 867 - 8 * 103);
  EXPECT_EQ(indexAt(2559), 29) << "the last one ends with the list";
  EXPECT_EQ(dragged(INT_MAX), -3);
  EXPECT_EQ(calls, "psssss");
}

TEST_F(MainListTest, ScrollsAsSoonAsItFillsTheList) {
  setScreen(1440, 545);  // the list is 205 high
  open();
  fill({1, 1});  // 203
  press(*list, {9, 400}, 2);
  move(0, -10);
  EXPECT_EQ(list->move_key_down(0), 1);
  EXPECT_EQ(indexAt(340), 0) << "a pixel up, for the gap below the item";
  setScreen(1440, 543);
  list->setRect(0);
  move(0, -10);
  EXPECT_EQ(calls, "ps");
  EXPECT_EQ(indexAt(341), 0) << "nowhere to go";
}

TEST_F(MainListTest, KeysMoveOverSelectableItemsIntoView) {
  open();
  std::vector<int> kinds(30, 1);
  kinds[3] = 2;
  kinds[28] = kinds[29] = 3;
  fill(kinds);
  EXPECT_EQ(list->move_key_up(0), -100);
  for (const int expected : {1, 2, 4}) EXPECT_EQ(list->move_key_down(9), expected);
  int reached = 4;
  while (reached < 20) reached = list->move_key_down(0);
  EXPECT_EQ(indexAt(341), 0) << "still at the top";
  EXPECT_EQ(list->move_key_down(0), 21);
  EXPECT_EQ(indexAt(2459), 21) << "its gap stands on the list's foot";
  EXPECT_EQ(indexAt(2458 - 2 * 103), 18 + 1) << "scrolled by 46";
  while (list->move_key_down(0) != -100) ++reached;
  EXPECT_EQ(reached, 26);
  const int before = shownItems().front().rect.y;
  EXPECT_EQ(list->move_key_down(0), -100);
  EXPECT_EQ(shownItems().front().rect.y, before) << "nothing moves at the end";
  EXPECT_EQ(list->move_key_up(0), 26);
  EXPECT_EQ(shownItems().front().rect.y, before) << "in view already";
  while (list->move_key_up(0) != -100) {
  }
  EXPECT_EQ(indexAt(341), 0);
}

TEST_F(MainListTest, TakesAnyHeightAndScreen) {
  for (const int size : kHostileSizes) {
    setScreen(size, size);
    open(1);
    const SKIA_Text caption = textRecord("x");
    for (const int height : {INT_MAX, INT_MAX, INT_MIN, 0, -1}) list->addIndex(1, &caption, height);
    list->initFinish();
    press(*list, {9, 999}, 2);
    for (const int by : {INT_MIN, INT_MAX}) move(by, by);
    release(*list, {INT_MIN, INT_MAX}, 2);
    int moved = 0;
    while (list->move_key_down(0) != -100) ++moved;
    while (list->move_key_up(0) != -100) ++moved;
    EXPECT_EQ(moved, 8) << size;
    EXPECT_GE(shown(*list).size(), 11U);
  }
  EXPECT_EQ(list->Max_height(), INT_MAX);
}

}  // namespace
