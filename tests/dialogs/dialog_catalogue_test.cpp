#include "dialogs/dialog_catalogue.h"

#include <gtest/gtest.h>

#include <climits>
#include <string>

namespace {

// A character for each kind from 0 to 40, of which 22 and 40 are none: the number of its layout,
// and the buttons that answer (both, the left one, none).
constexpr const char* kLayouts = "00001140111102340004000560444444400444700";
constexpr const char* kTouches = "bbbbbbbbbbbbbnnlbbblbbblbblllllllbblllnbb";

TEST(DialogCatalogueTest, GivesEachKindItsLayoutAndItsButtons) {
  std::string layouts;
  std::string touches;
  for (int kind = 0; kind <= 40; ++kind) {
    layouts += std::to_string(MW::dialogLayout(kind).number);
    touches += "nlb"[static_cast<int>(MW::catalogueEntry(kind).buttons.touches)];
  }
  EXPECT_EQ(layouts, kLayouts);
  EXPECT_EQ(touches, kTouches);
}

TEST(DialogCatalogueTest, HasNoWordsForOtherNumbers) {
  for (const int kind : {INT_MIN, -1, 22, 40, INT_MAX}) {
    EXPECT_EQ(MW::catalogueEntry(kind).title, nullptr) << kind;
  }
  EXPECT_STREQ(MW::catalogueEntry(20).lines.first, "Test already Pass.");
  EXPECT_STREQ(MW::catalogueEntry(21).lines.first, "Test already pass.");
}

}  // namespace
