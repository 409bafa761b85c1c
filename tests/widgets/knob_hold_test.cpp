#include <MW/detail/knob_hold.h>

#include "support/widget_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using Touch = MW::KnobHold::Touch;

constexpr SKIA_Rect kKnob = {10, 20, 100, 50, 0};
constexpr Spot kOnKnob = {10, 69};
constexpr Spot kBeside = {110, 69};

class KnobHold : public testing::Test {
 protected:
  void grab(unsigned int finger) { knobHold.grab({0, finger, 0, 0, 0, 0}); }
  Touch touch(MW::EventCode code, Spot spot, unsigned int finger) {
    return knobHold.touch(pointerEvent(code, spot, finger), kKnob);
  }

  std::atomic<int> selection = 0;
  std::atomic<int> ownerFinger = -1;
  MW::FingerHold hold{selection};
  MW::KnobHold knobHold{hold, ownerFinger};
};

TEST_F(KnobHold, AFreeKnobIsGrabbedByAPressOnItAlone) {
  EXPECT_EQ(touch(MW::kEventPress, kBeside, 0), Touch::NotMine);
  EXPECT_EQ(touch(MW::kEventMotion, kOnKnob, 0), Touch::NotMine);
  EXPECT_EQ(touch(MW::kEventRelease, kOnKnob, 0), Touch::NotMine);
  EXPECT_EQ(touch(MW::kEventLongPress, kOnKnob, 0), Touch::NotMine);
  EXPECT_EQ(touch(MW::kEventPress, kOnKnob, 0), Touch::Grab);
}

TEST_F(KnobHold, FollowsItsOwnerAnywhere) {
  grab(2);
  EXPECT_EQ(selection, 3);
  EXPECT_EQ(ownerFinger, 2);
  EXPECT_EQ(touch(MW::kEventMotion, kBeside, 2), Touch::Move);
  EXPECT_EQ(touch(MW::kEventRelease, kBeside, 2), Touch::Drop);
  EXPECT_EQ(touch(MW::kEventLongPress, kOnKnob, 2), Touch::NotMine);
  EXPECT_EQ(touch(MW::kEventMotion, kOnKnob, 1), Touch::NotMine);
  EXPECT_EQ(touch(MW::kEventRelease, kOnKnob, 1), Touch::NotMine);
  EXPECT_EQ(knobHold.touch(keyEvent(MW::kEventKeyPress, 2), kKnob), Touch::NotMine);
}

TEST_F(KnobHold, APressBesideTheKnobCancelsTheHold) {
  for (const unsigned int finger : {0U, 1U}) {
    grab(0);
    EXPECT_EQ(touch(MW::kEventPress, kBeside, finger), Touch::Cancel);
    EXPECT_EQ(selection, 0);
    EXPECT_EQ(ownerFinger, -1);
  }
}

TEST_F(KnobHold, AnotherFingerMayTakeTheKnobOver) {
  grab(0);
  EXPECT_EQ(touch(MW::kEventPress, kOnKnob, 1), Touch::Grab);
}

}  // namespace
