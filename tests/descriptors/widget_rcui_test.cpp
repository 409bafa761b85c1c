// What is built from descriptors, good ones and bad.

#include <MW/MW.h>

#include <bit>

#include "support/drawings.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words

class WidgetRcuiTest : public WidgetTest {
 protected:
  std::vector<Drawing> build(int kind) {
    ref.kind = kind;
    MW::WidgetList::init();
    const MW::WidgetRcui built(&ref, &words, 0);
    if (MW::Widget* const w = built.getPointer()) w->onHideTimer(9);
    MW::WidgetList::show();
    MW::Window::show(9);
    return platform().takeDrawings();
  }

  MW::ref_t ref = {.visible = 1, .cbIndex = 1, .rect = {9, 8, 70, 40, 5}, .text = textRecord("x")};
  MW::ref_cb_t words;
};

TEST_F(WidgetRcuiTest, BuildsByKind) {
  std::string drawn;
  for (int kind = -1; kind < 44; ++kind) {
    const auto all = build(kind);
    if (all.empty()) continue;
    drawn += kind < 10 ? std::to_string(all[0].kind) : places({all[0]}) + all.back().text.text;
    drawn += ' ';
  }
  EXPECT_EQ(drawn,
            "1 14 3 14 6 7 14 1 1 0 0,0 1441x2561|CANCEL 0,0 1441x2561|x 9,8 70x40|x "
            "28,2083 441x441|x 497,2083 441x441|x 966,2083 441x441|x 9,8 70x40|EXIT "
            "9,8 70x40|EXIT 9,8 70x40|x 0,0 1441x2561| ");
  build(8);
  ref.rect = {1, 1000, 1, 1, 1};
  EXPECT_EQ(places(build(7)) + places(build(3)), "9,48 70x40|1,1000 1x1|");
  EXPECT_EQ(places(build(7)), "9,88 70x40|");
}

TEST_F(WidgetRcuiTest, GivesTheCallbacksAndTheFiveTexts) {
  const std::array<std::uintptr_t, 15> given = {1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12, 13, 14, 15};
  words = std::bit_cast<MW::ref_cb_t>(given);
  ref.kind = 26;
  MW::WidgetRcui built(&ref, &words, 0);
  const MW::Widget& w = *built.getPointer();
  // clang-format off
  const std::array copied = {w.pressCallback, w.hoverCallback, w.clickCallback, w.longPressCallback, w.doubleClickCallback,
      w.callbackWord5, w.keyPressCallback, w.keyReleaseCallback, w.plugCallback, w.doubleKeyCallback, w.tripleKeyCallback,
      w.touchPressCallback, w.touchReleaseCallback, w.button1Callback, w.button2Callback, w.hookKeyCallback, w.rowPressCallback,
      w.callbackWord17, w.callbackWord18, w.leftCallback, w.rightCallback, w.exitCallback};
  const std::array<std::uintptr_t, 22> expected = {1, 15, 2, 3, 4, 5, 8, 9, 14, 11, 12, 5, 6, 6, 7, 13, 5, 6, 7, 6, 7, 6};
  // clang-format on
  EXPECT_EQ((std::bit_cast<std::array<std::uintptr_t, 22>>(copied)), expected);
  std::array<SKIA_Text, 5> desc = {textRecord("line")};
  std::ranges::fill(desc[3].text, 'x');
  desc[3].string_len = -1;
  ref.desc = desc.data();
  ref.text.string_len = INT_MAX;
  EXPECT_EQ(build(9).back().text.text, "x");
  EXPECT_EQ(build(14).back().text.text, std::string(126, 'x'));
  EXPECT_EQ(build(23).back().text.text, "line");
}

TEST_F(WidgetRcuiTest, RefusesBadDescriptors) {
  ref.kind = 43;
  MW::WidgetRcui none(&ref, nullptr, 0);
  const MW::WidgetRcui nothing(nullptr, nullptr, 0);
  platform().takeLog();
  none.makeRcuiWidget(&ref, 0);
  none.registerCallBack(&words, 3, 0);
  none.registerCallBack(nullptr, 4, 0);
  EXPECT_EQ(none.getPointer(), nullptr);
  const std::string copies = "[WIDGETRCUI] WidgetRcui::registerCallBack() // cb_index = ";
  EXPECT_EQ(platform().takeLog(),
            logLines(kDebug, {"[WIDGETRCUI] makeRcuiWidget item(43) iyys not allow", copies + "3 ",
                              "[WIDGETRCUI] WidgetRcui -> w is NULL : 3 ", copies + "4 ",
                              "[WIDGETRCUI] WidgetRcui -> ref_cb is NULL : 4 ",
                              "[WIDGETRCUI] getPointer -> w is null."}));
  ref.kind = 0;
  std::ranges::fill(ref.text.text, 'x');
  none.makeRcuiWidget(&ref, 0);
  EXPECT_EQ(platform().takeLog().back().message, "[WIDGETRCUI] WidgetRcui -> text has no NUL");
}

}  // namespace
