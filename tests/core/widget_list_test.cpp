#include <MW/widget_list.h>

#include <climits>

#include "support/allocated_bytes.h"
#include "support/widget_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words

using List = MW::WidgetList;
using WidgetListTest = WidgetTest;

constexpr SKIA_Rect kRect = {10, 20, 30, 40, 0xFF112233};
constexpr SKIA_Point kLine = {10, 20, 30, 5, 0xFF445566, 3};

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

const int numbersAtStart = List::is_init + List::index_num;

TEST_F(WidgetListTest, NeedsToBeOpen) {
  EXPECT_EQ(numbersAtStart, 0);
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
  const std::size_t full = allocatedBytes();
  List::destroy();
  EXPECT_LE(allocatedBytes(), full - 128 * sizeof(SKIA_Item));
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

}  // namespace
