#include <MW/primitives.h>
#include <MW/widget_list.h>

#include <cstring>
#include <limits>
#include <memory>

#include "support/widget_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words

using PrimitivesTest = WidgetTest;

constexpr SKIA_Rect kRect = {10, 20, 30, 40, 0xFF112233};
constexpr SKIA_Point kLine = {10, 20, 30, 5, 0xFF445566, 3};
constexpr int kMax = std::numeric_limits<int>::max();
constexpr int kMin = std::numeric_limits<int>::min();
const SKIA_Text kText = textRecord("abcdef", 0xFF778899, 5, 48);
const DrawnText kDrawnText = {"abcdef", 0xFF778899, 5, 48};

std::unique_ptr<MW::Widget> makeLabel() { return std::make_unique<MW::Label>(&kRect, &kText); }
std::unique_ptr<MW::Widget> makeTextbox() { return std::make_unique<MW::Textbox>(&kRect, &kText); }
std::unique_ptr<MW::Widget> makeImage() { return std::make_unique<MW::Image>(&kRect, &kText); }
std::unique_ptr<MW::Widget> makeBox() { return std::make_unique<MW::Box>(&kRect); }
std::unique_ptr<MW::Widget> makeLine() { return std::make_unique<MW::Line>(&kLine); }

struct KindCase : Row {
  std::unique_ptr<MW::Widget> (*make)();
  int type;
  Drawing drawn;
  int kind;  // in the display-item table
  // What the table's setters change of `drawn`, where the class has the setter.
  Drawing changed;
  const char* text;  // after "XY" replaced "abcdef"; null: no text
};

constexpr SKIA_Rect kBlueRect = {10, 20, 30, 40, 0xFF0000FF};
constexpr SKIA_Point kGreenLine = {10, 20, 30, 5, 0xFF00FF00, 3};
const DrawnText kChangedText = {"XY", 0xFF778899, 2, 60};

std::vector<KindCase> kinds() {
  return {{"Label",
           makeLabel,
           3,
           {.call = Call::Label, .rect = kRect, .text = kDrawnText},
           0,
           {.call = Call::Label, .rect = kBlueRect, .text = kChangedText},
           "XYcdef"},
          {"Textbox",
           makeTextbox,
           8,
           {.call = Call::Textbox, .rect = kRect, .text = kDrawnText},
           1,
           {.call = Call::Textbox, .rect = kBlueRect, .text = kChangedText},
           "XY"},
          {"Image",
           makeImage,
           5,
           {.call = Call::Label, .rect = kRect, .text = {"abcdef"}},
           7,
           {.call = Call::Label, .rect = kRect, .text = {"XY"}},
           "XYcdef"},
          {"Box",
           makeBox,
           6,
           {.call = Call::Box, .rect = kRect},
           3,
           {.call = Call::Box, .rect = kBlueRect},
           nullptr},
          {"Line",
           makeLine,
           7,
           {.call = Call::Line, .line = kLine},
           6,
           {.call = Call::Line, .line = kGreenLine},
           nullptr}};
}

class Primitive : public WidgetTest, public testing::WithParamInterface<KindCase> {
 protected:
  const std::unique_ptr<MW::Widget> widget = GetParam().make();
};

TEST_P(Primitive, DrawsItsRecordsByOneCall) {
  platform().nextHandle = 77;
  EXPECT_EQ(widget->type(), GetParam().type);
  EXPECT_FALSE(widget->isActive());
  EXPECT_EQ(widget->show(123), 77);
  EXPECT_EQ(widget->show(), 77);
  EXPECT_EQ(platform().takeDrawings(), std::vector(2, GetParam().drawn));
}

TEST_P(Primitive, CopiesItselfToTheDisplayItems) {
  EXPECT_EQ(widget->add_MWWList(), -1024);
  MW::WidgetList::init();
  EXPECT_EQ(widget->add_MWWList(), 1);
  MW::WidgetList::show();
  Drawing item = GetParam().drawn;
  item.call = Call::Item;
  item.kind = GetParam().kind;
  EXPECT_EQ(platform().takeDrawings(), std::vector{item});
}

TEST_P(Primitive, ChangesWhatItsKindHas) {
  widget->setText("XY");
  widget->setTextAlign(2);
  widget->setFontSize(60);
  widget->setBgColor(0xFF0000FF);
  widget->setLnColor(0xFF00FF00);
  widget->setTextColor(1);
  widget->setBdColor(2);
  widget->setRect(0, &kBlueRect);
  EXPECT_EQ(shown(*widget), std::vector{GetParam().changed});
  EXPECT_EQ(widget->getBgColor(), 0U);
  EXPECT_EQ(widget->getTextColor(), GetParam().changed.text.color);
  EXPECT_EQ(widget->getFontSize(), GetParam().changed.text.size);
  EXPECT_STREQ(widget->getText(), GetParam().text);
}

