// The real program in a real window, used by a real mouse and seen from outside. To be run on a
// desktop that is larger than the program's screen; the environment's FACTORY_TEST names it.
#include <gtest/gtest.h>
#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>

#include <array>
#include <cstdlib>
#include <string>
#include <utility>

#include "e2e/eventually.h"
#include "layout.h"
#include "support/desktop.h"

namespace factory_test {
namespace {

using brimol::test::Desktop;
using brimol::test::eventually;

constexpr Layout kLayout = layOut({540, 960});
constexpr uint32_t kOpaque = 0xFF000000;

/// The program, from its start to its end.
class Program {
 public:
  Program() {
    setenv("BRIMOL_DISPLAY", "window", 1);
    setenv("BRIMOL_SCREEN", "540x960", 1);
    std::string path = std::getenv("FACTORY_TEST");
    const std::array<char*, 2> arguments = {path.data(), nullptr};
    EXPECT_EQ(posix_spawn(&process, path.c_str(), nullptr, nullptr, arguments.data(), environ), 0);
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
  void interrupt() const { kill(process, SIGINT); }

 private:
  pid_t process = 0;
};

class WindowApplication : public testing::Test {
 protected:
  WindowApplication() {
    EXPECT_TRUE(eventually([this] {
      place = desktop.findWindow();
      return place.window != 0 && sees(kLayout.title, kLayout.title.color);
    }));
  }

  uint32_t colourAt(int x, int y) const {
    return desktop.colourAt(place.x + x, place.y + y) | kOpaque;
  }
  bool sees(const SKIA_Rect& area, uint32_t colour) const {
    return colourAt(area.x + 1, area.y + 1) == colour;
  }
  bool comesToSee(const SKIA_Rect& area, uint32_t colour) const {
    return eventually([&] { return sees(area, colour); });
  }
  void mouse(const SKIA_Rect& at, const std::string& does) const {
    const std::string command = "xdotool mousemove " + std::to_string(place.x + at.x + at.w / 2) +
                                " " + std::to_string(place.y + at.y + at.h / 2) + " " + does;
    EXPECT_EQ(std::system(command.c_str()), 0);
  }
  /// The colours along the middle of the status line, where its words stand.
  std::vector<uint32_t> statusLine() const {
    return desktop.row(place.x + kLayout.status.x,
                       place.y + kLayout.status.y + kLayout.status.h / 2, kLayout.status.w);
  }

  Program program;
  const Desktop desktop;
  Desktop::Place place;
};

TEST_F(WindowApplication, AnswersTheMouseAndEndsByItsButton) {
  const SKIA_Rect& press = kLayout.buttons.at(0);
  const SKIA_Rect& click = kLayout.buttons.at(1);
  const auto before = statusLine();
  mouse(press, "mousedown 1");
  EXPECT_TRUE(comesToSee(press, MW::kColorHighlight));
  mouse(press, "mouseup 1");
  EXPECT_TRUE(comesToSee(press, press.color));
  const auto pressed = statusLine();
  EXPECT_NE(pressed, before);
  mouse(click, "click 1");
  EXPECT_TRUE(eventually([&] { return statusLine() != pressed; }));
  mouse(kLayout.end, "click 1");
  EXPECT_EQ(program.waitForEnd(), EXIT_SUCCESS);
}

TEST_F(WindowApplication, LeavesTheButtonDarkOnceTheMouseMovedOff) {
  const SKIA_Rect& click = kLayout.buttons.at(1);
  const auto before = statusLine();
  mouse(click, "mousedown 1");
  EXPECT_TRUE(comesToSee(click, MW::kColorHighlight));
  mouse(kLayout.box, "");
  EXPECT_TRUE(comesToSee(click, click.color));
  mouse(kLayout.box, "mouseup 1");
  EXPECT_EQ(statusLine(), before) << "released outside: no click";
  program.interrupt();
  EXPECT_EQ(program.waitForEnd(), EXIT_SUCCESS);
}

TEST_F(WindowApplication, EndsWhenItsWindowIsClosed) {
  desktop.askToClose(place.window);
  EXPECT_EQ(program.waitForEnd(), EXIT_SUCCESS);
}

}  // namespace
}  // namespace factory_test
