#include <MW/main_list.h>
#include <android/log.h>

#include <array>
#include <thread>

#include <brimol3_widget_test/drawings.h>
#include "support/play_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MainListTest = WidgetTest;

// Items 100 high, captioned by their numbers. On the default screen of 1440 x 2560 the list begins
// at 340 and is 2220 high.
struct Menu : MW::MainList {
  using MainList::items, MainList::shown, MainList::stateLock;
  explicit Menu(const std::vector<int>& kinds, int listMode = kPlain) : MainList("Menu", listMode) {
    for (const int kind : kinds) add(kind);
    initFinish();
  }
  int add(int kind) {
    const SKIA_Text caption = textRecord(std::to_string(count), 7, 1, 50);
    return addIndex(kind, &caption, 100);
  }
  int at(int y) { return position2index({0, 0, 9, y, 0, 0}); }
};

std::unique_ptr<Menu> heardMenu(const std::vector<int>& kinds) {
  auto menu = std::make_unique<Menu>(kinds);
  menu->setActive(1);
  menu->pressCallback = [](auto* mouse, auto*) { noteTouch("press", mouse); };
  menu->clickCallback = [](auto* mouse, auto*) { noteTouch("click", mouse); };
  menu->releaseCallback = [](auto* mouse, auto*) { noteTouch("release", mouse); };
  menu->scrollCallback = [](auto* mouse, auto*) { noteTouch("scroll", mouse); };
  menu->keyPressCallback = [](auto* key, auto*) { note("down" + std::to_string(key->code)); };
  menu->keyReleaseCallback = [](auto* key, auto*) { note("up" + std::to_string(key->code)); };
  return menu;
}
Maker menuOf(const std::vector<int>& kinds) {
  return [=] { return heardMenu(kinds); };
}
const PlaysOn kShort = {menuOf({1, 1, 2})};
const PlaysOn kLong = {menuOf(std::vector<int>(30, 1))};  // 3087 high, 867 too many
// Where the first item that is drawn stands.
Step top() {
  return look([](MW::Widget& menu) { return shown(menu).front().rect.y; });
}
Step moveDown() {
  return look<Menu>([](Menu& menu) { return menu.move_key_down(0); });
}
Step moveUp() {
  return look<Menu>([](Menu& menu) { return menu.move_key_up(0); });
}

const PlayTests kPlays = {
    kShort("ClicksTheItemThatWasPressed",
           {press(9, 341), drag(28, 28), release(9, 439), press(9, 500), drag(28, 28), release()},
           "press+ + click release+ press+ + click release+"),
    kShort("AnotherItemIsNotClicked", {press(9, 500), release(9, 400)}, "press+ release+"),
    kShort("AnItemThatIsNotSelectable", {press(9, 600), release()}, "press+ release+"),
    kShort("ALongDragIsNoClick", {press(9, 500), drag(0, 29), release()}, "press+ + release+"),
    kShort(
        "OneFingerHoldsItAndIsFollowed",
        {finger(2), press(9, 339), press(9, 340), lookAtHold(), finger(1), press(9, 400),
         drag(0, 5), release(), lookAtLog(), finger(2), longPress(), release(9, 10), lookAtHold()},
        "- press+ <held 3> - - - <[MAINLIST] onRecvEvent-> T:2, F:1> - release+ <held 0>"),
    kShort("KeysAreToldAndMoveNothing",
           {keyDown(274), lookAtLog(), keyUp(274), lookAtLog(), plug(1), moveUp()},
           "down274+ <[MAINLIST] key pressed sym = 274> up274+ "
           "<[MAINLIST] key onReleaseKey sym = 274> - <-100>"),
    kShort("ADarkPanelLetsTheFingerGo",
           {press(9, 400), call(&MW::Widget::lcdOn, 1), lookAtHold(), call(&MW::Widget::lcdOn, 0),
            lookAtHold()},
           "press+ <held 1> <held 0>"),
    kLong("ScrollsBetweenItsEnds",
          {press(9, 400), drag(0, 50), top(), drag(0, -10), top(), drag(0, INT_MIN), top()},
          "press+ scroll+ <443> scroll+ <433> scroll+ <400>"),
    PlaysOn{menuOf({2, 1, 1, 2, 3, 1, 2})}(
        "KeysFindSelectableItems",
        {moveUp(), moveDown(), moveDown(), moveDown(), moveUp(), moveUp(), moveUp()},
        "<-100> <2> <5> <-100> <2> <1> <-100>"),
};

// A log line says what holds while it is written: a pressed list is held already when it asks which
// item was hit, and a hidden one gets no more events.
TEST_F(MainListTest, LogsWhatItIsByThen) {
  const Step hear = call([](MW::Widget&) {
    __android_log_set_logger([](const __android_logger_data*, const char* line) {
      if (stage.widget == nullptr) return;
      const std::string active = stage.widget->isActive() ? " active" : "";
      stage.journal += line + active + std::to_string(stage.widget->isSelect()) + ' ';
    });
  });
  const Step hide = call(&MW::Widget::hide);
  EXPECT_EQ(played(kShort.make, {hear, draw(), draw(), press(9, 400), hide, hide}),
            "[MAINLIST] SHOW->Menu active0 [MAINLIST] position2index= 0340 < 0400 > 0440 active1 "
            "press+ [MAINLIST] HIDE<-Menu0");
}