TEST_P(Primitive, TakesNoEvents) {
  widget->setActive(1);
  EXPECT_FALSE(press(*widget, {15, 25}));
  EXPECT_EQ(widget->hide(), 0);
  EXPECT_TRUE(widget->isActive());
}

INSTANTIATE_TEST_SUITE_P(Kinds, Primitive, testing::ValuesIn(kinds()), kRowName);

TEST_F(PrimitivesTest, OnlyAnImageBelievesALength) {
  SKIA_Text text = textRecord("abcdef");
  text.string_len = 2;
  MW::Label label(&kRect, &text);
  MW::Textbox textbox(&kRect, &text);
  MW::Image image(&kRect, &text);
  EXPECT_EQ(shown(label)[0].text.text, "abcdef");
  EXPECT_EQ(shown(textbox)[0].text.text, "abcdef");
  EXPECT_EQ(shown(image)[0].text.text, "ab");
  EXPECT_STREQ(image.getText(), "ab");
}

struct LengthCase : Row {
  int given;
  std::size_t kept;
};

class ImageLength : public WidgetTest, public testing::WithParamInterface<LengthCase> {};

TEST_P(ImageLength, IsWithinTheRecord) {
  SKIA_Text text = textRecord("abc");
  text.string_len = GetParam().given;
  MW::Image image(&kRect, &text);
  std::string expected = "abc";
  expected.resize(GetParam().kept);
  EXPECT_EQ(shown(image)[0].text.text, expected);
}

INSTANTIATE_TEST_SUITE_P(Lengths, ImageLength,
                         testing::Values(LengthCase{"AsGiven", 5, 5}, LengthCase{"None", 0, 0},
                                         LengthCase{"Whole", 127, 127},
                                         LengthCase{"OneTooMany", 128, 3},
                                         LengthCase{"FarTooMany", kMax, 3},
                                         LengthCase{"Negative", -1, 0},
                                         LengthCase{"Lowest", kMin, 0}),
                         kRowName);

TEST_F(PrimitivesTest, AbsentRecordsAreEmpty) {
  MW::Label label(nullptr, nullptr);
  MW::Textbox textbox(nullptr, nullptr);
  MW::Image image(nullptr, nullptr);
  MW::Box box(nullptr);
  MW::Line line(nullptr);
  EXPECT_EQ(shown(label), (std::vector{Drawing{.call = Call::Label}}));
  EXPECT_EQ(shown(textbox), (std::vector{Drawing{.call = Call::Textbox}}));
  EXPECT_EQ(shown(image), (std::vector{Drawing{.call = Call::Label}}));
  EXPECT_EQ(shown(box), (std::vector{Drawing{.call = Call::Box}}));
  EXPECT_EQ(shown(line), (std::vector{Drawing{.call = Call::Line}}));
}

TEST_F(PrimitivesTest, TextsAreCutAtTheirRecord) {
  const std::string tooLong(300, 'x');
  MW::Label label(&kRect, &kText);
  MW::Textbox textbox(&kRect, &kText);
  MW::Image image(&kRect, &kText);
  for (MW::Widget* each : std::initializer_list<MW::Widget*>{&label, &textbox, &image}) {
    each->setText(tooLong.c_str());
    EXPECT_EQ(shown(*each)[0].text.text, std::string(127, 'x'));
    each->setText(nullptr);
    EXPECT_EQ(shown(*each)[0].text.text, "");
  }
}

struct LineCase : Row {
  SKIA_Point line;
  SKIA_Rect rect;
};

class LineRect : public testing::TestWithParam<LineCase> {};

TEST_P(LineRect, StartsAtTheLargerCoordinates) {
  MW::Line line(&GetParam().line);
  EXPECT_EQ(*line.getPositionAndSize(), GetParam().rect);
}

INSTANTIATE_TEST_SUITE_P(
    Lines, LineRect,
    testing::Values(LineCase{"Rising", {10, 20, 30, 5, 7, 1}, {30, 20, -20, -15, 7}},
                    LineCase{"Falling", {30, 5, 10, 20, 7, 1}, {30, 20, -20, -15, 7}},
                    LineCase{"Point", {3, 4, 3, 4, 7, 1}, {3, 4, 0, 0, 7}},
                    LineCase{
                        "Longest", {kMin, kMax, kMax, kMin, 7, 1}, {kMax, kMax, kMin, kMin, 7}}),
    kRowName);

}  // namespace
