#include <MW/detail/knob_hold.h>

#include "support/widget_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words

constexpr Spot kOnKnob = {10, 69};
constexpr Spot kBeside = {110, 69};

class KnobHold : public testing::Test {
 protected:
  // What each kind of a finger's touches means there, by their codes: - nothing, G grab, C cancel,
  // M move, D drop.
  std::string meaning(Spot spot, unsigned int finger) {
    std::string all;
    for (const auto code :
         {MW::kEventMotion, MW::kEventRelease, MW::kEventLongPress, MW::kEventPress}) {
      const MW::event_data event = pointerEvent(code, spot, finger);
      all += "-GCMD"[static_cast<int>(knobHold.touch(event, {10, 20, 100, 50, 0}))];
    }
    return all;
  }

  std::atomic<int> selection = 0;
  std::atomic<int> ownerFinger = -1;
  MW::FingerHold hold{selection};
  MW::KnobHold knobHold{hold, ownerFinger};
};

TEST_F(KnobHold, AFreeKnobIsGrabbedByAPressOnIt) {
  EXPECT_EQ(meaning(kOnKnob, 0), "---G");
  EXPECT_EQ(meaning(kBeside, 0), "----");
}

TEST_F(KnobHold, AHeldKnobFollowsItsOwnerUntilAnyPressBesideIt) {
  for (const unsigned int other : {1U, 2U}) {
    knobHold.grab({0, 2, 0, 0, 0, 0});
    EXPECT_EQ(selection, 3);
    EXPECT_EQ(meaning(kOnKnob, 2), "MD-G");
    EXPECT_EQ(meaning(kOnKnob, 1), "---G") << "it may be taken over";
    EXPECT_EQ(meaning(kBeside, other), other == 2 ? "MD-C" : "---C");
    EXPECT_EQ(selection, 0);
    EXPECT_EQ(ownerFinger, -1);
  }
}

}  // namespace
