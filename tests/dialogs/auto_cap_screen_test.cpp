#include <MW/auto_cap_screen.h>

#include "support/drawings.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using AutoCapScreenTest = WidgetTest;

TEST_F(AutoCapScreenTest, ChangesItsColoursAndTextsAtOnce) {
  MW::AutoCapScreen page(7);
  EXPECT_EQ(page.getBgColor(), 0U) << "the argument is not read";
  page.setBgColor(1);
  page.setBg_title(2);
  EXPECT_EQ(shown(page).front().rect.color, 1U);
  page.setText_str(3, "LONGER");
  EXPECT_STREQ(page.getText(3)->text, "LONGER");
  page.setTextColor(3, 5);
  EXPECT_EQ(page.getTextColor(3), 5U);
  page.setTextColor(4, 6);
  EXPECT_EQ(page.getTextColor(4), 0U) << "no such box";
  EXPECT_EQ(page.getText(4), nullptr);
}

}  // namespace
