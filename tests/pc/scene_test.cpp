#include "scene.h"

#include <gmock/gmock.h>

#include <limits>

#include "painting.h"

namespace brimol::pc {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using testing::UnorderedElementsAre;
using Area = cairo_rectangle_int_t;

constexpr Size kScreen = {100, 60};
constexpr int32_t kLeast = std::numeric_limits<int32_t>::min();
constexpr int32_t kMost = std::numeric_limits<int32_t>::max();

struct Change {
  const char* name;
  SKIA_Item before;
  SKIA_Item after;
  bool isSeen;
};

SKIA_Item changed(SKIA_Item item, void (*change)(SKIA_Item&)) {
  change(item);
  return item;
}

const SKIA_Rect kRect = {10, 10, 20, 20, kRed};
const SKIA_Item kLabel = textItem(SKIA_LABEL, kRect, textOf("one"));
const SKIA_Item kButton = textItem(SKIA_BUTTONBOX, kRect, textOf("one"));
const SKIA_Item kPicture = textItem(SKIA_LABEL, kRect, textOf("one.png", 0));
const SKIA_Item kLine = lineItem({10, 10, 20, 30, kRed, 2});
const SKIA_Item kArrow = arrowItem(kRect, kRed, 1);

class OneItem : public testing::TestWithParam<Change> {};

TEST_P(OneItem, ChangesWhatItReads) {
  const Region region = changedRegion({GetParam().before}, {GetParam().after}, kScreen);
  EXPECT_EQ(!region.empty(), GetParam().isSeen);
}

INSTANTIATE_TEST_SUITE_P(
    , OneItem,
    testing::Values(
        Change{"NotTheColourBelowALabel", kLabel,
               changed(kLabel, [](SKIA_Item& item) { item.rect.color = kBlue; }), false},
        Change{"TheColourBelowAButton", kButton,
               changed(kButton, [](SKIA_Item& item) { item.rect.color = kBlue; }), true},
        Change{"NotTheBytesBehindAText", kButton,
               changed(kButton, [](SKIA_Item& item) { item.text.text[100] = 'x'; }), false},
        Change{"NotTheBytesBehindANul", kButton,
               changed(kButton,
                       [](SKIA_Item& item) {
                         item.text.string_len = kMost;
                         item.text.text[100] = 'x';
                       }),
               false},
        Change{"TheText", kButton,
               changed(kButton, [](SKIA_Item& item) { item.text.text[0] = 'x'; }), true},
        Change{"TheAlignment", kButton,
               changed(kButton, [](SKIA_Item& item) { item.text.align = 2; }), true},
        Change{"TheKind", kLabel, changed(kLabel, [](SKIA_Item& item) { item.kind = SKIA_IMAGE; }),
               true},
        Change{"NotTheColourOfAPicture", kPicture,
               changed(kPicture, [](SKIA_Item& item) { item.text.color = kBlue; }), false},
        Change{"ThatALabelIsNoPicture", kPicture,
               changed(kPicture, [](SKIA_Item& item) { item.text.size = 20; }), true},
        Change{"NotTheRectangleOfALine", kLine,
               changed(kLine, [](SKIA_Item& item) { item.rect = kRect; }), false},
        Change{"TheWidthOfALine", kLine,
               changed(kLine, [](SKIA_Item& item) { item.point.width = 3; }), true},
        Change{"NotTheEndsOfAnArrow", kArrow,
               changed(kArrow, [](SKIA_Item& item) { item.point.x1 = 3; }), false},
        Change{"NotHowMuchAnArrowPointsLeft", kArrow,
               changed(kArrow, [](SKIA_Item& item) { item.point.width = 7; }), false},
        Change{"WhereAnArrowPoints", kArrow,
               changed(kArrow, [](SKIA_Item& item) { item.point.width = 0; }), true}),
    [](const auto& test) { return test.param.name; });

TEST(SceneTest, FindsWhatWasInsertedOrRemoved) {
  const Frame some = {kButton, kLine, kArrow};
  Frame more = some;
  more.insert(more.begin() + 1, boxItem({50, 40, 5, 6, kRed}));
  EXPECT_THAT(changedRegion(some, more, kScreen), ElementsAre(Area{50, 40, 5, 6}));
  EXPECT_THAT(changedRegion(more, some, kScreen), ElementsAre(Area{50, 40, 5, 6}));
}

TEST(SceneTest, AnItemThatMovesChangesBothPlaces) {
  EXPECT_THAT(
      changedRegion({boxItem({0, 0, 10, 10, kRed})}, {boxItem({50, 30, 10, 10, kRed})}, kScreen),
      UnorderedElementsAre(Area{0, 0, 10, 10}, Area{50, 30, 10, 10}));
}

TEST(SceneTest, CutsRectanglesOfAnySizeToTheScreen) {
  const auto areaOf = [](SKIA_Rect rect) { return changedRegion({}, {boxItem(rect)}, kScreen); };
  EXPECT_THAT(areaOf({-5, -5, 10, kMost, kRed}), ElementsAre(Area{0, 0, 5, 60}));
  EXPECT_THAT(areaOf({90, 50, kMost, kMost, kRed}), ElementsAre(Area{90, 50, 10, 10}));
  EXPECT_THAT(areaOf({kLeast, 0, kMost, 10, kRed}), IsEmpty());
  EXPECT_THAT(areaOf({kMost, kMost, kMost, kMost, kRed}), IsEmpty());
  EXPECT_THAT(areaOf({50, 50, -10, kLeast, kRed}), IsEmpty());
  EXPECT_THAT(areaOf({50, 50, 0, 10, kRed}), IsEmpty());
}

TEST(SceneTest, LinesOfAnySizeStayOnTheScreen) {
  const auto areaOf = [](SKIA_Point line) { return changedRegion({}, {lineItem(line)}, kScreen); };
  EXPECT_THAT(areaOf({kLeast, kLeast, kMost, kMost, kRed, kMost}),
              ElementsAre(Area{0, 0, 100, 60}));
  EXPECT_THAT(areaOf({20, 30, 40, 30, kRed, 4}), ElementsAre(Area{20, 28, 20, 4}));
  EXPECT_THAT(areaOf({20, 30, 20, 30, kRed, 4}), IsEmpty());
}

TEST(SceneTest, ManyPiecesBecomeTheirRectangle) {
  const auto columns = [](int count) {
    Frame frame;
    for (int i = 0; i < count; ++i) frame.push_back(boxItem({i * 2, 0, 1, 5, kRed}));
    return changedRegion({}, frame, {2000, 10});
  };
  EXPECT_EQ(columns(32).size(), 32U);
  EXPECT_THAT(columns(33), ElementsAre(Area{0, 0, 65, 5}));
  EXPECT_THAT(columns(900), ElementsAre(Area{0, 0, 1799, 5}));
}

}  // namespace
}  // namespace brimol::pc
