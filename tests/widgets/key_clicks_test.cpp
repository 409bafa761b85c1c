#include <MW/detail/key_clicks.h>

#include "support/widget_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words

struct Click {
  uint32_t code, at;
};
struct Clicks : Row {
  std::vector<Click> clicks;
  std::vector<int> counts;
};
class KeyClicks : public testing::TestWithParam<Clicks> {};

TEST_P(KeyClicks, CountsReleasesOfOneKey) {
  MW::KeyClicks keyClicks;
  std::vector<int> counts;
  for (const auto& [code, at] : GetParam().clicks) {
    keyClicks.follow({1, code}, at);
    counts.push_back(keyClicks.click(code, at));
  }
  EXPECT_EQ(counts, GetParam().counts);
}

const std::vector<Clicks> kClicks = {
    {"EachWithinASecond", {{5, 1000}, {5, 1999}, {5, 2998}, {5, 2998}}, {1, 2, 3, 4}},
    {"AfterASecond", {{5, 1000}, {5, 2000}, {5, 2001}}, {1, 1, 2}},
    {"AnotherKey", {{5, 1000}, {6, 1001}, {5, 1002}, {5, 1003}}, {1, 1, 1, 2}},
    {"TheCodeThatStandsForNoKey", {{65535, 1000}, {65535, 1001}}, {1, 2}},
    {"TheWrapCutsASeriesShort", {{5, ~15U}, {5, ~7U}, {5, 10}}, {1, 1, 2}},
};
INSTANTIATE_TEST_SUITE_P(, KeyClicks, testing::ValuesIn(kClicks), kRowName);

TEST(KeyClicksTest, AKeyThatIsNotFollowedEndsTheSeries) {
  MW::KeyClicks keyClicks;
  keyClicks.follow({1, 5}, 1000);
  EXPECT_EQ(keyClicks.click(5, 1000), 1);
  EXPECT_EQ(keyClicks.click(6, 1001), 0);
  EXPECT_EQ(keyClicks.click(5, 1002), 0);
  EXPECT_EQ(keyClicks.lastKey.code, MW::KeyClicks::kNoKey);
}

}  // namespace
