#include <MW/static_text.h>

#include <algorithm>
#include <array>

#include <brimol3_widget_test/drawings.h>
#include "support/play_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using StaticTextTest = WidgetTest;

constexpr SKIA_Rect kFourRows = {0, 0, 20, 60, 3};  // of ten bytes
const SKIA_Text kLooks = textRecord("", 7, 1, 10);

struct Viewer : MW::StaticText {
  using StaticText::top_index, StaticText::w_count;
  explicit Viewer(SKIA_Rect area, SKIA_Text looks = kLooks, bool numbers = true)
      : StaticText(&area, &looks, numbers, true, true) {}
  // By hand, which reaches places that no event does.
  void pressLongAt(Spot spot) {
    MW::event_data event = pointerEvent(MW::kEventLongPress, spot);
    onPressLong(&event);
  }
  std::string rows(int top) {
    top_index = top;
    return words(shown(*this));
  }
  // The top rows that a search, two steps forward and two back lead to.
  std::string found(const std::string& log, const std::string& wanted) {
    setText(log.c_str());
    get_ime_result(wanted.c_str());
    line_search(log.c_str());
    std::string tops = std::to_string(top_index);
    for (const unsigned int direction : {kNext, kNext, kPrevious, kPrevious}) {
      line_search_point(direction);
      tops += std::to_string(top_index);
    }
    return tops;
  }
};

const std::string kLong(1000, 'x');

struct Search : Row {
  std::string text, wanted, tops;
  std::string rows;  // from the top on; behind a text of several rows an empty one is drawn
};
const auto kSearches = std::to_array<Search>({
    {"ASingleByteIsNotFound", "0123456789\nx", "6", "00000", "00001:|0123456789||00002:|x||"},
    {"AcrossRowsOfALine", "12345678\xE2\x82\xACx", "89", "00000",
     "00001:|12345678|\xE2\x82\xACx||"},
    {"NoFurtherThanTheLastPage", "ab\nb\nc\nd\ne\nab\nz", "ab", "03300",
     "00001:|!ab|00002:|b|00003:|c|00004:|d|"},
    {"TheLastRowCountsAsTheFirst", "a\nab\nb\nc\nab", "ab", "11100",
     "00001:|a|00002:|!ab|00003:|b|00004:|c|"},
    {"InAViewOfAllRowsItGoesBackToTheTop", "a\nab\nab\nc", "ab", "10000",
     "00001:|a|00002:|!ab|00003:|!ab|00004:|c|"},
    {"NinetyEightBytesAreNotEnough", "b\n" + kLong.substr(902), kLong, "00000",
     "00001:|b|00002:|xxxxxxxxxx|xxxxxxxxxx|xxxxxxxxxx|"},
    {"WithAnEndNoLineIsCounted", "a\nb\nc\nb", "\nb", "00000",
     "00001:|!a|00002:|b|00003:|c|00004:|b|"},
    {"NinetyNineBytesAreWanted", "b\n" + kLong.substr(901), kLong, "11111",
     "00001:|b|00002:|!xxxxxxxxxx|!xxxxxxxxxx|!xxxxxxxxxx|"},
});
class StaticTextSearch : public WidgetTest, public testing::WithParamInterface<Search> {};

TEST_P(StaticTextSearch, FindsAndMarksLines) {
  Viewer viewer(kFourRows);
  EXPECT_EQ(viewer.found(GetParam().text, GetParam().wanted), GetParam().tops);
  EXPECT_EQ(viewer.rows(0), GetParam().rows);
}
INSTANTIATE_TEST_SUITE_P(, StaticTextSearch, testing::ValuesIn(kSearches), kRowName);

TEST_F(StaticTextTest, FromFurtherDownAViewOfAllRowsGoesBackToTheTop) {
  Viewer viewer(kFourRows);
  viewer.found("a\nab\nb\nc", "ab");
  viewer.top_index = 2;
  viewer.line_search_point(Viewer::kPrevious);
  EXPECT_EQ(viewer.top_index, 0);
}

