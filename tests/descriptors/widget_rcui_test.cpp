// What is built from descriptors, good ones and bad.

#include <MW/MW.h>

#include <bit>

#include <brimol3_widget_test/drawings.h>
#include "support/widget_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using std::string;

// A text record of these bytes whose length says what it wants.
SKIA_Text counted(const string& bytes, int length) {
  SKIA_Text text = {};
  bytes.copy(text.text, SKIA_TEXT_BYTES);
  text.string_len = length;
  return text;
}
const string kFull(SKIA_TEXT_BYTES, 'x');  // no room for a NUL
const SKIA_Text kBad = counted(kFull, -1);

class WidgetRcuiTest : public WidgetTest {
 protected:
  std::vector<Drawing> build(int kind) {
    ref.kind = kind;
    MW::WidgetList::init();
    const MW::WidgetRcui built(&ref, &callbacks, 0);
    if (MW::Widget* const w = built.getPointer()) w->onHideTimer(9);
    MW::WidgetList::show();
    MW::Window::show(9);
    return platform().takeDrawings();
  }
  // What it has complained of since the last look.
  static string complaints() {
    string all;
    for (const LogLine& line : platform().takeLog()) {
      if (line.priority == kError) all += line.message + '\n';
    }
    return all;
  }

  MW::ref_t ref = {.visible = 1, .cbIndex = 1, .rect = {9, 8, 70, 40, 5}, .text = textRecord("x")};
  MW::ref_cb_t callbacks;
};

struct Descriptor : Row {
  int kind;
  SKIA_Text text;
  string
      shown;  // an item's type and text; where a widget's first drawing stands, and its last text
  string complaint = {};  // without what all begin with
};
const auto kDescriptors = std::to_array<Descriptor>({
    {"NegativeKind", -1, kBad, "", "kind is unknown : -1\n"},
    {"KindWithoutAName", 16, kBad, ""},
    {"PlatformsOwn", 3, kBad, "14"},
    {"Image", MW::kRcuiImage, counted("a.png", 5), "7a.png"},
    {"ANulWithinAnItemsLength", MW::kRcuiTextbox, counted({"ab\0d", 4}, 4), {"1ab\0d", 5}},
    {"NoNul", MW::kRcuiTextbox, counted(kFull, 5), "1xxxxx", "text has no NUL\n"},
    {"NoNulAndHalfACharacter", MW::kRcuiTextbox, counted(kFull.substr(2) + "\u00e9", 127),
     '1' + kFull.substr(2) + '\0', "text has no NUL\n"},
    {"BadLengthOfAnItem", MW::kRcuiTextbox, counted("a", 128), "1a", "text length is bad : 128\n"},
    {"BadLength", MW::kRcuiButton, counted("a", 128), "9,8 70x40|a", "text length is bad : 128\n"},
    {"Dialog", MW::kRcuiDialog, kBad, "0,0 1441x2561|CANCEL"},
    {"DialogNew", MW::kRcuiDialogNew, counted("x", 1), "0,0 1441x2561|x"},
    {"Button3Left", MW::kRcuiButton3Left, counted("x", 1), "28,2083 441x441|x"},
    {"Button3Centre", MW::kRcuiButton3Centre, counted("x", 1), "497,2083 441x441|x"},
    {"Button3Right", MW::kRcuiButton3Right, counted("x", 1), "966,2083 441x441|x"},
    {"SlideFromRight", MW::kRcuiSlideFromRight, counted("x", 1), "9,8 70x40|EXIT"},
    {"FullScreen", MW::kRcuiFullScreen, kBad, "0,0 1441x2561|"},
    {"Key", MW::kRcuiKey, kBad, ""},
});

class RcuiKinds : public WidgetRcuiTest, public testing::WithParamInterface<Descriptor> {};

TEST_P(RcuiKinds, BuildWhatTheyNameAndJudgeWhatTheyShow) {
  const Descriptor& row = GetParam();
  ref.text = row.text;
  const std::vector<Drawing> all = build(row.kind);
  const string start = "[WIDGETRCUI] WidgetRcui -> ";
  EXPECT_EQ(complaints(), row.complaint.empty() ? "" : start + row.complaint);
  string seen;
  if (!all.empty()) {
    const bool isItem = all[0].call == Call::Item;
    seen = isItem ? std::to_string(all[0].kind) : places({all[0]});
    // A row that ends here does not look at the text.
    if (!row.shown.ends_with(seen)) seen += all.back().text.text;
  }
  EXPECT_EQ(seen, row.shown);
}
INSTANTIATE_TEST_SUITE_P(, RcuiKinds, testing::ValuesIn(kDescriptors), kRowName);

