#include "core/bounded_text.h"

#include <cstring>
#include <string>

#include "support/widget_test.h"

namespace {

using brimol::test::kRowName;
using brimol::test::Row;

auto letters(std::size_t count) { return std::string(count, 'a'); }

struct CutCase : Row {
  std::string given;
  std::size_t kept;  // bytes
};

class BoundedText : public testing::TestWithParam<CutCase> {};

TEST_P(BoundedText, CutsAtAWholeCharacter) {
  const CutCase& row = GetParam();
  EXPECT_EQ(MW::boundedText(row.given.c_str()), row.given.substr(0, row.kept));
  EXPECT_EQ(MW::boundedText(row.given.c_str(), row.given.size()), row.given.substr(0, row.kept));
}

// U+00E9 has two bytes, U+AC00 three, U+1F600 four.
INSTANTIATE_TEST_SUITE_P(
    Texts, BoundedText,
    testing::Values(CutCase{"Empty", "", 0}, CutCase{"Fits", letters(126), 126},
                    CutCase{"JustFits", letters(127), 127},
                    CutCase{"OneTooMany", letters(128), 127},
                    CutCase{"FarTooMany", letters(200), 127},
                    CutCase{"TwoBytesFit", letters(125) + "\u00e9", 127},
                    CutCase{"TwoBytesBeforeTheCut", letters(125) + "\u00e9x", 127},
                    CutCase{"TwoBytesAcross", letters(126) + "\u00e9", 126},
                    CutCase{"ThreeBytesBeforeTheCut", letters(124) + "\uac00x", 127},
                    CutCase{"ThreeBytesAcross1", letters(125) + "\uac00", 125},
                    CutCase{"ThreeBytesAcross2", letters(126) + "\uac00", 126},
                    CutCase{"FourBytesBeforeTheCut", letters(123) + "\U0001f600x", 127},
                    CutCase{"FourBytesAcross1", letters(124) + "\U0001f600", 124},
                    CutCase{"FourBytesAcross3", letters(126) + "\U0001f600x", 126},
                    CutCase{"NoCharacters", std::string(200, '\x80'), 127},
                    CutCase{"LeadBytesOnly", std::string(200, '\xF0'), 127}),
    kRowName);

TEST(BoundedTextTest, NullIsEmpty) {
  EXPECT_EQ(MW::boundedText(nullptr), "");
  EXPECT_EQ(MW::boundedText(nullptr, 5), "");
}

TEST(BoundedTextTest, CountEndsTheText) {
  EXPECT_EQ(MW::boundedText("abcdef", 3), "abc");
  EXPECT_EQ(MW::boundedText("abcdef", 0), "");
  EXPECT_EQ(MW::boundedText("abc", 100), "abc") << "nothing behind the NUL is read";
}

TEST(BoundedTextTest, ARecordWithoutNulIsCut) {
  SKIA_Text given = {};
  std::memset(given.text, 'x', sizeof given.text);
  given.color = 1;
  given.align = 2;
  given.size = 3;
  given.string_len = -7;
  const SKIA_Text copied = MW::copyText(&given);
  EXPECT_EQ(copied.text, std::string(127, 'x'));
  EXPECT_EQ(copied.string_len, 127);
  EXPECT_EQ(copied.color, 1U);
  EXPECT_EQ(copied.align, 2);
  EXPECT_EQ(copied.size, 3);
  EXPECT_EQ(MW::copyText(nullptr).string_len, 0);
}

// A widget may be given a part of its own text.
TEST(BoundedTextTest, TakesItsOwnText) {
  SKIA_Text record = {};
  MW::putText(record, "abcdef");
  MW::putText(record, MW::boundedText(record.text + 2));
  EXPECT_STREQ(record.text, "cdef");
  EXPECT_EQ(record.string_len, 4);
}

TEST(BoundedTextTest, OpenTextKeepsWhatStandsBehind) {
  SKIA_Text record = {};
  MW::putText(record, "abcdef");
  MW::putTextOpen(record, "XY");
  EXPECT_STREQ(record.text, "XYcdef");
  EXPECT_EQ(record.string_len, 2);
}

}  // namespace
