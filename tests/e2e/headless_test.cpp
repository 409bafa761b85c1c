// The whole application without a window: what the user does goes in where a window's input would,
// and what the user sees is compared with the picture of what is to be seen.
#include <gtest/gtest.h>

#include <unistd.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>

#include "application.h"
#include "e2e/app_screens.h"
#include "e2e/user.h"
#include "e2e/verdicts.h"
#include "layout.h"
#include "test.h"

namespace factory_test {
namespace {

using namespace screens;

TEST(HeadlessMenu, ShowsTheRowThatTheUpKeyMarks) {
  runWith({}, [] {
    for (std::size_t row = 0; row < testEntries().size(); ++row) User::key(SDLK_DOWN);
    for (std::size_t row = 1; row < testEntries().size(); ++row) User::key(SDLK_UP);
    constexpr SKIA_Rect kTopRow = {0, 511, kScreen.width, percentOf(kScreen.height, kEntryPercent),
                                   0};
    EXPECT_TRUE(User::sees(kTopRow, 0xFF787878));
  });
}

/// A folder of the test's own.
class HeadlessApplication : public testing::Test {
 protected:
  HeadlessApplication() { std::filesystem::create_directory(folder); }
  ~HeadlessApplication() override { std::filesystem::remove_all(folder); }

