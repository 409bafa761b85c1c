#include <MW/c_api.h>

#include <array>

#include "support/widget_test.h"

extern "C" void callFromC(int* results);  // in c_api_test.c

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words

using CApiTest = WidgetTest;

TEST_F(CApiTest, ReachesTheToolkit) {
  MW::WidgetList::init();
  std::array<int, 5> results = {};
  callFromC(results.data());
  EXPECT_EQ(results, (std::array{1, 1, 2, 1, 0}));
  MW::WidgetList::show();
  EXPECT_EQ(platform().takeDrawings().at(0).rect, (SKIA_Rect{1, 2, 33, 4, 0xFF00FF00}));
}

}  // namespace
