#include <MW/main_list.h>

#include <array>
#include <memory>

#include "support/drawings.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words

struct Head {
  int w, h;
  const char* places;  // brightness, address, signal, BLE, the edge at the foot
};

constexpr auto kHeads = std::to_array<Head>({
    {1440, 2560, "864,17 576x130|475,340 475x65|950,340 475x65|576,425 576x65|0,2560 1440x2|"},
    {1080, 1920, "648,17 432x130|356,340 356x65|712,340 356x65|432,425 432x65|0,1920 1080x2|"},
    {720, 1280, "432,17 288x130|237,340 237x65|474,340 237x65|288,425 288x65|0,1280 720x2|"},
    {2560, 1440, "1536,17 1024x130|844,340 844x65|1688,340 844x65|1024,425 1024x65|0,1440 2560x2|"},
    {1081, 1921, "648,17 433x130|356,340 356x65|712,340 356x65|432,425 432x65|0,1921 1081x2|"},
});

// On the default screen of 1440 x 2560 the list begins at 340 and is 2220 high.
struct List : MW::MainList {
  using MainList::items;
  // Items 100 high, captioned by their numbers.
  explicit List(const std::vector<int>& kinds, int listMode = 0) : MainList("Menu", listMode) {
    for (const int kind : kinds) {
      EXPECT_EQ(add(kind), filled < 64 ? filled : -1);
      ++filled;
    }
    initFinish();
  }
  int add(int kind) {
    const SKIA_Text caption = textRecord(std::to_string(filled), 7, 1, 50);
    return addIndex(kind, &caption, 100);
  }
  void scrollBy(int by) { onHover({0, 0, 0, 0, 0, by}); }
  int at(int y) { return position2index({0, 0, 9, y, 0, 0}); }
  int filled = 0;
};

using MainListTest = WidgetTest;

TEST_F(MainListTest, StatusTextsStandByTheScreensWidth) {
  for (const Head& row : kHeads) {
    setScreen(row.w, row.h);
    List list({}, 1);
    const std::vector<Drawing> all = shown(list);
    EXPECT_EQ(places({all.at(2), all.at(6), all.at(7), all.at(9), all.at(10)}), row.places);
  }
}

TEST_F(MainListTest, IsFullAtSixtyFourItemsAndRefusesLongTexts) {
  const SKIA_Text tooLong = textRecord(std::string(127, 'x'));
  MW::MainList open("Menu");
  EXPECT_TRUE(shown(open).empty()) << "not even a title before it is finished";
  EXPECT_EQ(open.addIndex(1, &tooLong, 1), -1);
  EXPECT_EQ(open.addIndex(1, nullptr, 1), -1);
  List list(std::vector<int>(65, 1));
  EXPECT_EQ(list.Max_height(), 64 * 103 - 3);
  list.scrollBy(INT_MIN);
  EXPECT_EQ(list.at(2559), 63);
  EXPECT_EQ(list.at(2560), -100) << "below the last one of them";
}

TEST_F(MainListTest, TextsAreChangedByNumber) {
  List list({1, 1}, 1);
  for (const int item : {1, 2, 63, 64, -1, INT_MIN, INT_MAX}) {
    list.setText(item, "Keys and more", 4);
    list.setTextOption(item, "8 bit and more", 5);
  }
  EXPECT_EQ(list.add(1), -1) << "it is finished";
  list.setText(1, "Led", 3);
  for (const unsigned int length : {0U, 127U, UINT_MAX}) list.setText(1, "never", length);
  list.setText(1, nullptr, 3);
  list.setTextBattery("80 %", 4);
  EXPECT_STREQ(list.items[1].text.text, "Leds") << "the old tail";
  EXPECT_EQ(words(shown(list)),
            "Led|Menu||80 %|8 bit|8 bit|192.168.100.1|-120 dbm|Testmode: |BLE: |");
}

TEST_F(MainListTest, ScrollsBetweenItsEnds) {
  List list(std::vector<int>(30, 1));  // 3087 high, 867 too many
  list.scrollBy(50);
  EXPECT_EQ(shown(list).front().rect.y, 443) << "an item whose top is the list's edge is not drawn";
  list.scrollBy(-10);
  EXPECT_EQ(shown(list).front().rect.y, 433);
  list.scrollBy(INT_MIN);
  EXPECT_EQ(shown(list).front().rect.y, 340 - 867 + 9 * 103);
  setScreen(1440, 546);
  EXPECT_EQ(shown(*std::make_unique<List>(std::vector(3, 1))).at(1).call, Call::Box) << "the foot";
  setScreen(1440, 542);
  List tight({1, 1});
  tight.scrollBy(-10);
  EXPECT_EQ(tight.at(340), 0) << "a pixel too high";
}

TEST_F(MainListTest, KeysMoveOverSelectableItemsIntoView) {
  std::vector<int> kinds(30, 1);
  kinds[0] = kinds[3] = kinds[29] = 2;
  List list(kinds);
  EXPECT_EQ(list.move_key_up(0), -100) << "the first selectable one";
  for (const int expected : {2, 4}) EXPECT_EQ(list.move_key_down(9), expected);
  while (list.move_key_down(0) < 20) EXPECT_EQ(list.at(341), 0) << "still at the top";
  EXPECT_EQ(list.move_key_down(0), 21);
  EXPECT_EQ(list.at(2556), 21);
  EXPECT_EQ(list.at(2557), -1) << "its gap stands on the list's foot";
  for (int i = 0; i < 30; ++i) list.move_key_down(0);
  for (int i = 0; i < 30; ++i) list.move_key_up(0);
  EXPECT_EQ(list.at(341), 1) << "the topmost selectable one";
}

}  // namespace