  const std::filesystem::path folder =
      std::filesystem::path(testing::TempDir()) / ("headless_test." + std::to_string(getpid()));
  const std::string results = folder / "results.json";
  const std::string report = folder / "report.xml";
};

TEST_F(HeadlessApplication, IsDoneByTouchAlone) {
  const int code = runWith({"--results", results, "--junit", report}, [] {
    User::click(areaOf(kColours));
    for (const uint32_t colour : {0xFFFFFFFF, 0xFFFF0000, 0xFF00FF00}) {
      EXPECT_TRUE(User::sees(kCentre, colour));
      if (colour != 0xFF00FF00) User::click(kCentre);
      User::later(600);  // a tap that follows at once would be a double tap
    }
    User::click(kCentre);
    User::click(kCentre);
    EXPECT_TRUE(User::reads("Was every colour even?"));
    User::click(kPass);
    EXPECT_TRUE(User::sees(areaOf(kColours), kPassColor));

    User::click(areaOf(kTouch));
    EXPECT_TRUE(User::reads(""));
    User::click(kCentre);
    EXPECT_TRUE(User::reads("Lift: finger 0 at 360, 640"));
    User::click(kCentre);
    User::click(kCentre);
    EXPECT_TRUE(User::reads("Double tap. Was every touch met?"));
    User::click(kFail);
    EXPECT_TRUE(User::sees(areaOf(kTouch), kFailColor));

    User::start("switches");
    EXPECT_TRUE(User::sees(kPage.line, kLineColor));
    User::dragFrom(kKnob, kScreen.width);
    EXPECT_TRUE(User::reads("Right"));
    User::click(kPass);
    EXPECT_TRUE(User::seesMenu());

    User::start("prompts");
    EXPECT_TRUE(User::sees(kDialogOk, MW::kColorWhite));
    User::click(kCentre);
    User::click(kDialogCancel);
    EXPECT_TRUE(User::reads("Did all dialogs look right?"));
    User::click(kPass);
    EXPECT_TRUE(User::seesMenu());
  });
  EXPECT_EQ(code, EXIT_SUCCESS);
  EXPECT_EQ(verdictsIn(results), "colours PASS\ntouch FAIL\nswitches PASS\nprompts PASS\n");
  EXPECT_TRUE(std::filesystem::exists(report));
}

TEST_F(HeadlessApplication, IsDoneByKeysAlone) {
  const int code = runWith({"--results", results}, [] {
    User::start("colours");
    EXPECT_TRUE(User::sees(kCentre, MW::kColorWhite));
    User::key(SDLK_RIGHT);
    EXPECT_TRUE(User::sees(kCentre, 0xFFFF0000));
    User::key(SDLK_RETURN);
    EXPECT_TRUE(User::reads("Was every colour even?"));
    for (const SDL_Keycode key : {SDLK_RIGHT, SDLK_RIGHT, SDLK_RIGHT, SDLK_RETURN}) User::key(key);
    EXPECT_TRUE(User::sees(areaOf(kColours), kFailColor));

    User::start("keys");  // the mark stands where it was
    EXPECT_TRUE(User::sees(cellOf(kScreen, kKeyGrid, 0, 0), kButtonColor));
    for (const SDL_Keycode key : {SDLK_UP, SDLK_DOWN, SDLK_LEFT, SDLK_RIGHT, SDLK_RETURN, SDLK_h,
                                  SDLK_PAGEUP, SDLK_PAGEDOWN, SDLK_p, SDLK_HOME, SDLK_HOME}) {
      User::key(key);
    }
    EXPECT_TRUE(User::reads("Twice"));
    User::key(SDLK_HOME);
    EXPECT_TRUE(User::seesMenu()) << "it passes by itself";
    EXPECT_TRUE(User::sees(areaOf(kKeys), kPassColor));

    User::start("brightness");
    EXPECT_TRUE(User::reads(""));
    for (int i = 0; i < 5; ++i) User::key(SDLK_DOWN);
    EXPECT_TRUE(User::sees(kPage.line, 0xFF747679)) << "half of its light";
    User::key(SDLK_ESCAPE);
    EXPECT_TRUE(User::seesMenu());

    User::start("switches");
    EXPECT_TRUE(User::reads(""));
    User::key(SDLK_UP);
    EXPECT_TRUE(User::reads("Right"));
    User::key(SDLK_ESCAPE);
  });
  EXPECT_EQ(code, EXIT_SUCCESS);
  EXPECT_EQ(verdictsIn(results), "colours FAIL\nkeys PASS\nbrightness none\nswitches none\n");
}

TEST_F(HeadlessApplication, RetriesATestAndResumesARun) {
  const auto visit = [] {
    User::click(areaOf(kKeys));
    EXPECT_TRUE(User::sees(cellOf(kScreen, kKeyGrid, 0, 0), kButtonColor));
    User::key(SDLK_UP);
    EXPECT_TRUE(User::sees(cellOf(kScreen, kKeyGrid, 0, 0), kPassColor));
    User::click(kRetry);
    EXPECT_TRUE(User::sees(cellOf(kScreen, kKeyGrid, 0, 0), kButtonColor));
    User::click(kPass);
  };
  EXPECT_EQ(runWith({"--results", results}, visit), EXIT_SUCCESS);
  EXPECT_EQ(verdictsIn(results), "keys PASS\n");
  const auto look = [] { EXPECT_TRUE(User::sees(areaOf(kKeys), kPassColor)); };
  EXPECT_EQ(runWith({"--results", results}, look), EXIT_SUCCESS);
}

TEST_F(HeadlessApplication, RefusesWhatItCannotUse) {
  std::ofstream(results) << "no JSON";
  EXPECT_EQ(runApplication({.headless = true, .results = results}), EXIT_FAILURE);
  EXPECT_EQ(std::filesystem::file_size(results), 7) << "a damaged file stays as it is";
  EXPECT_EQ(runApplication({.headless = true, .shot = folder / "none" / "shot.png"}), EXIT_FAILURE);
  EXPECT_EQ(runApplication({.headless = true, .log = folder / "none"}), EXIT_FAILURE);
  EXPECT_EQ(runApplication({.headless = true, .log = folder}), EXIT_FAILURE);

  struct WrongLine {
    std::vector<const char*> arguments;
    const char* word;
  };
  for (const auto& [arguments, word] :
       std::vector<WrongLine>{{{"--frobnicate"}, "--frobnicate"},
                              {{"--shot"}, "--shot needs"},
                              {{"--results", ""}, "--results needs"},
                              {{"file"}, "'file'"},
                              {{"--results", "a", "--junit", "a"}, "same file"}}) {
    std::string error;
    EXPECT_FALSE(parseOptions(arguments, error)) << word;
    EXPECT_NE(error.find(word), std::string::npos) << error;
  }
}

TEST_F(HeadlessApplication, TellsWhatHappensToButtons) {
  const int code = runWith({}, [] {
    User::click(areaOf(kButtons));
    EXPECT_TRUE(User::sees(areaOf(kPressButton), kButtonColor));
    User::down(areaOf(kPressButton));
    EXPECT_TRUE(User::sees(areaOf(kPressButton), MW::kColorHighlight));
    EXPECT_TRUE(User::reads("Press: 1"));
    User::up(areaOf(kPressButton));
    EXPECT_TRUE(User::sees(areaOf(kPressButton), kButtonColor));
    User::click(areaOf(kClickButton));
    EXPECT_TRUE(User::reads("Click: 1"));
    User::click(areaOf(kDoubleClickButton));
    User::click(areaOf(kDoubleClickButton));
    EXPECT_TRUE(User::reads("Double click: 1"));
    User::down(areaOf(kLongPressButton));
    EXPECT_TRUE(User::reads("Long press: 1"));
    User::up(areaOf(kLongPressButton));
    User::click(areaOf(kDelayedButton));
    EXPECT_TRUE(User::sees(areaOf(kLateButton), kButtonColor));
    User::click(areaOf(kLateButton));
    EXPECT_TRUE(User::reads("Hide me: 1"));
    EXPECT_TRUE(User::sees(areaOf(kLateButton), kGroundColor));
    User::click(kPass);
  });
  EXPECT_EQ(code, EXIT_SUCCESS);
}

}  // namespace
}  // namespace factory_test
