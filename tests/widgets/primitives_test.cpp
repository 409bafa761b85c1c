#include <MW/primitives.h>

#include <algorithm>
#include <array>
#include <climits>
#include <cstring>

#include "core/bounded_text.h"
#include "support/widget_test.h"

extern "C" void callFromC(int* results);  // in c_api_test.c

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words

using List = MW::WidgetList;
using PrimitivesTest = WidgetTest;
using WidgetListTest = WidgetTest;

constexpr SKIA_Rect kRect = {10, 20, 30, 40, 0xFF112233};
constexpr SKIA_Rect kBlueRect = {10, 20, 30, 40, 0xFF0000FF};
constexpr SKIA_Point kLine = {10, 20, 30, 5, 0xFF445566, 3};
constexpr SKIA_Point kGreenLine = {10, 20, 30, 5, 0xFF00FF00, 3};

// A widget draws a record, puts it into the display-item table as another kind, and is changed by
// the setters that its class has.
void expectDrawing(MW::Widget& widget, int type, const Drawing& drawn, int kind,
                   const Drawing& changed) {
  EXPECT_EQ(widget.type(), type);
  SCOPED_TRACE(drawn);
  platform().nextHandle = 77;
  EXPECT_EQ(widget.show(123) + widget.show(), 2 * 77);
  EXPECT_EQ(platform().takeDrawings(), std::vector(2, drawn));
  EXPECT_EQ(widget.add_MWWList(), -1024);
  List::init();
  EXPECT_GT(widget.add_MWWList(), 0);
  List::show();
  List::destroy();
  const Drawing item = {Call::Item, drawn.rect, drawn.line, drawn.text, kind};
  EXPECT_EQ(platform().takeDrawings(), std::vector{item});
  widget.setText("XY");
  widget.setTextAlign(2);
  widget.setFontSize(60);
  widget.setBgColor(0xFF0000FF);
  widget.setLnColor(0xFF00FF00);
  widget.setTextColor(1);
  widget.setRect(0, &kBlueRect);
  EXPECT_EQ(shown(widget), std::vector{changed});
}

TEST_F(PrimitivesTest, DrawAndChangeTheirRecords) {
  const SKIA_Text caption = textRecord("abcdef", 0xFF778899, 5, 48);
  const DrawnText drawn = {"abcdef", 0xFF778899, 5, 48};
  const DrawnText changed = {"XY", 0xFF778899, 2, 60};
  MW::Label label(&kRect, &caption);
  MW::Textbox textbox(&kRect, &caption);
  MW::Image image(&kRect, &caption);
  MW::Box box(&kRect);
  MW::Line line(&kLine);
  expectDrawing(label, 3, {Call::Label, kRect, {}, drawn}, 0,
                {Call::Label, kBlueRect, {}, changed});
  expectDrawing(textbox, 8, {Call::Textbox, kRect, {}, drawn}, 1,
                {Call::Textbox, kBlueRect, {}, changed});
  expectDrawing(image, 5, {Call::Label, kRect, {}, {"abcdef"}}, 7,
                {Call::Label, kRect, {}, {"XY"}});
  expectDrawing(box, 6, {Call::Box, kRect}, 3, {Call::Box, kBlueRect});
  expectDrawing(line, 7, {Call::Line, {}, kLine}, 6, {Call::Line, {}, kGreenLine});
  EXPECT_STREQ(label.getText(), "XYcdef") << "its length alone ends it";
  EXPECT_STREQ(textbox.getText(), "XY");
}

TEST_F(PrimitivesTest, OnlyAnImageBelievesALength) {
  SKIA_Text text = textRecord("abc");
  const std::vector<std::pair<int, std::size_t>> lengths = {{2, 2},   {0, 0},       {127, 127},
                                                            {128, 3}, {INT_MAX, 3}, {INT_MIN, 0}};
  for (const auto& [given, kept] : lengths) {
    text.string_len = given;
    MW::Label label(&kRect, &text);
    MW::Image image(&kRect, &text);
    EXPECT_EQ(shown(label)[0].text.text.size(), 3U);
    EXPECT_EQ(shown(image)[0].text.text.size(), kept) << given;
  }
}