// Hidden while a pass draws it, it is inactive first: no later pass takes it for shown again.
TEST_F(MainListTest, IsInactiveBeforeItIsNotShown) {
  Menu menu({1});
  menu.setActive(1);
  menu.show(0);
  std::jthread hiding;
  {
    const std::lock_guard drawing(menu.stateLock);
    hiding = std::jthread([&] { menu.hide(); });
    while (menu.isActive()) std::this_thread::yield();  // for ever in another order
    EXPECT_EQ(menu.shown, 1);
  }
  hiding.join();
  EXPECT_EQ(menu.shown, 0);
}

TEST_F(MainListTest, KeysScrollTheirItemIntoView) {
  Menu menu(std::vector<int>(30, 1));
  while (menu.move_key_down(0) < 20) continue;
  EXPECT_EQ(menu.at(341), 0) << "still at the top";
  EXPECT_EQ(menu.move_key_down(0), 21);
  EXPECT_EQ(menu.at(2556), 21);
  EXPECT_EQ(menu.at(2557), -1) << "its gap stands on the list's foot";
  while (menu.move_key_down(0) >= 0) continue;
  while (menu.move_key_up(0) > 1) continue;
  EXPECT_EQ(menu.at(341), 1) << "exactly at the top";
  EXPECT_EQ(shown(menu).front().text.text, "2") << "where none is drawn";
  while (menu.move_key_up(0) >= 0) continue;
  menu.onHover({0, 0, 0, 0, 0, -500});
  EXPECT_EQ(menu.move_key_up(0), -100) << "it is the first";
  EXPECT_EQ(menu.at(341), 0) << "and back in sight";
}

TEST_F(MainListTest, IsFullAtSixtyFourItemsAndRefusesLongTexts) {
  const SKIA_Text tooLong = textRecord(std::string(127, 'x'));
  MW::MainList open("Menu");
  EXPECT_TRUE(shown(open).empty()) << "not even a title before it is finished";
  EXPECT_EQ(open.addIndex(1, &tooLong, 1), -1);
  EXPECT_EQ(open.addIndex(1, nullptr, 1), -1);
  Menu menu(std::vector<int>(65, 1));
  EXPECT_EQ(menu.Max_height(), 64 * 103 - 3);
  EXPECT_EQ(menu.add(1), -1);
  menu.onHover({0, 0, 0, 0, 0, INT_MIN});
  EXPECT_EQ(menu.at(2559), 63);
  EXPECT_EQ(menu.at(2560), -100) << "below the last one of them";
}

TEST_F(MainListTest, AnEndTakesTheItemsBehindItAway) {
  Menu menu({1, 1, 1});
  menu.setListType(1, MW::MainList::kEnd);
  EXPECT_EQ(words(shown(menu)), "Menu||||") << "the first one is not drawn at rest";
  EXPECT_EQ(menu.at(500), -1);
  EXPECT_EQ(menu.Max_height(), 203);
  menu.initIndex();
  EXPECT_EQ(menu.add(1), -1) << "it is finished";
}

TEST_F(MainListTest, TextsAreChangedByNumber) {
  Menu menu({1, 1}, MW::MainList::kExtended);
  for (const int item : {1, 2, 63, 64, -1, INT_MIN, INT_MAX}) {
    menu.setText(item, "Keys and more", 4);
    menu.setTextOption(item, "8 bit and more", 5);
  }
  menu.setText(0, "F", 1);
  menu.setText(1, "Led", 3);
  for (const unsigned int length : {0U, 127U, UINT_MAX}) menu.setText(1, "never", length);
  menu.setText(1, nullptr, 3);
  menu.setTextBattery("80 %", 4);
  EXPECT_STREQ(menu.items[0].text.text, "F");
  EXPECT_STREQ(menu.items[1].text.text, "Leds") << "the old tail";
  EXPECT_EQ(words(shown(menu)).substr(0, 26), "Led|Menu||80 %|8 bit|8 bit");
}

// Screens that no machine has, and an item as high.
TEST_F(MainListTest, TakesAnyScreenAndHeight) {
  const SKIA_Text endless = {};
  for (const int w : {1, 7, -1, INT_MIN, INT_MAX}) {
    for (const int h : {1, 341, -1, INT_MIN, INT_MAX}) {
      setScreen(w, h);
      MW::MainList menu("Menu");
      for (int i = 0; i < 3; ++i) menu.addIndex(1, &endless, h);
      menu.initFinish();
      for (const int by : {INT_MIN, INT_MAX}) menu.onHover({0, 0, 0, INT_MAX, by, by});
      menu.move_key_down(0);
      menu.move_key_up(0);
      EXPECT_EQ(shown(menu).back().rect.y, h) << "the foot";
    }
  }
}

}  // namespace
