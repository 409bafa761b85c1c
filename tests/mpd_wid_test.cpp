#include <MW/mpd_wid.h>

#include "support/drawings.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::MpdWid;
using std::pair;
using MpdWidTest = WidgetTest;

void read(MpdWid& list, const std::string& lines) {
  list.cal_line(lines.c_str(), static_cast<int>(lines.size()));
}
// What stands in so many cells of the rows, and behind the first how far below the list's top: on
// the default screen of 1440 x 2560 that is 561, and the list is 1999 high.
std::string rows(MpdWid& list, std::size_t cells = 1) {
  std::ostringstream found;
  const std::vector<Drawing> all = shown(list);
  for (std::size_t i = 0; i + 2 < all.size(); ++i) {
    if (i % 5 < cells) found << all[i].text.text << '|';
    if (i % 5 == 0) found << all[i].rect.y - 561 << ' ';
  }
  return found.str();
}

const std::string kWide = "\u00e4\u00e4\u00e4\u00e4\u00e4\u00e4\u00e4";
const std::string kLong(300, 'x');
const std::string kCut(127, 'x');
// With the rows that they become: marker and place, head, level, name, value.
const std::vector<pair<std::string, std::string>> kTexts = {
    {"12 [2] [MPDIA] Wi-Fi]ok]\nend", "[*]|0 12 [2] [MPDIA] Wi-|[2]|Wi-Fi|ok]|"},
    {"[1]" + kWide + "\u00e4[MPDIA]:v\n", "[*]|0 [1]" + kWide + "|[1]|no name|:v|"},
    {"\n[ -5][MPDIA]]]x\n", "[*]|0 \n[ -5][MPDIA]]]x|[-5]||x|"},
    {"]2\n\n[MPDIA]", "[*]|0 ]2|[1]|no name|]2|[*]|142 |[1]|no name||"},
    {"[-2147483649\n", "[*]|0 [-2147483649|[-2147483648]|no name|[-2147483649|"},
    {"[2147483648][MPDIA]\n", "[*]|0 [2147483648][MPDIA|[2147483647]|no name||"},
    {"[0] [MPDIA] " + kLong + ']' + kLong + '\n',
     "[*]|0 [0] [MPDIA] xxxxxx|[1]|" + kCut + '|' + kCut + '|'},
};

TEST_F(MpdWidTest, ReadsAnyText) {
  MpdWid list(nullptr);
  for (const auto& [lines, drawn] : kTexts) {
    read(list, lines);
    list.init_mpd_buf();  // the rows do not need it
    EXPECT_EQ(rows(list, 5), drawn);
  }
  for (const auto& [length, count] : {pair(99, 3U), pair(3, 2U), pair(0, 0U), pair(INT_MIN, 0U)}) {
    list.cal_line("a\nb\nc\n\0d\n", length);
    for (const int index : {-1, 3, 63, 64, INT_MAX}) list.setListType(index, 0);
    EXPECT_EQ(shown(list).size(), 5 * count + 2) << "to the NUL, or the byte of that number";
  }
  for (const int index : {-1, 64}) list.addIndex(index, true, 1, nullptr, nullptr, nullptr);
  read(list, std::string(99, '\n'));
  EXPECT_EQ(platform().takeLog().back().message, "[MPDWID] addIndex, index : 63");
}

TEST_F(MpdWidTest, RowsOpenAndCloseByDoubleTaps) {
  MpdWid list("");
  read(list, "[1]\n[2]\n[3]\n[2]\n[1]\n[2]\n[3]\n");
  const std::string shut = "[>]|0 [>]|142 [*]|284 ";  // the last row is never hidden
  const std::string open = "[V]|0 [>]|142 [*]|284 [>]|426 [*]|568 ";
  const std::string wide = "[V]|0 [V]|142 [*]|284 [*]|426 [>]|568 [*]|710 ";
  for (const auto& [time, y, expected] : {std::tuple(1000U, 141, shut),
                                          {1400U, 1, open},
                                          {1500U, 1, open},
                                          {2000U, 143, open},
                                          {2501U, 143, open},
                                          {2600U, 142, open},
                                          {4000U, 283, open},
                                          {4100U, 143, wide},
                                          {6000U, 1, wide},
                                          {6499U, 1, shut}}) {
    platform().ticks = time;
    press(list, {30, 561 + y});
    release(list, {30, 561 + y});
    EXPECT_EQ(rows(list), expected) << time;
  }
}

TEST_F(MpdWidTest, ScrollsBetweenItsEnds) {
  MpdWid list("");
  read(list, std::string(21, '\n'));  // 20 rows, 2839 high, 840 too many
  for (const auto& [by, first] : {pair(0, "[*]|0 "),
                                  {-143, "[*]|-1 "},
                                  {1, "[*]|-142 "},
                                  {INT_MIN, "[*]|-130 "},
                                  {INT_MAX, "[*]|0 "},
                                  {-500, "[*]|-74 "}}) {
    list.onHover({0, 0, 0, 0, 0, by});
    EXPECT_EQ(rows(list).find(first), 0U) << by;
  }
  read(list, "a\nb\n");
  rows(list);
  list.onHover({0, 0, 0, 0, 0, 499});
  EXPECT_EQ(rows(list), "") << "few rows come back from above at once or not at all";
  list.onHover({0, 0, 0, 0, 0, 500});
  EXPECT_EQ(rows(list), "[*]|0 [*]|142 ");
  EXPECT_EQ(list.position2index({0, 0, 0, 2 * 561 + 1, 0, 0}), 0) << "the top counts twice";
}

std::string told;

TEST_F(MpdWidTest, TellsClicksFromDragsAndMayBeDeleted) {
  for (const auto& [slip, expected] : {pair(28, "pcr"), pair(-29, "pr")}) {
    auto* const list = new MpdWid("");
    read(*list, "a\nb\n");
    list->setListType(0, 0);
    list->press_cb = [](auto*, auto*) { told += 'p'; };
    list->click_cb = [](auto*, auto*) { told += 'c'; };
    list->release_cb = [](auto*, MpdWid* sender) { told += 'r', delete sender; };
    EXPECT_FALSE(press(*list, {30, 560}));
    press(*list, {30, 561});
    for (const int by : {slip, -slip}) list->inClick(0, by);
    release(*list, {30, 0});
    EXPECT_EQ(std::exchange(told, ""), expected);
  }
}

}  // namespace