TEST_F(PrimitivesTest, AbsentRecordsAreEmptyAndTextsAreCut) {
  MW::Label label(nullptr, nullptr);
  MW::Textbox textbox(nullptr, nullptr);
  MW::Image image(nullptr, nullptr);
  MW::Box box(nullptr);
  MW::Line line(nullptr);
  EXPECT_EQ(shown(box)[0], Drawing{.call = Call::Box});
  EXPECT_EQ(shown(line)[0], Drawing{.call = Call::Line});
  for (MW::Widget* each : std::vector<MW::Widget*>{&label, &textbox, &image}) {
    EXPECT_EQ(shown(*each)[0].text, DrawnText());
    each->setText(std::string(300, 'x').c_str());
    EXPECT_EQ(shown(*each)[0].text.text, std::string(127, 'x'));
    each->setText(nullptr);
    EXPECT_EQ(shown(*each)[0].text, DrawnText());
  }
}

TEST_F(PrimitivesTest, TextsAreCutAtAWholeCharacter) {
  for (const std::string character : {"a", "\u00e9", "\uac00", "\U0001f600"}) {
    for (std::size_t start = 120; start < 130; ++start) {
      const std::string given = std::string(start, 'a') + character + "behind";
      const std::size_t end = start + character.size();
      const std::size_t kept = start < 127 && end > 127 ? start : 127;
      EXPECT_EQ(MW::boundedText(given.c_str()), given.substr(0, kept));
      EXPECT_EQ(MW::boundedText(given.c_str(), end), given.substr(0, std::min(kept, end)));
    }
  }
  EXPECT_EQ(MW::boundedText(std::string(200, '\x80').c_str()).size(), 127U) << "no characters";
  EXPECT_EQ(MW::boundedText("abc", 100), "abc");
  EXPECT_EQ(MW::boundedText(nullptr, 5), "");
  SKIA_Text unbounded;
  std::memset(&unbounded, 'x', sizeof unbounded);
  MW::Textbox textbox(&kRect, &unbounded);
  textbox.setText(textbox.getText() + 1);
  EXPECT_EQ(shown(textbox)[0].text.text, std::string(126, 'x')) << "a part of its own text";
}

TEST_F(PrimitivesTest, ALinesRectStartsAtTheLargerCoordinates) {
  const std::vector<std::pair<SKIA_Point, SKIA_Rect>> lines = {
      {{10, 20, 30, 5, 7, 1}, {30, 20, -20, -15, 7}},
      {{30, 5, 10, 20, 7, 1}, {30, 20, -20, -15, 7}},
      {{INT_MIN, INT_MAX, INT_MAX, INT_MIN, 7, 1}, {INT_MAX, INT_MAX, INT_MIN, INT_MIN, 7}}};
  for (const auto& [given, rect] : lines) EXPECT_EQ(*MW::Line(&given).getPositionAndSize(), rect);
}

int addText(const std::string& text) {
  const SKIA_Text record = textRecord(text);
  return List::addQueue(SKIA_LABEL, &kRect, nullptr, &record);
}
int addLine() { return List::addQueue(SKIA_LINE, nullptr, &kLine, nullptr); }

std::vector<Drawing> drawn() {
  List::show();
  return platform().takeDrawings();
}

const Drawing kLineItem = {Call::Item, {}, kLine, {}, SKIA_LINE};

TEST_F(WidgetListTest, NeedsToBeOpen) {
  EXPECT_EQ(addText("a"), -1024);
  EXPECT_EQ(List::show() + List::show(1) + List::hide(1) + List::hideShadow() + List::remove(1), 0);
  EXPECT_EQ(List::setText(1, "a", 1) + List::setColor(1, 2, 3, 4) + List::setRect(1, kRect), 0);
  EXPECT_EQ(List::setFontSize(1, 2) + static_cast<int>(platform().takeDrawings().size()), 0);
}

