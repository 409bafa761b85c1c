// The real program in a real window, used by a real mouse and seen from outside. To be run on a
// desktop that is larger than the program's screen; the environment's FACTORY_TEST names it.
#include <gtest/gtest.h>
#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <stdexcept>
#include <string>
#include <utility>

#include "e2e/app_screens.h"
#include "e2e/verdicts.h"
#include "support/desktop.h"
#include "support/eventually.h"

namespace factory_test {
namespace {

using brimol::test::Desktop;
using brimol::test::eventually;
using namespace screens;

constexpr int kFailed = 3;  // exit codes
constexpr int kNotAllPassed = 4;
constexpr uint32_t kOpaque = 0xFF000000;

/// The program, from its start to its end.
class Program {
 public:
  explicit Program(std::vector<std::string> options) {
    setenv("BRIMOL_DISPLAY", "window", 1);
    setenv("BRIMOL_DEVICE", kDevice, 1);
    const char* const path = std::getenv("FACTORY_TEST");
    if (path == nullptr) throw std::runtime_error("FACTORY_TEST does not name the program");
    options.emplace(options.begin(), path);
    std::vector<char*> arguments;
    arguments.reserve(options.size() + 1);
    for (std::string& option : options) arguments.push_back(option.data());
    arguments.push_back(nullptr);
    EXPECT_EQ(posix_spawn(&process, path, nullptr, nullptr, arguments.data(), environ), 0);
  }
  ~Program() {
    if (process > 0) kill(process, SIGKILL);
    waitForEnd();
  }
  Program(const Program&) = delete;
  Program& operator=(const Program&) = delete;

  /// Its exit code, or -1 for another end.
  int waitForEnd() {
    int status = 0;
    if (process <= 0 || waitpid(std::exchange(process, 0), &status, 0) < 0) return -1;
    return WIFEXITED(status) ? WEXITSTATUS(status) : -1;
  }
  void interrupt() const { kill(process, SIGTERM); }

 private:
  pid_t process = 0;
};

class WindowApplication : public testing::Test {
 protected:
  WindowApplication() : WindowApplication({}, areaOf(kTouch), kRowInk.ground) {}
  /// Waits until the program shows a colour.
  WindowApplication(const std::vector<std::string>& options, const SKIA_Rect& area, uint32_t colour)
      : program(allOptions(options)) {
    EXPECT_TRUE(eventually([&] {
      place = desktop.findWindow();
      return place.window != 0 && sees(area, colour);
    }));
  }
  ~WindowApplication() override {
    std::filesystem::remove(results);
    std::filesystem::remove(log);
  }

  bool sees(const SKIA_Rect& area, uint32_t colour) const {
    const int x = place.x + area.x + area.w / kInset;
    const int y = place.y + area.y + area.h / kInset;
    return (desktop.colourAt(x, y) | kOpaque) == colour;
  }
  bool comesToSee(const SKIA_Rect& area, uint32_t colour) const {
    return eventually([&] { return sees(area, colour); });
  }
  void mouse(const SKIA_Rect& at, const std::string& does) const {
    const std::string command = "xdotool mousemove " + std::to_string(place.x + at.x + at.w / 2) +
                                " " + std::to_string(place.y + at.y + at.h / 2) + " " + does;
    EXPECT_EQ(std::system(command.c_str()), 0);
  }
  static void keys(const std::string& names) {
    EXPECT_EQ(std::system(("xdotool key " + names).c_str()), 0);
  }
  /// The colours along the middle of a page's line, where its words stand.
  std::vector<uint32_t> line() const {
    return desktop.row(place.x + kPage.line.x, place.y + kPage.line.y + kPage.line.h / 2,
                       kPage.line.w);
  }
  bool comesToReadOtherThan(const std::vector<uint32_t>& before) const {
    return eventually([&] { return line() != before; });
  }

  static constexpr int kInset = 8;  // a look at an area falls this part of it from its corner

  /// A log of 400 lines, of which line 300 says where the needle is.
  static std::string writeLog() {
    std::string file = testing::TempDir() + "window_test.log." + std::to_string(getpid());
    std::ofstream out(file);
    for (int line = 1; line <= 400; ++line) out << (line == 300 ? "a needle" : "hay") << '\n';
    return file;
  }
  bool seesRedWords() const {
    const auto isRed = [](uint32_t colour) {
      return (colour >> 16 & 0xFF) > 0xC0 && (colour & 0xFFFF) == 0;
    };
    for (int y = 0; y < kLogView.h; ++y) {
      const auto row = desktop.row(place.x + kLogView.x, place.y + kLogView.y + y, kLogView.w);
      if (std::ranges::any_of(row, isRed)) return true;
    }
    return false;
  }

  std::vector<std::string> allOptions(const std::vector<std::string>& further) const {
    std::vector<std::string> all = {"--results", results, "--log", log};
    all.insert(all.end(), further.begin(), further.end());
    return all;
  }

