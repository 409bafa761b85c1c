// What can be read, and what a finger meant.
#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <vector>

#include "exit_code.h"
#include "layout.h"
#include "press_guard.h"
#include "text_fit.h"

namespace factory_test {
namespace {

// As WCAG 2 defines it.
double luminance(uint32_t color) {
  constexpr std::array<double, 3> kWeights = {0.0722, 0.7152, 0.2126};  // blue, green, red
  double sum = 0;
  for (std::size_t i = 0; i < kWeights.size(); ++i) {
    const double part = (color >> (8 * i) & 0xFF) / 255.0;
    const double linear = part <= 0.04045 ? part / 12.92 : std::pow((part + 0.055) / 1.055, 2.4);
    sum += kWeights.at(i) * linear;
  }
  return sum;
}

double contrast(uint32_t one, uint32_t other) {
  const double first = luminance(one) + 0.05;
  const double second = luminance(other) + 0.05;
  return std::max(first, second) / std::min(first, second);
}

TEST(PageLook, EveryTextCanBeReadOnItsGround) {
  for (const Ink& ink : kInks) {
    EXPECT_GE(contrast(ink.text, ink.ground), 4.5) << std::hex << ink.ground;
  }
}

TEST(PageLook, AMarkIsSeenAmongTheRows) {
  for (const Ink& ink : {kRowInk, kPassInk, kFailInk, kPageInk}) {
    EXPECT_GE(contrast(kMarkInk.ground, ink.ground), 4.5) << std::hex << ink.ground;
  }
}

bool touch(const SKIA_Rect& one, const SKIA_Rect& other) {
  return one.x < other.x + other.w && other.x < one.x + one.w && one.y < other.y + other.h &&
         other.y < one.y + one.h;
}

TEST(PageLook, PartsOfAPageStandApartOnEveryScreen) {
  for (const ScreenSize screen :
       {ScreenSize{320, 480}, ScreenSize{480, 800}, ScreenSize{1440, 2560}, ScreenSize{2560, 1440},
        ScreenSize{480, 320}}) {
    const PageLayout page = layOutPage(screen);
    const std::vector<SKIA_Rect> parts = {page.leave,       page.title,      page.hint,
                                          page.line,        page.content,    page.verdicts[0],
                                          page.verdicts[1], page.verdicts[2]};
    for (std::size_t i = 0; i < parts.size(); ++i) {
      const SKIA_Rect& part = parts.at(i);
      EXPECT_TRUE(part.w > 0 && part.h > 0 && part.x >= 0 && part.y >= 0);
      EXPECT_LE(part.x + part.w, screen.width);
      EXPECT_LE(part.y + part.h, screen.height);
      for (std::size_t j = 0; j < i; ++j) EXPECT_FALSE(touch(part, parts.at(j))) << i << ' ' << j;
    }
  }
}

TEST(PressGuardTest, CountsOnlyWhatWasMeant) {
  constexpr uint32_t kShown = 0xFFFFFF00;  // the clock wraps meanwhile
  PressGuard guard(kShown);
  EXPECT_FALSE(guard.takeClick()) << "the finger was down before";
  guard.press(kShown + PressGuard::kDeafMs - 1);
  EXPECT_FALSE(guard.takeClick()) << "too early, however late it lifts";
  guard.press(kShown + PressGuard::kDeafMs);
  EXPECT_TRUE(guard.takeClick());
  EXPECT_FALSE(guard.takeClick()) << "a press is one click";
}

TEST(TextFitTest, CutsRowsOfWideLettersShorter) {
  const std::string wide(100, 'W');
  const std::string usual = "an ordinary line of a log, as long as it comes\n";
  EXPECT_EQ(bytesThatFit(usual, 10, 1000, 40), 40);
  EXPECT_EQ(bytesThatFit(usual + wide, 10, 190, 40), 20);
  EXPECT_EQ(bytesThatFit(wide, 10, 0, 40), 1);
  EXPECT_EQ(bytesThatFit("", 10, 190, 40), 40);
}

TEST(TextFitTest, CutsLinesBetweenWordsAndNeverInsideACharacter) {
  using Lines = std::vector<std::string>;
  EXPECT_EQ(wrapped("one two three", 10, 50), (Lines{"one two", "three"}));
  EXPECT_EQ(wrapped("one\n\ntwo ", 10, 50), (Lines{"one", "", "two "}));
  EXPECT_EQ(wrapped("모두 검사하지 않음", 10, 40), (Lines{"모두", "검사하지", "않음"}));
  EXPECT_EQ(wrapped("모두검사", 10, 20), (Lines{"모두", "검사"})) << "a word that has no room";
  EXPECT_EQ(wrapped("é\xFF", 10, 1), (Lines{"é", "\xFF"})) << "a letter always has room";
  EXPECT_EQ(fitted("one two", 10, 50, 14).lines, Lines{"one two"});
  EXPECT_LT(fitted("disproportionate", 10, 60, 100).size, 10) << "rather than a cut word";
}

TEST(ExitCodeTest, TellsTheWorst) {
  std::string error;
  auto book = ResultBook::open(std::filesystem::path(), error);
  const std::vector<std::string> tests = {"one", "two"};
  EXPECT_EQ(judgeRun(*book, tests), ExitCode::Incomplete);
  book->record({.test = "one", .verdict = Verdict::Pass}, error);
  EXPECT_EQ(judgeRun(*book, tests), ExitCode::Incomplete);
  book->record({.test = "other", .verdict = Verdict::Fail}, error);
  book->record({.test = "two", .verdict = Verdict::Pass}, error);
  EXPECT_EQ(judgeRun(*book, tests), ExitCode::Passed);
  book->record({.test = "one", .verdict = Verdict::Fail}, error);
  book->record({.test = "two", .verdict = Verdict::None}, error);
  EXPECT_EQ(judgeRun(*book, tests), ExitCode::Failed);
  EXPECT_EQ(worse(ExitCode::Failed, ExitCode::Incomplete), ExitCode::Failed);
  EXPECT_EQ(worse(ExitCode::Passed, ExitCode::Incomplete), ExitCode::Incomplete);
}

}  // namespace
}  // namespace factory_test
