// How a text is cut into rows.

#include <MW/detail/text_lines.h>

#include <array>
#include <random>
#include <string>

#include "support/widget_test.h"

namespace {

using namespace brimol::test;  // NOLINT(google-build-using-namespace): a test's own words
using MW::TextLines;

// The rows, each behind its line's number or, where it goes on with a line, "+".
std::string rowsOf(const TextLines& lines) {
  std::string all;
  for (int row = 0; row < lines.count(); ++row) {
    const int number = lines.number(row);
    all += number == TextLines::kContinued ? "+" : std::to_string(number);
    all.append(lines.text(row)) += '|';
  }
  return all;
}

struct CutCase : Row {
  const char* text;
  std::size_t rowBytes;
  const char* rows;
};
constexpr auto kCuts = std::to_array<CutCase>({
    {"Empty", "", 4, "1|"},
    {"TwoEnds", "a\n\n", 4, "1a|2|"},
    {"ARowThatIsFull", "abcd\ne", 4, "1abcd|+|2e|"},
    {"DroppedBytes", "a\r\x02\x03z\r\n", 2, "1az|+|"},
    {"ACharacterThatDoesNotFit", "ab\xE2\x82\xAC!", 4, "1ab|+\xE2\x82\xAC!|+|"},
    {"ARowShorterThanACharacter", "\xE2\x82\xAC", 1, "1\xE2|+\x82|+\xAC|+|"},
    {"ContinuationBytesAlone", "\x80\x80\x80\x80\x80\x80", 4, "1\x80\x80\x80\x80|+\x80\x80|"},
});

class TextLinesCut : public testing::TestWithParam<CutCase> {};

TEST_P(TextLinesCut, GivesRows) {
  EXPECT_EQ(rowsOf(TextLines(GetParam().text, GetParam().rowBytes, 1)), GetParam().rows);
}
INSTANTIATE_TEST_SUITE_P(, TextLinesCut, testing::ValuesIn(kCuts), kRowName);

TEST(TextLines, RowsGiveTheTextBack) {
  constexpr std::array kPieces = {"word", "\n", "\r\x02\x03", "\xE2\x82\xAC", "\x80\x80\x80\xFF"};
  std::minstd_rand random(5);
  for (int round = 0; round < 300; ++round) {
    std::string text;
    for (auto i = random() % 200; i > 0; --i) text += kPieces.at(random() % kPieces.size());
    const std::size_t rowBytes = 1 + random() % 127;
    const TextLines lines(text + '\n', rowBytes, 1);
    std::string joined;
    for (int row = 0; row < lines.count(); ++row) {
      EXPECT_LE(lines.text(row).size(), rowBytes);
      (joined += lines.number(row) > 1 ? "\n" : "") += lines.text(row);
    }
    std::erase_if(text, [](char byte) { return byte == '\r' || byte == '\x02' || byte == '\x03'; });
    EXPECT_EQ(joined, text);
  }
}

TEST(TextLines, NothingStandsBeyondTheRows) {
  const TextLines lines("a", 2, 1);
  for (const int64_t row : {int64_t{-1}, int64_t{1}, INT64_MIN, INT64_MAX}) {
    EXPECT_EQ(lines.text(row), "");
    EXPECT_EQ(lines.number(row), TextLines::kContinued);
  }
  EXPECT_EQ(TextLines().count(), 0);
}

}  // namespace
