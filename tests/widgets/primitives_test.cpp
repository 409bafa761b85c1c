#include <MW/primitives.h>

#include <algorithm>
#include <array>
#include <climits>
#include <cstring>

#include "support/widget_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words

using List = MW::WidgetList;
using PrimitivesTest = WidgetTest;

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

TEST_F(PrimitivesTest, AbsentRecordsAreZero) {
  EXPECT_EQ(shown(*std::make_unique<MW::Box>(nullptr))[0], Drawing{.call = Call::Box});
  EXPECT_EQ(shown(*std::make_unique<MW::Line>(nullptr))[0], Drawing{.call = Call::Line});
  EXPECT_EQ(shown(*std::make_unique<MW::Image>(nullptr, nullptr))[0], Drawing{.call = Call::Label});
}

TEST_F(PrimitivesTest, ATextMayBeAPartOfItsOwn) {
  SKIA_Text unbounded;
  std::memset(&unbounded, 'x', sizeof unbounded);
  MW::Textbox textbox(&kRect, &unbounded);
  textbox.setText(textbox.getText() + 1);
  EXPECT_EQ(shown(textbox)[0].text.text, std::string(126, 'x'));
}

TEST_F(PrimitivesTest, ALinesRectStartsAtTheLargerCoordinates) {
  const std::vector<std::pair<SKIA_Point, SKIA_Rect>> lines = {
      {{10, 20, 30, 5, 7, 1}, {30, 20, -20, -15, 7}},
      {{30, 5, 10, 20, 7, 1}, {30, 20, -20, -15, 7}},
      {{INT_MIN, INT_MAX, INT_MAX, INT_MIN, 7, 1}, {INT_MAX, INT_MAX, INT_MIN, INT_MIN, 7}}};
  for (const auto& [given, rect] : lines) EXPECT_EQ(*MW::Line(&given).getPositionAndSize(), rect);
}

}  // namespace
