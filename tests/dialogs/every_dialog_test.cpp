// What holds for every dialog: how it enters and leaves the screen, and that it bears any input.

#include <MW/MW.h>

#include "dialogs/dialog_plays.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words

struct DialogCase : Row {
  Maker make;
  const char* places;  // of the last boxes and texts, on a screen of 1920 x 1080
};
const auto kDialogs = std::to_array<DialogCase>({
    {"Dialog", makes<MW::Dialog>(0), "538,631 417x162|964,630 419x164|965,631 417x162|"},
    {"DialogNew", makes<MW::DialogNew>("Title", 5, 7), "529,541 862x170|0,0 0x0|548,378 824x152|"},
    {"DialogList", threeRows, "538,716 417x162|964,715 419x164|965,716 417x162|"},
    {"DialogShell", makes<MW::DialogShell>("Title"), "538,907 844x162|0,0 0x0|0,0 0x0|"},
    {"DialogSlide", makes<MW::DialogSlide>(3), "529,627 284x170|1099,627 284x170|814,627 284x170|"},
    {"DialogSelect", makes<MW::DialogSelect>(0U), "384,564 384x384|1152,564 384x384|"},
    {"DialogWarn", makes<MW::DialogWarn>(MW::kColorRed), "0,0 1921x1081|"},
    {"AutoCapScreen", makes<MW::AutoCapScreen>(0U), "0,0 1921x1081|"},
});
class EveryDialog : public WidgetTest, public testing::WithParamInterface<DialogCase> {};

TEST_P(EveryDialog, StandsInTheMiddleOfTheTopLayerUntilItIsHidden) {
  setScreen(1920, 1080);
  const auto dialog = GetParam().make();
  const std::string all = places(shown(*dialog));
  EXPECT_TRUE(all.ends_with(GetParam().places)) << all;
  EXPECT_EQ(layerSize(MW::kTopLayer), 1);
  EXPECT_EQ(dialog->hide(), 1);
  EXPECT_FALSE(dialog->isActive());
}

const Steps kAnyInput = {
    press(300, 1500), drag(INT_MIN, INT_MAX),      release(INT_MIN, INT_MAX), press(0, 0),
    keyDown(323),     longPress(INT_MAX, INT_MIN), drag(INT_MAX, INT_MIN),    release()};

TEST_P(EveryDialog, BearsAnyScreenAndInput) {
  for (const int w : {0, 1, 7, -1, -1080, INT_MIN, INT_MAX}) {
    for (const int h : {0, 6, 9, -5, INT_MIN, INT_MAX}) {
      setScreen(w, h);
      EXPECT_NE(played(GetParam().make, kAnyInput), "") << w << ' ' << h;
    }
  }
}

INSTANTIATE_TEST_SUITE_P(, EveryDialog, testing::ValuesIn(kDialogs), kRowName);

}  // namespace
