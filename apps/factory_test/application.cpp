#include "application.h"

#include <MW/window.h>
#include <android/log.h>
#include <brimol/host.h>
#include <brimol/input.h>

#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <string>
#include <system_error>

#include "first_screen.h"

namespace factory_test {

namespace {

constexpr unsigned int kLoopMs = 5;

volatile std::sig_atomic_t interrupted = 0;

void endOnSignals() {
  for (const int number : {SIGINT, SIGTERM}) std::signal(number, [](int) { interrupted = 1; });
}

int fail(const char* why) {
  std::fprintf(stderr, "factory_test: %s\n", why);
  return EXIT_FAILURE;
}

// Beside the program; the build puts it there.
std::string picturePath() {
  std::error_code failed;
  const auto program = std::filesystem::read_symlink("/proc/self/exe", failed);
  return (program.parent_path() / "test_card.png").string();
}

ScreenSize takeScreenSize() {
  brimol_host_screen_size(&MW::Window::width, &MW::Window::height);
  return {MW::Window::width, MW::Window::height};
}

void loop(FirstScreen& screen) {
  while (!screen.isEnded() && brimol_host_close_requested() == 0 && interrupted == 0) {
    if (MW::isDisplayUpdate(0) == 1) screen.draw();
    MW::Window::updateTimer(0);
    Delay(kLoopMs);
  }
}

int showScreens(const Options& options) {
  FirstScreen screen(takeScreenSize(), picturePath().c_str());
  screen.draw();
  if (options.shot.empty()) {
    loop(screen);
    return EXIT_SUCCESS;
  }
  if (brimol_host_screenshot(options.shot.c_str()) == 0) return fail(brimol_host_error());
  return EXIT_SUCCESS;
}

}  // namespace

int runApplication(const Options& options) {
  __android_log_set_minimum_priority(options.verbose ? ANDROID_LOG_VERBOSE : ANDROID_LOG_SILENT);
  if (options.headless) setenv("BRIMOL_DISPLAY", "headless", 1);
  if (brimol_host_open() == 0) return fail(brimol_host_error());
  endOnSignals();
  const bool started = MW::Window::init() == 1;
  const int result = started ? showScreens(options) : fail("no memory for the dispatch thread");
  MW::Window::destroy();
  return result;
}

}  // namespace factory_test