TEST_F(StaticTextTest, WithoutNumbersTheRedGoesOn) {
  Viewer plain(kFourRows, kLooks, false);
  plain.found("a\nab\nc\nd", "ab");
  EXPECT_EQ(plain.rows(0), "a|!ab|!c|!d|");
  EXPECT_EQ(plain.rows(0), "!a|!ab|!c|!d|") << "in the next frame everywhere";
}

TEST_F(StaticTextTest, FindsALineByItsNumber) {
  Viewer viewer(kFourRows);
  viewer.setText(std::string(123456, '\n').c_str());
  EXPECT_EQ(viewer.rows(viewer.find_real_num(123456)), "99999:||99999:||99999:||99999:||");
  EXPECT_EQ(viewer.find_real_num(123457), viewer.top_index) << "no such line";
}

TEST_F(StaticTextTest, ALongPressOnTheBarScrollsAClock) {
  platform().properties["brimol.info.type"] = "cpu";
  Viewer viewer({100, 50, 350, 700, 5}, textRecord("first", 7, 2, 20));
  EXPECT_EQ(viewer.w_count, 88);
  viewer.setText(std::string(66, '\n').c_str());  // of which 33 are in view
  EXPECT_STREQ(viewer.getText(), "first");
  shown(viewer);
  const auto kTouches = std::to_array<std::pair<Spot, int>>({{{422, 224}, 50},
                                                             {{450, 225}, 166},
                                                             {{422, 400}, 283},
                                                             {{421, 749}, 283},
                                                             {{451, 749}, 283},
                                                             {{422, 749}, 400},
                                                             {{422, 60}, 50}});
  for (const auto& [touch, top] : kTouches) {
    viewer.pressLongAt(touch);
    EXPECT_EQ(places({shown(viewer).back()}), "429," + std::to_string(top) + " 14x350|");
  }
  viewer.setRect(0, &kFourRows);
  EXPECT_EQ(viewer.w_count, 0) << "it knows of its numbers by now";
  viewer.setText("ab");
  EXPECT_EQ(viewer.rows(0), "00001:|a|") << "at least a byte";
}

TEST_F(StaticTextTest, AViewOfFiguresLogsAllRowsUpToItsEnd) {
  constexpr auto kRows = std::to_array<std::pair<const char*, const char*>>(
      {{"cpu", "7"}, {"gpu", "7"}, {"ddr", "7"}, {"log", "1"}});
  for (const auto& [info, rows] : kRows) {
    platform().properties["brimol.info.type"] = info;
    Viewer viewer(kFourRows);
    viewer.top_index = 3;
    platform().takeLog();
    viewer.setText("x");
    EXPECT_EQ(platform().takeLog().at(0).message,
              std::string("[STATICTEXT] max_num_of_lines : ") + rows);
  }
}

TEST_F(StaticTextTest, InitStartsOver) {
  platform().properties["brimol.info.type"] = "cpu";
  Viewer viewer(kFourRows);
  viewer.found("a\nab\nb", "ab");
  viewer.press_cb = [](int) { ADD_FAILURE() << "it was dropped"; };
  viewer.setActive(1);
  platform().hasProperties = false;
  viewer.init(&kFourRows, &kLooks);
  EXPECT_EQ(viewer.isActive(), 0);
  EXPECT_EQ(viewer.top_index, 0);
  EXPECT_EQ(viewer.w_count, 2) << "no longer that of a clock";
  EXPECT_EQ(Viewer({0, 0, 63, 9, 0}, textRecord("", 7, 1, 1)).w_count, 108) << "of one pixel";
  EXPECT_EQ(viewer.rows(0), "|");
  viewer.setActive(1);
  press(viewer, {5, 5});
}

void noteDouble(int zero) { noteZero("double", zero); }
Step listen(void (*doubleTap)(int)) {
  return call<Viewer>([=](Viewer& viewer) { viewer.double_tap_cb = doubleTap; });
}

