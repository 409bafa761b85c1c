// The choice dialog and the colour pages: what they answer and tell, and which texts they take.

#include <MW/MW.h>

#include "support/script.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using DialogPagesTest = WidgetTest;

template <typename Page>
void make() {
  [[maybe_unused]] auto& page = hold<Page>(9u);
  if constexpr (std::is_same_v<Page, MW::DialogSelect>) {
    page.choiceCallback = [](auto* mouse) { note(static_cast<char>('0' + mouse->state)); };
  }
}
void makeHooked() {
  make<MW::DialogSelect>();
  widget->setButtonType(13);
}
// clang-format off
constexpr auto kPages = std::to_array<MadeCase>({
    {make<MW::DialogSelect>, "p288,624 ? r g ?", "p+<1/1/864>1c-[BUTTON] onBtnReleased!! 0 <0/0/864>"},
    {make<MW::DialogSelect>, "f2 p1151,1935 m1151,1935 ? r", "p+h+<6/1/864>6c-"},
    {make<MW::DialogSelect>, "p288,624 m576,624 ? r288,624", "p+h-<0/0/864>c-"},
    {make<MW::DialogSelect>, "p864,624 r288,1136 ? p863,624", "p+c-<0/0/864>p-"},
    {make<MW::DialogSelect>, "o0 p288,624 m1 r o1 l p288,624 r", "p-h-c--p+1c-"},
    {make<MW::DialogSelect>, "k5 K6 u7 a1 k323 g", "5k+6r+7u+-+[BUTTON] key onPlugKey sym = 7"},
    {makeHooked, "k323 k5", "H+5k+"},
    {make<MW::DialogWarn>, "p1,1 m1 r1,1 l k323 u7 a1 o0 p", "p--c--323k+--p-"},
    {make<MW::AutoCapScreen>, "t1000 K5 t1999 K5 t2998 K5 K5 K6 *", " 5r+ 5D5r+ 5T5r+5r+6r+0"},
});
// clang-format on

TEST_F(DialogPagesTest, TellAndAnswerAndAnyCallbackMayDeleteThem) {
  for (const MadeCase& row : kPages) expectTold(row);
}

TEST_F(DialogPagesTest, TakeTheTextsThatFit) {
  MW::DialogSelect(1).setText_str(6, "no such choice");
  SKIA_Text endless = {};
  std::ranges::fill(endless.text, 'x');
  MW::DialogWarn warn(0xFF112233);
  for (const unsigned int box : {0u, 4u}) warn.setText(box, {}, endless);
  EXPECT_EQ(places(shown(warn)), "0,0 1441x2561|");
  warn.setText(3, {1, 2, 3, 4, 5}, textRecord(std::string(123, 'x')));
  warn.setText(3, {}, textRecord(std::string(124, 'y')));
  warn.setText_str(0, "LONGER");
  warn.setText_str(1, endless.text);
  EXPECT_EQ(shown(warn).at(1).text.text, std::string("LON\0ER", 6)) << "cut where ABC ended";
  EXPECT_EQ(shown(warn).at(2).text.text, "ABC");
  EXPECT_EQ(shown(warn).at(4).text.text, std::string(123, 'x'));
  MW::AutoCapScreen capture(7);
  capture.setText_str(0, "LONGER");
  EXPECT_STREQ(capture.getText(0)->text, "LONGER");
  EXPECT_EQ(capture.getText(4), nullptr);
  capture.setBgColor(1);
  capture.setBg_title(2);
  EXPECT_EQ(shown(capture).front().rect.color, 1u);
}

}  // namespace
