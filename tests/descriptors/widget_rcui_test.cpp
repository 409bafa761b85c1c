// What is built from descriptors, good ones and bad.

#include <MW/MW.h>

#include <bit>

#include "support/drawings.h"

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

struct KindCase : Row {
  int kind;
  int item;                // the item's type, or kNoItem
  const char* shown = "";  // where a widget's first drawing stands, and its last text
};
constexpr int kNoItem = -1;
const auto kKinds = std::to_array<KindCase>({
    {"Negative", -1, kNoItem},
    {"Nameless", 1, 14},
    {"Line", MW::kRcuiLine, SKIA_LINE},
    {"Label", MW::kRcuiLabel, SKIA_LABEL},
    {"Nothing", 16, kNoItem},
    {"DialogNew", MW::kRcuiDialogNew, kNoItem, "0,0 1441x2561|x"},
    {"Button", MW::kRcuiButton, kNoItem, "9,8 70x40|x"},
    {"Button3Left", MW::kRcuiButton3Left, kNoItem, "28,2083 441x441|x"},
    {"Button3Centre", MW::kRcuiButton3Centre, kNoItem, "497,2083 441x441|x"},
    {"Button3Right", MW::kRcuiButton3Right, kNoItem, "966,2083 441x441|x"},
    {"SlideFromLeft", MW::kRcuiSlideFromLeft, kNoItem, "9,8 70x40|EXIT"},
    {"SlideFromRight", MW::kRcuiSlideFromRight, kNoItem, "9,8 70x40|EXIT"},
    {"FullScreen", MW::kRcuiFullScreen, kNoItem, "0,0 1441x2561|"},
    {"Beyond", 43, kNoItem},
});

class RcuiKinds : public WidgetRcuiTest, public testing::WithParamInterface<KindCase> {};

TEST_P(RcuiKinds, BuildWhatTheyName) {
  const KindCase& row = GetParam();
  const std::vector<Drawing> all = build(row.kind);
  if (row.item != kNoItem) {
    EXPECT_EQ(all.at(0).kind, row.item);
  } else {
    EXPECT_EQ(all.empty() ? "" : places({all[0]}) + all.back().text.text, row.shown);
  }
  EXPECT_EQ(complaints(), row.kind < 0 ? "[WIDGETRCUI] WidgetRcui -> kind is unknown : -1\n" : "");
}
INSTANTIATE_TEST_SUITE_P(, RcuiKinds, testing::ValuesIn(kKinds), kRowName);

TEST_F(WidgetRcuiTest, AColumnGoesOnBelowItsLastItem) {
  build(MW::kRcuiFirstInColumn);
  ref.rect = {1, 1000, 1, 1, 1};
  EXPECT_EQ(places(build(MW::kRcuiNextInColumn)), "9,48 70x40|");
  EXPECT_EQ(places(build(MW::kRcuiBox)), "1,1000 1x1|");
  EXPECT_EQ(places(build(MW::kRcuiNextInColumn)), "9,88 70x40|");
  ref.visible = 0;
  EXPECT_EQ(build(MW::kRcuiNextInColumn).at(0).kind, 14);
}

struct TextCase : Row {
  int kind;
  SKIA_Text text;
  string shown;      // the last text
  string complaint;  // without what all begin with
};
const auto kTexts = std::to_array<TextCase>({
    {"ANulWithinAnItemsLength", MW::kRcuiTextbox, counted({"ab\0d", 4}, 4), {"ab\0d", 4}, ""},
    {"NoNul", MW::kRcuiTextbox, counted(kFull, 5), "xxxxx", "text has no NUL\n"},
    {"NegativeLength", MW::kRcuiLabel, counted("ab", -1), "ab", "text length is bad : -1\n"},
    {"LengthBeyondTheRecord", MW::kRcuiButton, counted("ab", 128), "ab",
     "text length is bad : 128\n"},
    {"OfABox", MW::kRcuiBox, kBad, "", ""},
    {"OfADialog", MW::kRcuiDialog, kBad, "CANCEL", ""},
    {"OfAFullScreen", MW::kRcuiFullScreen, kBad, "", ""},
    {"OfAKey", MW::kRcuiKey, kBad, "", ""},
});

class RcuiTexts : public WidgetRcuiTest, public testing::WithParamInterface<TextCase> {};

TEST_P(RcuiTexts, AreJudgedWhereTheyAreShown) {
  ref.text = GetParam().text;
  const std::vector<Drawing> all = build(GetParam().kind);
  const string start = "[WIDGETRCUI] WidgetRcui -> ";
  EXPECT_EQ(complaints(), GetParam().complaint.empty() ? "" : start + GetParam().complaint);
  if (GetParam().kind != MW::kRcuiBox) {
    EXPECT_EQ(all.empty() ? "" : all.back().text.text, GetParam().shown);
  }
}
INSTANTIATE_TEST_SUITE_P(, RcuiTexts, testing::ValuesIn(kTexts), kRowName);

TEST_F(WidgetRcuiTest, FiveTextsAreThereByTheirLengths) {
  std::array<SKIA_Text, 5> desc = {textRecord("one"), counted("", 3), textRecord("three"), kBad};
  ref.desc = desc.data();
  const std::vector<Drawing> dialog = build(MW::kRcuiDialogNew);
  EXPECT_NE(words(dialog).find("one||three|"), string::npos) << "the empty line is one";
  EXPECT_EQ(dialog.back().text.text, kFull.substr(2)) << "the caption";
  EXPECT_EQ(words(build(MW::kRcuiToastbox)), "x|one|");
  desc[0] = counted("", 4);
  EXPECT_EQ(words(build(MW::kRcuiToastbox)), "x||");
  desc[0] = counted("one", 0);
  EXPECT_EQ(words(build(MW::kRcuiToastbox)), "x|");
}

TEST_F(WidgetRcuiTest, GivesTheCallbacks) {
  const std::array<std::uintptr_t, 15> given = {1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12, 13, 14, 15};
  callbacks = std::bit_cast<MW::ref_cb_t>(given);
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
  EXPECT_EQ((std::bit_cast<std::array<std::uintptr_t, 22>>(copied)), expected);
  ref.cbIndex = 0;
  MW::WidgetRcui silent(&ref, &callbacks, 0);
  EXPECT_FALSE(silent.getPointer()->pressCallback);
}

TEST_F(WidgetRcuiTest, SaysWhatIsMissing) {
  ref.kind = 16;
  MW::WidgetRcui none(&ref, nullptr, 0);
  const MW::WidgetRcui nothing(nullptr, nullptr, 0);
  EXPECT_EQ(complaints(), "[WIDGETRCUI] WidgetRcui -> ref is NULL\n");
  none.makeRcuiWidget(&ref, 0);
  none.registerCallBack(&callbacks, 3, 0);
  none.registerCallBack(nullptr, 4, 0);
  EXPECT_EQ(none.getPointer(), nullptr);
  const string copies = "[WIDGETRCUI] WidgetRcui::registerCallBack() // cb_index = ";
  EXPECT_EQ(platform().takeLog(),
            logLines(kDebug, {"[WIDGETRCUI] makeRcuiWidget item(16) iyys not allow", copies + "3 ",
                              "[WIDGETRCUI] WidgetRcui -> w is NULL : 3 ", copies + "4 ",
                              "[WIDGETRCUI] WidgetRcui -> ref_cb is NULL : 4 ",
                              "[WIDGETRCUI] getPointer -> w is null."}));
}

}  // namespace
