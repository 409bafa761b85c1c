#include <MW/c_api.h>
#include <MW/records.h>
#include <MW/widget_list.h>
#include <MW/window.h>

#include <cstring>
#include <limits>

#include "c_api_test.h"
#include "support/widget_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::WidgetList;

constexpr SKIA_Rect kRect = {1, 2, 3, 4, 0xFF112233};
constexpr SKIA_Point kLine = {5, 6, 7, 8, 0xFF445566, 9};

class WidgetListTest : public WidgetTest {
 protected:
  void SetUp() override {
    WidgetTest::SetUp();
    WidgetList::init();
  }

  static int addText(const std::string& text) {
    const SKIA_Text record = textRecord(text);
    return WidgetList::addQueue(SKIA_LABEL, &kRect, nullptr, &record);
  }
  static std::vector<LogLine> invalid(const std::string& operation, int index) {
    return {{kDebug, "BRIMOL_WIDGETLIST",
             "[WIDGET] " + operation + ": index is invalid " + std::to_string(index) + " "}};
  }
  static const SKIA_Item& item(int index) {
    return *WidgetList::save.at(static_cast<std::size_t>(WidgetList::index2slot(index))).item;
  }
};

TEST_F(WidgetTest, DisplayItemsNeedAnOpenTable) {
  const SKIA_Text text = textRecord("a");
  EXPECT_EQ(WidgetList::addQueue(SKIA_LABEL, &kRect, &kLine, &text), -1024);
  EXPECT_EQ(WidgetList::getSlot(), -1024);
  EXPECT_EQ(WidgetList::show() + WidgetList::show(1) + WidgetList::hide(1), 0);
  EXPECT_EQ(WidgetList::hideShadow() + WidgetList::remove(1), 0);
  EXPECT_EQ(WidgetList::setText(1, "a", 1) + WidgetList::setColor(1, 2, 3, 4), 0);
  EXPECT_EQ(WidgetList::setRect(1, kRect) + WidgetList::setFontSize(1, 2), 0);
  EXPECT_EQ(WidgetList::index_num, 0);
  EXPECT_TRUE(platform().takeDrawings().empty());
  EXPECT_TRUE(platform().takeLog().empty());
}

TEST_F(WidgetListTest, CopiesAndDrawsItems) {
  const SKIA_Text text = textRecord("abc", 1, 2, 3);
  EXPECT_EQ(WidgetList::addQueue(SKIA_IMAGE, &kRect, nullptr, &text), 1);
  EXPECT_EQ(WidgetList::addQueue(SKIA_LINE, nullptr, &kLine, nullptr), 2);
  EXPECT_EQ(WidgetList::show(), 1);
  const Drawing image = {
      .call = Call::Item, .rect = kRect, .text = {"abc", 1, 2, 3}, .kind = SKIA_IMAGE};
  const Drawing line = {.call = Call::Item, .line = kLine, .kind = SKIA_LINE};
  EXPECT_EQ(platform().takeDrawings(), (std::vector{image, line}));
}

TEST_F(WidgetListTest, HidesAndShowsItems) {
  const int first = addText("first");
  const int second = addText("second");
  const auto texts = [] {
    std::vector<std::string> drawn;
    WidgetList::show();
    for (const Drawing& each : platform().takeDrawings()) drawn.push_back(each.text.text);
    return drawn;
  };
  EXPECT_EQ(WidgetList::hide(first), 1);
  EXPECT_EQ(texts(), std::vector<std::string>{"second"});
  EXPECT_EQ(WidgetList::remove(second), 1);
  EXPECT_EQ(WidgetList::show(first), 1);
  EXPECT_EQ(texts(), (std::vector<std::string>{"first", "second"})) << "nothing is removed";
  for (const int missing : {0, 3, -104, std::numeric_limits<int>::min()}) {
    EXPECT_EQ(WidgetList::hide(missing), -104) << missing;
    EXPECT_EQ(WidgetList::show(missing), -104) << missing;
  }
}

TEST_F(WidgetListTest, VeilsTheItems) {
  addText("item");
  EXPECT_EQ(WidgetList::hideShadow(), 1);
  const std::vector<Drawing> drawn = platform().takeDrawings();
  ASSERT_EQ(drawn.size(), 2U);
  EXPECT_EQ(drawn[0].text.text, "item");
  EXPECT_EQ(drawn[1], (Drawing{.call = Call::Box, .rect = {0, 0, 539, 939, 0x7F000000}}));
}

TEST_F(WidgetListTest, NeverUsesAnIndexAgain) {
  EXPECT_EQ(addText("a"), 1);
  EXPECT_EQ(WidgetList::destroy(), 0);
  EXPECT_EQ(addText("b"), -1024);
  EXPECT_EQ(WidgetList::init(), 1);
  EXPECT_EQ(addText("c"), 2);
  EXPECT_EQ(WidgetList::init(), 1) << "empties an open table";
  EXPECT_EQ(WidgetList::index2slot(2), -104);
  EXPECT_EQ(WidgetList::findEmpty(), 0);
  EXPECT_EQ(addText("d"), 3);
}