TEST_F(WidgetRcuiTest, AColumnGoesOnBelowItsLastItem) {
  build(MW::kRcuiFirstInColumn);
  ref.rect = {1, 1000, 1, 1, 1};
  EXPECT_EQ(places(build(MW::kRcuiNextInColumn)), "9,48 70x40|");
  EXPECT_EQ(places(build(MW::kRcuiNextInColumn)), "9,88 70x40|");
  ref.visible = 0;
  EXPECT_EQ(build(MW::kRcuiNextInColumn).at(0).kind, 14);
}

TEST_F(WidgetRcuiTest, FiveTextsAreThereByTheirLengths) {
  std::array<SKIA_Text, 5> desc = {textRecord("one"), counted("", 3), textRecord("three"), kBad};
  ref.desc = desc.data();
  const std::vector<Drawing> dialog = build(MW::kRcuiDialogNew);
  EXPECT_NE(words(dialog).find("one||three|"), string::npos) << "the empty line is one";
  EXPECT_EQ(dialog.back().text.text, kFull.substr(2)) << "the caption";
  platform().ticks = 0;  // a toast box that nobody has shown yet draws at tick 0 alone
  EXPECT_EQ(words(build(MW::kRcuiToastbox)), "x|one|");
  desc[0] = counted("one", 0);
  EXPECT_EQ(words(build(MW::kRcuiToastbox)), "x|");
}

TEST_F(WidgetRcuiTest, GivesTheCallbacks) {
  const auto word = [](std::uintptr_t number) { return std::bit_cast<MW::Callback>(number); };
  callbacks = {word(1), word(2),  word(3),  word(4),  word(5),  word(6),  word(7), word(8),
               word(9), word(10), word(11), word(12), word(13), word(14), word(15)};
  ref.kind = MW::kRcuiKey;
  MW::WidgetRcui built(&ref, &callbacks, 0);
  const MW::Widget& w = *built.getPointer();
  // clang-format off
  const std::array copied = {w.pressCallback, w.hoverCallback, w.clickCallback, w.longPressCallback, w.doubleClickCallback,
      w.callbackWord5, w.keyPressCallback, w.keyReleaseCallback, w.plugCallback, w.doubleKeyCallback, w.tripleKeyCallback,
      w.touchPressCallback, w.touchReleaseCallback, w.button1Callback, w.button2Callback, w.hookKeyCallback, w.rowPressCallback,
      w.callbackWord17, w.callbackWord18, w.leftCallback, w.rightCallback, w.exitCallback};
  const std::array<std::uintptr_t, 22> expected = {1, 15, 2, 3, 4, 5, 8, 9, 14, 11, 12, 5, 6, 6, 7, 13, 5, 6, 7, 6, 7, 6};
  // clang-format on
  for (std::size_t i = 0; i < expected.size(); ++i) {
    EXPECT_EQ(std::bit_cast<std::uintptr_t>(copied[i]), expected[i]) << "word " << i;
  }
  ref.cbIndex = 0;
  MW::WidgetRcui silent(&ref, &callbacks, 0);
  EXPECT_FALSE(silent.getPointer()->pressCallback);
}

TEST_F(WidgetRcuiTest, SaysWhatIsMissing) {
  ref.kind = 16;
  MW::WidgetRcui none(&ref, nullptr, 0);
  const MW::WidgetRcui nothing(nullptr, nullptr, 0);
  EXPECT_EQ(complaints(), "[WIDGETRCUI] WidgetRcui -> ref is NULL\n");
  none.registerCallBack(&callbacks, 3, 0);
  none.registerCallBack(nullptr, 4, 0);
  EXPECT_EQ(none.getPointer(), nullptr);
  EXPECT_EQ(none.makeRcuiWidget(&ref, 0), 0) << "no item";
}

}  // namespace
