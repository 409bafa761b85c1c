#include <MW/dialog_slide.h>

#include "dialogs/dialog_plays.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::DialogSlide;
using DialogSlideTest = WidgetTest;

std::unique_ptr<MW::Widget> prompt() {
  auto made = makesOwn<DialogSlide>(DialogSlide::kRepeatPassedTest)();
  auto& slide = static_cast<DialogSlide&>(*made);
  slide.hoverCallback = [](MW::mouse_event* mouse) { noteTouch("hover", mouse); };
  slide.leftCallback = [](int value) { noteZero("left", value); };
  slide.rightCallback = [](int value) { noteZero("right", value); };
  return made;
}

// The thumb's left edge: 145 to 915, at home 526.
Step lookAtThumb() {
  return look([](MW::Widget& widget) { return shown(widget).back().rect.x; });
}

const PlaysOn kPrompt = {prompt};
const PlayTests kPlays = {
    kPrompt("DraggedToTheLeftEndItAnswersAndGoesHome",
            {press(905, 1623), drag(-381, 0), drag(INT_MIN, 0), lookAtThumb(), release(),
             lookAtThumb(), lookAtLog()},
            "touch+ hover+ hover+ <145> lift left+ <526> <[DIALOGSLIDE] Left Slide>"),
    kPrompt("ATapRepeatsTheAnswerOfTheLastDrag",
            {press(526, 1396), drag(INT_MAX, 0), lookAtThumb(), release(), press(), release(),
             press(), drag(389, 0), drag(-1, 0), release()},
            "touch+ hover+ <915> lift right+ touch+ lift right+ touch+ hover+ hover+ lift+"),
    kPrompt("BesideTheThumbOnlyKeysAreTaken",
            {press(525, 1396), press(906, 1396), release(), finger(UINT_MAX), drag(5, 0), plug(5),
             keyDown(5), keyUp(323)},
            "touch- touch- lift- hover- - down5+ up323+"),
    kPrompt("ASecondFingerTakesTheThumbOver",
            {press(526, 1396), finger(1), drag(9, 0), press(), finger(0), drag(9, 0), release(),
             finger(1), drag(9, 0), lookAtThumb(), lookAtLog()},
            "touch+ hover- touch+ hover- lift- hover+ <535> <[DIALOGSLIDE] onSlidePressed!!: 2>"),
    kPrompt("InTheDarkTheThumbIsIgnoredUntilItIsHidden",
            {press(526, 1396), lcdOn(0), drag(9, 0), release(), press(), hide(), press()},
            "touch+ hover- lift- touch- touch+"),
};

struct Open : DialogSlide {
  using DialogSlide::DialogSlide;
  using DialogSlide::second;
};

TEST_F(DialogSlideTest, TakesTextsThatFitAndTheThumbsWidth) {
  Open slide(5);
  slide.setTitle(kTooLong.c_str());
  slide.setDesc(kTooLong.c_str() + 1);
  slide.setDesc2("two");
  EXPECT_STREQ(slide.second.text, "two") << "undrawn";
  slide.setLeft(nullptr);
  slide.setRight("Go");
  slide.setSlide("<>", 100);
  EXPECT_EQ(words(shown(slide)), '|' + kTooLong.substr(1) + "||Go|<>|");
  EXPECT_EQ(shown(slide).back().rect.w, 380);
  slide.setRect(5);
  EXPECT_EQ(shown(slide).back().rect.w, 100) << "once the thumb is at home";
}

}  // namespace