std::unique_ptr<Viewer> sixRows() {
  auto viewer = std::make_unique<Viewer>(kFourRows);
  viewer->setText("1\n2\n3\n4\n5\n6");
  viewer->press_cb = [](int zero) { noteZero("press", zero); };
  viewer->release_cb = [](int zero) { noteZero("release", zero); };
  viewer->long_press_cb = [](int zero) { noteZero("long", zero); };
  viewer->double_tap_cb = noteDouble;
  return viewer;
}
// Its press and its release tell it of a long press.
void longPressByHand() {
  if (stage.widget != nullptr) stage.widget->onPressLong(nullptr);
}
std::unique_ptr<MW::Widget> callingOn() {
  auto viewer = sixRows();
  viewer->press_cb = [](int) { note("press"), longPressByHand(); };
  viewer->release_cb = [](int) { note("release"), longPressByHand(); };
  return viewer;
}
std::unique_ptr<MW::Widget> withoutScroll() {
  return std::make_unique<MW::StaticText>(&kFourRows, &kLooks, true, false, true);
}
Step top() {
  return look<Viewer>([](Viewer& viewer) { return viewer.top_index; });
}

const PlaysOn kSixRows = {sixRows};
const PlaysOn kCallingOn = {callingOn};
const PlaysOn kWithoutScroll = {withoutScroll};

const PlayTests kPlays = {
    kSixRows("EveryFourthMotionScrolls",
             {press(5, 5), drag(0, -9), drag(0, -9), drag(0, -9), top(), drag(0, -9), top(),
              drag(0, 9), drag(0, 9), drag(0, 9), drag(1, 0), top(), drag(0, -9), drag(0, -9),
              drag(0, -9), drag(0, 1), top()},
             "press+ + + + <0> + <1> + + + + <1> + + + + <0>"),
    kSixRows("TellsTheSecondOfTwoTaps",
             {press(5, 5), release(90, 90), press(5, 5), release(), press(), release(), press(),
              release()},
             "press+ + press+ release+ press+ release double+ press+ release+"),
    kCallingOn("CallbacksThatCallOnTakeNoTapAway", {press(5, 5), release(), press(), release()},
               "press long+ release long+ press long+ release long double+"),
    kSixRows("CountsTapsWhileADoubleTapIsWanted",
             {listen(nullptr), press(5, 5), listen(noteDouble), release(), press(), release()},
             "press+ release+ press+ release+"),
    kSixRows("AsksForARedrawWhenItsColourComesBack",
             {call(&MW::Widget::restoreColor), lookAtRedraw(), call(&MW::Widget::setBgColor, 9),
              call(&MW::Widget::restoreColor), lookAtRedraw(), look(&MW::Widget::getBgColor)},
             "<still> <redraw> <3>"),
    kSixRows("ALongPressIsTold", {longPress(5, 5), moveTo(6, 6)}, "long+ -"),
    kSixRows("TakesNothingOnceItHasATime",
             {call(&MW::Widget::onShowTimer, 100), lookAtRedraw(), press(5, 5), later(100), timer(),
              lookAtRedraw()},
             "<redraw> - <redraw>"),
    kWithoutScroll("WithoutScrollItTakesAllAndDoesNothing",
                   {press(900, 900), lookAtHold(), keyDown(5)}, "+ <held 0> +"),
};

TEST_F(StaticTextTest, ALongPressWhereNoBarHasRoomIsLogged) {
  Viewer viewer({});
  viewer.pressLongAt({0, 0});
  EXPECT_EQ(platform().takeLog().back().message, "[STATICTEXT] onPressLong is not correct!!");
}

TEST_F(StaticTextTest, NoSizeLeadsOutOfBounds) {
  SKIA_Text looks = {};
  std::ranges::fill(looks.text, 'x');  // no NUL
  for (const int size : {INT_MIN, -1, 0, 1, 7, INT_MAX}) {
    for (const int length : {INT_MIN, -50, 0, 3, 300, INT_MAX}) {
      looks.size = size;
      Viewer viewer({INT_MAX, INT_MIN, length, length, 0}, looks);
      viewer.line_search(nullptr);
      viewer.found(std::string(10'000, 'y'), "yyy");
      for (const int y : {INT_MIN, INT_MAX}) viewer.pressLongAt({INT_MAX, y});
      EXPECT_EQ(shown(viewer).front().rect.h, length);
    }
  }
}

}  // namespace
