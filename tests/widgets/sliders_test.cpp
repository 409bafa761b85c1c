// What the exit slide and the value slide make of fingers, numbers and hostile records.

#include <MW/MW.h>

#include "support/script.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using SlidersTest = WidgetTest;

constexpr SKIA_Rect kBar = {0, 0, 600, 100, 7};

template <int state>
void makeExit() {
  hold<MW::SlideE>(state, &kBar, nullptr, "unread");
}
// Locking has no effect on it, and so may tell its value.
struct ToldSlide : MW::SlideMove {
  using SlideMove::SlideMove;
  void Lock() override { told += std::to_string(getValue()); }
};
template <int percent, int a, int b, int initial>
void makeValue() {
  hold<ToldSlide>(&kBar, percent, a, b, initial);
}

// clang-format off
constexpr auto kSlides = std::to_array<MadeCase>({
    {makeExit<0>, "p99,99 m499 ? m1 ?", "++<1/0/499>E+<0/0/0>"},
    {makeExit<0>, "p100,0 p0,0 m-5 m5 ? r900,0 ? m5", "-+++<1/0/5>+<0/0/0>-"},
    {makeExit<1>, "p500,0 m-499 m9 m-10 ? m600", "+++E+<0/0/500>-"},
    {makeExit<4>, "p0,0 m2147483647 ? p0,0 m-2147483648 ?", "+E+<0/0/0>++<1/0/0>"},
    {makeExit<7>, "p500,0 m-2147483648 ? m2147483647 ?", "++<1/0/0>+<1/0/500>"},
    {makeExit<0>, "p0,0 m50 f1 m60 r l k5 f2 p300,9 ? f0 m600 g", "++----+<0/0/0>-[SLIDE_EXIT] Another touch finger pressed!\nDisabled button selection!"},
    {makeValue<0, 0, 100, 50>, "? p240,9 m239 ? L m1 ? L", "<0/0/240>++<1/0/479>99+<1/0/480>100"},
    {makeValue<80, 0, 200, 80>, "p120,9 m29 ? L m1 L m900 ? L", "++<1/0/149>99+100+<1/0/300>100"},
    {makeValue<51, 10, 10, 5>, "? L", "<0/0/3000>10"},
    {makeValue<50, 100, 0, 50>, "? p0,0 m-9 m150 ? L", "<0/0/0>+++<1/0/150>50"},
    {makeValue<50, 150, 250, 0>, "? L p0,0 m0 L", "<0/0/0>150++100"},
    {makeValue<20, 0, 100, 100>, "p480,0 m-48 f3 m9 p0,0 ? f0 m9 g", "++-+<0/0/432>-[SLIDE] pressed!!: 0"},
    {makeValue<20, INT_MIN, INT_MAX, 0>, "p240,0 m2147483647 ? m-2147483648 L", "++<1/0/480>+-2147483648"},
});
// clang-format on

TEST_F(SlidersTest, FollowTheFingerThatHoldsTheKnob) {
  for (const MadeCase& row : kSlides) expectTold(row);
}

TEST_F(SlidersTest, TakeAnyNumber) {
  const auto hostile = {0, 1, -1, INT_MIN, INT_MAX};
  MW::SlideE back(1, &kBar, nullptr, static_cast<const SKIA_Text*>(nullptr));
  EXPECT_EQ(places(shown(back)).substr(0, 27), "0,0 600x100|0,0 500x100|500");
  EXPECT_EQ(shown(back).at(3).line, (SKIA_Point{0, 0, 0, 0, 0xFFFF0000, 1}));
  MW::SlideMove slide(&kBar, 0, 0, 100, 50);
  EXPECT_EQ(
      places(shown(slide)) + shown(slide).back().text.text,
      "0,0 600x100|0,10 600x80|0,10 243x80|238,-2 124x104|239,-1 122x102|240,0 120x100| 50 %");
  slide.setValue(UINT_MAX);
  EXPECT_EQ(shown(slide).back().text.text + places({shown(slide).back()}), " -1 %-4,0 120x100|");
  for (const int w : hostile) {
    for (const int x : hostile) {
      const SKIA_Rect area = {x, w, w, x, 0};
      slide.setRect(&area);
      slide.setValue(5);
      slide.setMove2Value(static_cast<unsigned int>(x));
      // The knob has no room to move.
      EXPECT_TRUE(w > 0 || (slide.getValue() == 5 && slide.setValue2Move(UINT_MAX) == 0));
      slide.onHover({0, 0, 0, 0, x, 0});
      MW::SlideE exit(x, &area, nullptr, "");
      exit.onHover({0, 0, 0, 0, w, 0});
      EXPECT_EQ(shown(slide).size() + shown(exit).size(), 11u);
    }
  }
}

}  // namespace
