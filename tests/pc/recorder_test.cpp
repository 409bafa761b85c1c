#include "recorder.h"

#include <brimol/frame.h>
#include <gtest/gtest.h>

#include <thread>
#include <utility>

#include "frame_sink.h"
#include "painting.h"

namespace brimol::pc {

namespace {
std::vector<Frame> submitted;  // by the test's own thread alone
}

void submitFrame(Frame&& frame) { submitted.push_back(std::move(frame)); }

namespace {

const SKIA_Rect kRect = {1, 2, 3, 4, kRed};
const SKIA_Point kPoint = {5, 6, 7, 8, kBlue, 9};

class RecorderTest : public testing::Test {
 protected:
  RecorderTest() { submitted.clear(); }
};

TEST_F(RecorderTest, EachCallAddsItsKind) {
  const SKIA_Text text = textOf("words");
  skia_begin_frame_c();
  EXPECT_EQ(skia_add_label_c(kRect, text), SKIA_LABEL);
  EXPECT_EQ(skia_add_textbox_c(kRect, text), SKIA_TEXTBOX);
  EXPECT_EQ(skia_add_buttonbox_c(kRect, text), SKIA_BUTTONBOX);
  EXPECT_EQ(skia_add_box_c(kRect), SKIA_BOX);
  EXPECT_EQ(skia_add_roundbox_c(kRect), SKIA_ROUNDBOX);
  EXPECT_EQ(skia_add_staticbox_c(kRect, text), SKIA_STATICBOX);
  EXPECT_EQ(skia_add_line_c(kPoint), SKIA_LINE);
  const SKIA_Item image = textItem(SKIA_IMAGE, kRect, text);
  EXPECT_EQ(skia_add_widget_c(&image), SKIA_IMAGE);
  EXPECT_EQ(skia_add_roundtextbox_c(kRect, text), SKIA_ROUNDTEXTBOX);
  EXPECT_EQ(skia_add_roundbuttonbox_c(kRect, text), SKIA_ROUNDBUTTONBOX);
  EXPECT_EQ(skia_add_arrow_c(kRect, kPoint), SKIA_ARROW);
  skia_end_frame_c();

  ASSERT_EQ(submitted.size(), 1U);
  for (int32_t kind = SKIA_LABEL; kind <= SKIA_ARROW; ++kind) {
    const SKIA_Item& item = submitted[0].at(static_cast<std::size_t>(kind));
    EXPECT_EQ(item.kind, kind);
    const bool hasPoint = kind == SKIA_LINE || kind == SKIA_ARROW;
    EXPECT_EQ(item.rect.h, kind == SKIA_LINE ? 0 : kRect.h) << kind;
    EXPECT_EQ(item.point.width, hasPoint ? kPoint.width : 0) << kind;
  }
  EXPECT_STREQ(submitted[0][SKIA_ROUNDBUTTONBOX].text.text, "words");
}

TEST_F(RecorderTest, TakesNothingOutsideAFrame) {
  EXPECT_LT(skia_add_box_c(kRect), 0);
  skia_end_frame_c();
  EXPECT_TRUE(submitted.empty());
  skia_begin_frame_c();
  skia_end_frame_c();
  EXPECT_LT(skia_add_box_c(kRect), 0);
  ASSERT_EQ(submitted.size(), 1U);
  EXPECT_TRUE(submitted[0].empty());
}

TEST_F(RecorderTest, RefusesWhatIsNoItem) {
  skia_begin_frame_c();
  const SKIA_Item below = boxItem(kRect, -1);
  const SKIA_Item above = boxItem(kRect, SKIA_ARROW + 1);
  EXPECT_LT(skia_add_widget_c(nullptr), 0);
  EXPECT_LT(skia_add_widget_c(&below), 0);
  EXPECT_LT(skia_add_widget_c(&above), 0);
  EXPECT_EQ(skia_add_box_c(kRect), 0);
  skia_end_frame_c();
}

TEST_F(RecorderTest, ANewFrameDropsTheOneThatWasNotEnded) {
  skia_begin_frame_c();
  skia_add_box_c(kRect);
  skia_begin_frame_c();
  EXPECT_EQ(skia_add_line_c(kPoint), 0);
  skia_end_frame_c();
  ASSERT_EQ(submitted.size(), 1U);
  ASSERT_EQ(submitted[0].size(), 1U);
  EXPECT_EQ(submitted[0][0].kind, SKIA_LINE);
}

TEST_F(RecorderTest, AFullFrameTakesNoMore) {
  skia_begin_frame_c();
  for (int i = 0; i < kMostItems; ++i) ASSERT_EQ(skia_add_box_c(kRect), i);
  EXPECT_EQ(skia_add_box_c(kRect), kNotTaken);
  skia_end_frame_c();
  EXPECT_EQ(submitted.at(0).size(), static_cast<std::size_t>(kMostItems));
}

TEST_F(RecorderTest, EachThreadHasItsFrame) {
  skia_begin_frame_c();
  int added = 0;
  std::thread([&added] { added = skia_add_box_c(kRect); }).join();
  EXPECT_EQ(added, kNotTaken);
  skia_end_frame_c();
}

}  // namespace
}  // namespace brimol::pc
