#include <MW/mpd_wid.h>

#include <brimol3_widget_test/drawings.h>
#include "support/play_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MpdWidTest = WidgetTest;

constexpr int kTop = 561;  // of the list on the default screen; it is 1999 high

struct Results : MW::MpdWid {
  explicit Results(const std::string& lines) : MpdWid(nullptr) { read(lines); }
  void read(const std::string& lines) { cal_line(lines.data(), static_cast<int>(lines.size())); }
};

// Five cells for each row; the header and the foot behind them.
std::vector<Drawing> cells(MW::Widget& results) {
  std::vector<Drawing> all = shown(results);
  all.resize(all.size() - 2);
  return all;
}
// The markers of the rows.
Step markers() {
  return look([](MW::Widget& results) {
    std::string found;
    const std::vector<Drawing> all = cells(results);
    for (std::size_t i = 0; i < all.size(); i += 5) found += all[i].text.text;
    return found;
  });
}
// How far below the list's top the first row stands.
Step top() {
  return look([](MW::Widget& results) {
    const std::vector<Drawing> all = cells(results);
    return all.empty() ? "none" : std::to_string(all[0].rect.y - kTop);
  });
}

// A part of what an event does, by hand.
Step byHand(void (*part)(Results& results, MW::event_data* event)) {
  return call<Results>([part](Results& results) {
    MW::event_data event = {.type = MW::kEventRelease, .mouse = stage.finger};
    part(results, &event);
  });
}
const Step kMpdPress = byHand([](Results& results, auto* event) { results.onMpdPress(event); });

Maker resultsOf(const std::string& lines, int listType = MW::MpdWid::kRow) {
  return [=] {
    auto results = std::make_unique<Results>(lines);
    results->setListType(0, listType);
    results->press_cb = [](auto* mouse, auto*) { noteTouch("press", mouse); };
    results->click_cb = [](auto* mouse, auto*) { noteTouch("click", mouse); };
    results->release_cb = [](auto* mouse, auto*) { noteTouch("release", mouse); };
    results->hover_cb = [](auto* mouse, auto*) { noteTouch("hover", mouse); };
    results->key_press_cb = [](auto* key, auto*) { note("down" + std::to_string(key->code)); };
    results->key_release_cb = [](auto* key, auto*) { note("up" + std::to_string(key->code)); };
    return results;
  };
}
// Drawn once, so that its rows are where they are seen.
std::unique_ptr<MW::Widget> tree() {
  auto results = std::make_unique<Results>("[1]\n[2]\n[3]\n[2]\n[1]\n[2]\n[3]\n");
  shown(*results);
  return results;
}
const Maker kTree = tree;
const PlaysOn kTwenty = {resultsOf(std::string(21, '\n'))};  // 2839 high, 840 too many
const PlaysOn kClickable = {resultsOf("a\nb\n", MW::MpdWid::kHitEnd)};

// A tap on so many pixels below the list's top.
struct Tap {
  unsigned int ms;
  int y;
};
Play tapped(const char* name, std::initializer_list<Tap> taps, const char* journal) {
  Steps steps;
  for (const auto& [ms, y] : taps) {
    steps.insert(steps.end(), {at(startTicks() + ms), press(30, kTop + y), release(), draw()});
  }
  steps.push_back(markers());
  return {name, kTree, steps, journal};
}

const PlayTests kPlays = {
    tapped("ADoubleTapOpensARow", {{0, 1}, {499, 141}}, "+ + + + <[V][>][*][>][*]>"),
    tapped("TheSecondTapSaysWhichRow", {{0, 1}, {1, 143}}, "+ + + + <[>][V][>][*]>"),
    tapped("AnOpenRowsChildOpensAlone", {{0, 1}, {1, 1}, {999, 143}, {1000, 143}},
           "+ + + + + + + + <[V][V][*][*][>][*]>"),
    tapped("AnEdgeIsNoRows", {{0, 142}, {1, 142}}, "+ + + + <[>][>][*]>"),
    tapped("TheLastRowDoesNotChange", {{0, 285}, {1, 285}}, "+ + + + <[>][>][*]>"),
    kTwenty("ScrollsBetweenItsEnds",
            {draw(), press(30, kTop), drag(0, -143), top(), drag(0, 93), top(), drag(0, INT_MAX),
             top(), drag(0, INT_MIN), top()},
            "press+ hover+ <-1> hover+ <-50> hover+ <0> hover+ <-130>"),
    kTwenty("FewRowsComeBackFromAboveAtOnceOrNotAtAll",
            {draw(), press(30, kTop), drag(0, -500),
             call<Results>([](Results& results) { results.read("a\nb\n"); }), top(), drag(0, 499),
             top(), drag(0, 500), top()},
            "press+ hover+ <none> hover+ <none> hover+ <0>"),
    kClickable("OnlyBeforeAnEndOfHitsItIsClicked", {press(30, kTop), release(30, 0)},
               "press+ click release+"),
    kClickable("ALongDragIsNoClick", {press(30, kTop), drag(0, -29), release()},
               "press+ hover+ release+"),
    kClickable(
        "OneFingerHoldsItAndIsFollowed",
        {finger(3), press(30, kTop - 1), press(30, kTop), lookAtHold(), finger(1), drag(1, 1),
         longPress(), lookAtLog(), finger(3), longPress(), release(0, 0), lookAtHold()},
        "- press+ <held 4> - - <[MPDWID] onRecvEvent-> T:3, F:1> - click release+ <held 0>"),
    kClickable(
        "EachPartOfAReleaseLetsTheFingerGo",
        {kMpdPress, lookAtHold(),
         byHand([](Results& results, auto* event) { results.onRelease(event->mouse); }),
         lookAtHold(), kMpdPress,
         byHand([](Results& results, auto* event) { results.onMpdRelease(event); }), lookAtHold()},
        "<held 1> release <held 0> <held 0>"),
    kClickable("InitStartsOver",
               {press(30, kTop), lookAtHold(), call<Results>(&Results::init_MpdWid), lookAtHold(),
                look(&MW::Widget::isActive)},
               "press+ <held 1> <held 0> <1>"),
    kClickable("KeysAreTold", {keyDown(9), lookAtLog(), keyUp(9), lookAtLog(), plug(9)},
               "down9+ <[MPDWID] key pressed sym = 9> up9+ <[MPDWID] key onReleaseKey sym = 9> -"),
};

