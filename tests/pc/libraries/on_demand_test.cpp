// Libraries that are opened when they are needed.
#include "libraries/on_demand.h"

#include <gtest/gtest.h>

#include <string>

namespace brimol::pc {
namespace {

TEST(OnDemand, FindsFunctionsAndTellsWhatIsMissing) {
  OnDemand mathematics("libm.so.6");
  double (*const root)(double) = mathematics.function("sqrt");
  ASSERT_EQ(mathematics.error(), "");
  EXPECT_EQ(root(9), 3);
  double (*const none)(double) = mathematics.function("brimol_none");
  EXPECT_EQ(none, nullptr);
  EXPECT_NE(mathematics.error().find("brimol_none"), std::string::npos);

  OnDemand missing("libbrimol_missing.so.1");
  EXPECT_NE(missing.error().find("libbrimol_missing.so.1"), std::string::npos);
  double (*const other)(double) = missing.function("sqrt");
  EXPECT_EQ(other, nullptr);
}

}  // namespace
}  // namespace brimol::pc
