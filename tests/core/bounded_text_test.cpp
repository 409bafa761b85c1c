#include "core/bounded_text.h"

#include <gtest/gtest.h>

#include <string>

namespace {

using MW::boundedText;
using MW::countedText;

TEST(BoundedTextTest, CutsAtAWholeCharacter) {
  for (const std::string character : {"a", "\u00e9", "\uac00", "\U0001f600"}) {
    for (std::size_t start = 120; start < 130; ++start) {
      const std::string given = std::string(start, 'a') + character + "behind";
      const std::size_t end = start + character.size();
      const std::size_t kept = start < 127 && end > 127 ? start : 127;
      EXPECT_EQ(boundedText(given.c_str()), given.substr(0, kept));
      EXPECT_EQ(boundedText(given.c_str(), end), given.substr(0, std::min(kept, end)));
      EXPECT_EQ(countedText(given.c_str(), end), given.substr(0, std::min(kept, end)));
    }
  }
  EXPECT_EQ(boundedText(std::string(200, '\x80').c_str()).size(), 127U) << "no characters";
  EXPECT_EQ(MW::cutText("\u00e9", 1), "") << "there is no room for the first character";
  EXPECT_EQ(boundedText("abc", 100), "abc");
  EXPECT_EQ(boundedText(nullptr, 5), "");
}

TEST(BoundedTextTest, ACountIsBelievedOrNot) {
  const std::string given("ab\0cd", 5);
  EXPECT_EQ(boundedText(given.c_str(), 5), "ab") << "up to the NUL";
  EXPECT_EQ(countedText(given.c_str(), 5), given);
  EXPECT_EQ(countedText(nullptr, 5), "");
  EXPECT_EQ(countedText(given.c_str(), 0), "");
}

TEST(BoundedTextTest, ARecordEndsWithANulOrByItsLengthAlone) {
  SKIA_Text record = {};
  MW::putText(record, "abcdef");
  MW::putTextOpen(record, "XY");
  EXPECT_EQ(record.string_len, 2);
  EXPECT_STREQ(record.text, "XYcdef");
  MW::putText(record, "Z");
  EXPECT_STREQ(record.text, "Z");
  MW::putText(record, {});
  EXPECT_EQ(record.string_len + record.text[0], 0);
}

}  // namespace