const std::string kWide = "\u00e4\u00e4\u00e4\u00e4\u00e4\u00e4\u00e4";
const std::string kLong(300, 'x');

struct Line : Row {
  std::string text;
  std::string cells;  // of the first row: marker, head, level, name, value
};
const auto kLines = std::to_array<Line>({
    {"NameAndValue", "12 [2] [MPDIA] Wi-Fi]ok]\nend", "[*]|12 [2] [MPDIA] Wi-|[2]|Wi-Fi|ok]|"},
    {"ValueAlone", "[1]" + kWide + "\u00e4[MPDIA]:v\n", "[*]|[1]" + kWide + "|[1]|no name|:v|"},
    {"EmptyName", "\n[ -5][MPDIA]]]x\n", "[*]|\n[ -5][MPDIA]]]x|[-5]||x|"},
    {"NoBracket", "]2\n[2147483648][MPDIA]\n\n[MPDIA]", "[>]|]2|[1]|no name|]2|"},
    {"LongTexts", "[0] [MPDIA] " + kLong + ']' + kLong + '\n',
     "[*]|[0] [MPDIA] xxxxxx|[1]|" + kLong.substr(173) + '|' + kLong.substr(173) + '|'},
});
class MpdLine : public WidgetTest, public testing::WithParamInterface<Line> {};

TEST_P(MpdLine, IsTakenApart) {
  Results results(GetParam().text);
  results.init_mpd_buf();  // the rows do not need it
  std::vector<Drawing> row = cells(results);
  row.resize(5);
  EXPECT_EQ(words(row), GetParam().cells);
}
INSTANTIATE_TEST_SUITE_P(, MpdLine, testing::ValuesIn(kLines), kRowName);

TEST_F(MpdWidTest, CountsLinesUpToTheNulOrTheLength) {
  Results results("");
  const auto count = [&results](int length) {
    results.cal_line("a\nb\nc\n\0d\n", length);
    return cells(results).size() / 5;
  };
  EXPECT_EQ(count(99), 3U);
  EXPECT_EQ(count(3), 2U) << "the byte of that number, too";
  EXPECT_EQ(count(INT_MIN), 0U);
  results.cal_line(nullptr, 9);
  results.read(std::string(99, '\n'));
  EXPECT_EQ(platform().takeLog().back().message, "[MPDWID] addIndex, index : 63");
  results.setListType(64, MW::MpdWid::kHitEnd);
  results.setBGColor(64, 5);
}

TEST_F(MpdWidTest, RowsAreChangedByNumber) {
  Results results("a\n");
  for (const int index : {-1, 1, 64, INT_MAX}) {
    results.setListType(index, MW::MpdWid::kHitEnd);
    results.setBGColor(index, 5);
  }
  for (const int index : {-1, 64, INT_MAX}) results.addIndex(index, true, 1, "", "", nullptr);
  EXPECT_EQ(results.Max_height(), -1) << "before the first drawing";
  results.addIndex(0, true, 4, "head", "name", nullptr);
  results.setBGColor(0, 5);
  EXPECT_EQ(words(cells(results)), "[>]|head|[4]|name||");
  EXPECT_EQ(cells(results).at(1).rect.color, 5U);
  for (const auto& [level, color] :
       {std::pair(1, 0xFFBFBFBFU), {2, 0xFFFFA873U}, {3, 0xFFFF6600U}}) {
    results.addIndex(0, false, level, "", "", "");
    EXPECT_EQ(cells(results).at(1).rect.color, color) << level;
  }
  EXPECT_EQ(results.position2index({0, 0, 0, 2 * kTop + 1, 0, 0}), 0) << "the top counts twice";
}

}  // namespace