  const std::string results = testing::TempDir() + "window_test." + std::to_string(getpid());
  const std::string log = writeLog();
  Program program;
  const Desktop desktop;
  Desktop::Place place;
};

class ButtonsApplication : public WindowApplication {
 protected:
  ButtonsApplication()
      : WindowApplication({"--test", "buttons"}, areaOf(kPressButton), kButtonInk.ground) {}
};

TEST_F(ButtonsApplication, FollowsTheMouse) {
  auto before = line();
  mouse(areaOf(kPressButton), "mousedown 1");
  EXPECT_TRUE(comesToSee(areaOf(kPressButton), MW::kColorHighlight));
  EXPECT_TRUE(comesToReadOtherThan(before));
  before = line();
  mouse(areaOf(kTouch), "");
  EXPECT_TRUE(comesToSee(areaOf(kPressButton), kButtonInk.ground)) << "the mouse moved off it";
  mouse(areaOf(kTouch), "mouseup 1");
  mouse(areaOf(kClickButton), "click 1");
  EXPECT_TRUE(comesToReadOtherThan(before));
  EXPECT_TRUE(comesToSee(kPass, kPass.color));
  mouse(kPass, "click 1");  // not all buttons were used
  EXPECT_TRUE(comesToSee(kPromptYes, kButtonInk.ground));
  mouse(kPromptYes, "click 1");
  EXPECT_TRUE(comesToSee(kMenuHeader, kPageInk.ground));

  keys("Down Down Return");  // the switches
  EXPECT_TRUE(comesToSee(kKnob, MW::kColorWhite));
  before = line();
  mouse(kKnob, "mousedown 1");
  mouse({700, kKnob.y, 10, kKnob.h, 0}, "mouseup 1");
  EXPECT_TRUE(comesToReadOtherThan(before));
  EXPECT_TRUE(comesToSee(kFail, kFail.color));
  mouse(kFail, "click 1");
  EXPECT_TRUE(comesToSee(kMenuHeader, kPageInk.ground));

  keys("Down Down Down Down Return");  // the dialogs
  EXPECT_TRUE(comesToSee(kDialogOk, MW::kColorWhite));
  keys("Right Escape");
  EXPECT_TRUE(comesToSee(kPass, kPass.color)) << "keys judge as soon as fingers do";
  keys("Right Return");
  EXPECT_TRUE(comesToSee(kPromptYes, kButtonInk.ground));
  keys("Return");
  EXPECT_TRUE(comesToSee(kMenuHeader, kPageInk.ground));
  program.interrupt();
  EXPECT_EQ(program.waitForEnd(), EXIT_SUCCESS) << "the one test that was asked for passed";
  EXPECT_EQ(verdictsIn(results), "buttons PASS\nswitches FAIL\nprompts PASS\n");
}

TEST_F(WindowApplication, IsUsedByMouseAndByKeyboard) {
  mouse(areaOf(kTouch), "click 1");
  EXPECT_TRUE(comesToSee(kMenuHeader, kHeadInk.ground));
  mouse(kCentre, "mousedown 1");
  EXPECT_TRUE(comesToSee(kPass, kPass.color)) << "held for long enough";
  mouse(kCentre, "mouseup 1");
  mouse(kPass, "click 1");  // not all quarters were touched
  EXPECT_TRUE(comesToSee(kPromptYes, kButtonInk.ground));
  mouse(kPromptYes, "click 1");
  EXPECT_TRUE(comesToSee(areaOf(kTouch), kPassInk.ground));

  keys("Down Return");  // the colours
  EXPECT_TRUE(comesToSee(kCentre, MW::kColorWhite));
  keys("Return");
  EXPECT_TRUE(comesToSee(kPass, kPass.color));
  keys("Right Return");
  EXPECT_TRUE(comesToSee(kPromptYes, kButtonInk.ground));
  keys("Return");
  EXPECT_TRUE(comesToSee(areaOf(kColours), kMarkInk.ground));

  keys("Down Down Down Down Down Return");  // the keys
  EXPECT_TRUE(comesToSee(cellOf(kPage.content, kGap, {4, 3}, 0), kButtonInk.ground));
  keys("Escape Escape Escape");
  EXPECT_TRUE(comesToSee(areaOf(kKeys), kMarkInk.ground));

  keys("Escape");
  EXPECT_TRUE(comesToSee(kPromptYes, kButtonInk.ground));
  mouse(kPromptYes, "click 1");
  EXPECT_EQ(program.waitForEnd(), kFailed);
  EXPECT_EQ(verdictsIn(results), "touch PASS\ncolours PASS\nkeys FAIL\n");
}

class LogApplication : public WindowApplication {
 protected:
  LogApplication() : WindowApplication({"--test", "log"}, kSearchButton, kButtonInk.ground) {}
};

TEST_F(LogApplication, SearchesALogByMouse) {
  EXPECT_FALSE(seesRedWords());
  mouse(kSearchButton, "click 1");
  EXPECT_TRUE(comesToSee(keyOf('5'), MW::kColorWhite));
  for (const char letter : std::string("needle")) mouse(keyOf(letter), "click 1");
  mouse(kEnterKey, "click 1");
  EXPECT_TRUE(comesToSee(kSearchButton, kButtonInk.ground)) << "the keyboard goes away";
  EXPECT_TRUE(eventually([this] { return seesRedWords(); }));
}

TEST_F(WindowApplication, EndsWhenItsWindowIsClosed) {
  desktop.askToClose(place.window);
  EXPECT_EQ(program.waitForEnd(), kNotAllPassed);
}

TEST_F(WindowApplication, EndsWhenItIsInterrupted) {
  program.interrupt();
  EXPECT_EQ(program.waitForEnd(), kNotAllPassed);
}

}  // namespace
}  // namespace factory_test