TEST_F(WidgetListTest, DrawsHidesAndVeilsItems) {
  List::init();
  EXPECT_EQ(addText("abc"), 1);
  EXPECT_EQ(addLine(), 2);
  const Drawing label = {Call::Item, kRect, {}, {"abc"}};
  EXPECT_EQ(drawn(), (std::vector{label, kLineItem}));
  EXPECT_EQ(List::hide(1) + List::remove(2), 2);
  EXPECT_EQ(drawn(), std::vector{kLineItem}) << "nothing is removed";
  EXPECT_EQ(List::show(1) + List::hideShadow(), 2);
  const Drawing veil = {Call::Box, {0, 0, 539, 939, 0x7F000000}};
  EXPECT_EQ(platform().takeDrawings(), (std::vector{label, kLineItem, veil}));
  for (const int missing : {0, 3, INT_MIN}) {
    EXPECT_EQ(List::hide(missing) + List::show(missing), 2 * -104) << missing;
  }
}

TEST_F(WidgetListTest, NeverUsesAnIndexAgain) {
  List::init();
  EXPECT_EQ(addText("a"), 1);
  EXPECT_EQ(List::destroy() + List::init(), 1);
  EXPECT_EQ(addText("b"), 2);
  EXPECT_EQ(List::init(), 1) << "empties an open table";
  EXPECT_EQ(List::index2slot(2), -104);
  List::index_num = 0x0FFFFFFE;
  EXPECT_EQ(addText("last"), 0x0FFFFFFF);
  EXPECT_EQ(addText("none"), -101);
}

TEST_F(WidgetListTest, AFullTableReplacesSlot100) {
  List::init();
  for (int i = 1; i <= 128; ++i) EXPECT_EQ(addText(std::to_string(i)), i);
  EXPECT_EQ(List::getSlot(), 100);
  List::hide(101);
  EXPECT_EQ(addLine(), 101);
  const std::vector<Drawing> items = drawn();
  EXPECT_EQ(items.size(), 128U);
  EXPECT_EQ(items.at(99).text.text, "100");
  EXPECT_EQ(items.at(100), kLineItem);
}

TEST_F(WidgetListTest, ChangesAnItemWithinItsRecord) {
  List::init();
  addText("abc");
  EXPECT_EQ(List::setText(1, "wxyz", 3) + List::setText(1, "", 0), 2) << "0 changes nothing";
  EXPECT_EQ(List::setRect(1, {9, 8, 7, 6, 5}) + List::setColor(1, 0xA, 0xB, 0xC), 2);
  EXPECT_EQ(List::setFontSize(1, 40), 1);
  const Drawing changed = {
      Call::Item, {9, 8, 7, 6, 0xB}, {0, 0, 0, 0, 0xC, 0}, {"wxy", 0xA, 0, 40}};
  EXPECT_EQ(drawn(), std::vector{changed});
  List::setText(1, std::string(300, 'x').c_str(), 300);
  EXPECT_EQ(drawn()[0].text.text, std::string(127, 'x'));
  List::setText(1, "ab\0cd", 5);
  EXPECT_EQ(drawn()[0].text.text, std::string("ab\0cd", 5)) << "the count counts";
  SKIA_Text endless = {{}, INT_MAX, 0, 0, 0};
  endless.text[127] = 'y';
  List::addQueue(SKIA_LABEL, nullptr, nullptr, &endless);
  EXPECT_EQ(drawn()[1].text.text, std::string(127, '\0'));
  EXPECT_EQ(List::save[1].item->text.text[127], '\0');
  EXPECT_EQ(List::setText(3, "a", 1) + List::setColor(0, 1, 2, 3), 2 * -104);
  EXPECT_EQ(List::setRect(0, kRect) + List::setFontSize(-5, 1), 2 * -104);
  EXPECT_EQ(platform().takeLog().at(3),
            (LogLine{kDebug, "BRIMOL_WIDGETLIST", "[WIDGET] setFontSize: index is invalid -5 "}));
}

TEST_F(WidgetListTest, IsReachedFromC) {
  List::init();
  std::array<int, 5> results = {};
  callFromC(results.data());
  EXPECT_EQ(results, (std::array{1, 1, 2, 1, 0}));
  EXPECT_EQ(drawn()[0].rect, (SKIA_Rect{1, 2, 33, 4, 0xFF00FF00}));
}

}  // namespace