TEST_F(WidgetListTest, AFullTableReplacesSlot100) {
  for (int i = 1; i <= 128; ++i) EXPECT_EQ(addText(std::to_string(i)), i);
  EXPECT_EQ(WidgetList::findEmpty(), -100);
  EXPECT_EQ(WidgetList::getSlot(), 100);
  WidgetList::hide(101);
  EXPECT_EQ(WidgetList::addQueue(SKIA_LINE, nullptr, &kLine, nullptr), 101);
  EXPECT_EQ(addText("again"), 101);
  EXPECT_EQ(WidgetList::index_num, 128);
  WidgetList::show();
  const std::vector<Drawing> drawn = platform().takeDrawings();
  ASSERT_EQ(drawn.size(), 128U);
  EXPECT_EQ(drawn[100], (Drawing{.call = Call::Item, .rect = kRect, .text = {.text = "again"}}));
  EXPECT_EQ(drawn[99].text.text, "100");
}

TEST_F(WidgetListTest, RunsOutOfIndexes) {
  WidgetList::index_num = 0x0FFFFFFE;
  EXPECT_EQ(addText("last"), 0x0FFFFFFF);
  EXPECT_EQ(addText("none"), -101);
  WidgetList::index_num = std::numeric_limits<int>::max();
  EXPECT_EQ(addText("none"), -101);
  EXPECT_EQ(WidgetList::findEmpty(), 1);
}

TEST_F(WidgetListTest, ChangesAnItem) {
  const int index = addText("abc");
  EXPECT_EQ(WidgetList::setText(index, "wxyz", 3), 1);
  EXPECT_EQ(WidgetList::setColor(index, 0xA, 0xB, 0xC), 1);
  EXPECT_EQ(item(index).point.color, 0xCU);
  EXPECT_EQ(item(index).rect.color, 0xBU);
  EXPECT_EQ(WidgetList::setRect(index, {9, 8, 7, 6, 5}), 1);
  EXPECT_EQ(WidgetList::setFontSize(index, 40), 1);
  EXPECT_EQ(item(index).rect, (SKIA_Rect{9, 8, 7, 6, 5}));
  EXPECT_EQ(item(index).text.color, 0xAU);
  EXPECT_EQ(item(index).text.size, 40);
  EXPECT_STREQ(item(index).text.text, "wxy");
  EXPECT_EQ(item(index).text.string_len, 3);
  EXPECT_EQ(WidgetList::setText(index, "", 0), 1);
  EXPECT_STREQ(item(index).text.text, "wxy") << "a length of 0 changes nothing";
}

TEST_F(WidgetListTest, KeepsTextsWithinTheirRecords) {
  const int index = addText("abc");
  const std::string tooLong(300, 'x');
  WidgetList::setText(index, tooLong.c_str(), 300);
  EXPECT_EQ(item(index).text.text, std::string(127, 'x'));
  EXPECT_EQ(item(index).text.string_len, 127);
  WidgetList::setText(index, nullptr, 9);
  EXPECT_EQ(item(index).text.string_len, 0);
  SKIA_Text unbounded;
  std::memset(&unbounded, 0x7F, sizeof unbounded);
  const int hostile = WidgetList::addQueue(SKIA_LABEL, nullptr, nullptr, &unbounded);
  EXPECT_EQ(item(hostile).text.string_len, 127);
  EXPECT_EQ(std::strlen(item(hostile).text.text), 127U);
}

TEST_F(WidgetListTest, LogsAnIndexThatIsMissing) {
  for (const int index : {0, 1, -5}) {
    EXPECT_EQ(WidgetList::setText(index, "a", 1), -104);
    EXPECT_EQ(platform().takeLog(), invalid("setText", index));
    EXPECT_EQ(WidgetList::setColor(index, 1, 2, 3), -104);
    EXPECT_EQ(platform().takeLog(), invalid("setColor", index));
    EXPECT_EQ(WidgetList::setRect(index, kRect), -104);
    EXPECT_EQ(platform().takeLog(), invalid("setRect", index));
    EXPECT_EQ(WidgetList::setFontSize(index, 1), -104);
    EXPECT_EQ(platform().takeLog(), invalid("setFontSize", index));
  }
}

TEST_F(WidgetListTest, IsReachedFromC) {
  EXPECT_EQ(addBoxFromC(33), 1);
  EXPECT_EQ(item(1).kind, SKIA_BOX);
  EXPECT_EQ(item(1).rect, (SKIA_Rect{1, 2, 33, 4, 0xFF00FF00}));
  WidgetList::destroy();
  EXPECT_EQ(addBoxFromC(33), -1024);
}

TEST_F(WidgetTest, CEntryPointsDriveTheRedrawFlag) {
  EXPECT_EQ(raiseFlagFromC(), 1);
  EXPECT_EQ(MW::isDisplayUpdate(0), 0) << "tested and cleared";
  EXPECT_EQ(takeFlagFromC(), 2);
  EXPECT_EQ(EventService_GetEvent_c(), 0);
  EXPECT_EQ(isFirstFingerFromC(MW::kEventRelease, 0), 1);
  EXPECT_EQ(isFirstFingerFromC(MW::kEventRelease, 1), 0);
  EXPECT_EQ(isFirstFingerFromC(MW::kEventKeyPress, 0), 0);
  EXPECT_EQ(isFirstFinger_c(nullptr), 0);
}

}  // namespace
