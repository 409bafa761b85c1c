#include <MW/mpd_wid.h>

#include "support/drawings.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using std::pair;
using MpdWidTest = WidgetTest;

struct List : MW::MpdWid {
  explicit List(const std::string& lines) : MpdWid(nullptr) { read(lines); }
  void read(const std::string& lines) { cal_line(lines.data(), static_cast<int>(lines.size())); }
};
// What stands in so many cells of the rows, and behind the first how far below the list's top: on
// the default screen of 1440 x 2560 that is 561, and the list is 1999 high.
std::string rows(List& list, std::size_t cells = 1) {
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
// With the rows that they become: marker and place, head, level, name, value.
const std::vector<pair<std::string, std::string>> kTexts = {
    {"12 [2] [MPDIA] Wi-Fi]ok]\nend", "[*]|0 12 [2] [MPDIA] Wi-|[2]|Wi-Fi|ok]|"},
    {"[1]" + kWide + "\u00e4[MPDIA]:v\n", "[*]|0 [1]" + kWide + "|[1]|no name|:v|"},
    {"\n[ -5][MPDIA]]]x\n", "[*]|0 \n[ -5][MPDIA]]]x|[-5]||x|"},
    {"[+-7][MPDIA]\n", "[*]|0 [+-7][MPDIA]|[1]|no name||"},
    {"]2\n[2147483648][MPDIA]\n\n[MPDIA]", "[>]|0 ]2|[1]|no name|]2|[*]|142 |[1]|no name||"},
    {"[0] [MPDIA] " + kLong + ']' + kLong + '\n',
     "[*]|0 [0] [MPDIA] xxxxxx|[1]|" + kLong.substr(173) + '|' + kLong.substr(173) + '|'},
};

TEST_F(MpdWidTest, ReadsAnyText) {
  List list("");
  for (const auto& [lines, drawn] : kTexts) {
    list.read(lines);
    list.init_mpd_buf();  // the rows do not need it
    EXPECT_EQ(rows(list, 5), drawn);
  }
  for (const int index : {-1, 64, INT_MAX}) list.setListType(index, 0);
  for (const int index : {-1, 64, INT_MAX}) list.addIndex(index, true, 1, "", "", nullptr);
  for (const auto& [length, count] : {pair(99, 3U), pair(3, 2U), pair(0, 0U), pair(INT_MIN, 0U)}) {
    list.cal_line("a\nb\nc\n\0d\n", length);
    EXPECT_EQ(shown(list).size(), 5 * count + 2) << "to the NUL, or the byte of that number";
  }
  list.read(std::string(99, '\n'));
  EXPECT_EQ(platform().takeLog().back().message, "[MPDWID] addIndex, index : 63");
}

TEST_F(MpdWidTest, RowsOpenAndCloseByDoubleTaps) {
  List list("[1]\n[2]\n[3]\n[2]\n[1]\n[2]\n[3]\n");
  EXPECT_EQ(rows(list), "[>]|0 [>]|142 [*]|284 ") << "the last row is never hidden";
  // The third tap, one that comes too late, one on an edge, and one on another row count for none.
  std::istringstream taps("0 141 0 1 1 1 501 143 502 143 503 142 2000 9 2001 143 4000 1 4499 1");
  std::string seen;
  for (int time = 0, y = 0; taps >> time >> y;) {
    platform().ticks = 1000 + static_cast<unsigned int>(time);
    press(list, {30, 561 + y});
    release(list, {30, 561 + y});
    seen += std::to_string(shown(list).size() / 5);
  }
  EXPECT_EQ(seen, "3555555663");
  EXPECT_EQ(rows(list) + std::to_string(list.Max_height()), "[>]|0 [>]|142 [*]|284 425");
}

TEST_F(MpdWidTest, ScrollsBetweenItsEnds) {
  List list(std::string(21, '\n'));  // 20 rows, 2839 high, 840 too many
  std::string seen;
  for (const int by : {0, -143, 1, INT_MIN, INT_MAX, -500, 499, 500}) {
    if (by == 499) list.read("a\nb\n");  // few rows come back from above at once or not at all
    rows(list);
    list.onHover({0, 0, 0, 0, 0, by});
    seen += rows(list).substr(0, 8);
  }
  EXPECT_EQ(seen, "[*]|0 [*[*]|-1 [[*]|-142[*]|-130[*]|0 [*[*]|-74 [*]|0 [*");
  EXPECT_EQ(list.position2index({0, 0, 0, 2 * 561 + 1, 0, 0}), 0) << "the top counts twice";
}

std::string told;

TEST_F(MpdWidTest, TellsClicksFromDragsAndMayBeDeleted) {
  for (const auto& [slip, expected] : {pair(28, "pcr"), pair(-29, "pr"), pair(0, "pr")}) {
    auto* const list = new List("a\nb\n");
    list->setListType(0, slip == 0 ? 1 : 0);
    list->press_cb = [](auto*, auto*) { told += 'p'; };
    list->click_cb = [](auto*, auto*) { told += 'c'; };
    list->release_cb = [](auto*, auto* sender) { told += 'r', delete sender; };
    EXPECT_FALSE(press(*list, {30, 560}));
    press(*list, {30, 561});
    for (const int by : {slip, -slip}) list->inClick(0, by);
    offer(*list, {MW::kEventLongPress, {{0, 1, 30, 561, 0, 0}}});
    EXPECT_EQ(platform().takeLog().back().message, "[MPDWID] onRecvEvent-> T:3, F:1");
    release(*list, {30, 0});
    EXPECT_EQ(std::exchange(told, ""), expected);
  }
}

}  // namespace
