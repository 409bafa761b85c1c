#include <MW/detail/double_tap.h>

#include "support/widget_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words

struct Tap {
  uint32_t pressed, released;
};
struct Taps : Row {
  std::vector<Tap> taps;
  std::vector<int> counts;  // 0: not counted
};
class DoubleTap : public testing::TestWithParam<Taps> {};

TEST_P(DoubleTap, CountsTapsInARow) {
  MW::DoubleTap doubleTap;
  std::vector<int> counts;
  for (const Tap& tap : GetParam().taps) {
    doubleTap.press(tap.pressed);
    counts.push_back(doubleTap.isRunning() ? doubleTap.tap(tap.released) : 0);
  }
  EXPECT_EQ(counts, GetParam().counts);
}

const std::vector<Taps> kTaps = {
    {"EveryQuickTap", {{1000, 1100}, {1200, 1300}, {1400, 1500}}, {1, 2, 3}},
    {"LastTickOfATap", {{1000, 1499}, {1600, 1700}}, {1, 2}},
    {"ATapThatLastsTooLong", {{1000, 1500}, {1600, 1700}}, {0, 1}},
    {"LastTickBetweenReleases", {{1000, 1100}, {1200, 1599}}, {1, 2}},
    {"ALateRelease", {{1000, 1100}, {1200, 1600}}, {1, 0}},
    {"APressThatIsNotYetStale", {{1000, 1100}, {1600, 1601}}, {1, 0}},
    {"AStalePress", {{1000, 1100}, {1601, 1650}}, {1, 1}},
    {"TickZeroStandsForNone", {{0, 0}, {900, 1000}, {1100, 1200}}, {0, 1, 2}},
    {"TheWrapCutsASeriesShort", {{~15U, ~7U}, {2, 10}, {1000, 1100}, {1200, 1300}}, {0, 1, 1, 2}},
};
INSTANTIATE_TEST_SUITE_P(, DoubleTap, testing::ValuesIn(kTaps), kRowName);

}  // namespace
