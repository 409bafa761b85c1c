#include "application.h"

#include <MW/window.h>
#include <android/log.h>
#include <brimol/host.h>
#include <brimol/input.h>

#include <csignal>
#include <cstdlib>
#include <string>
#include <utility>

#include "complain.h"
#include "factory_test.h"

namespace factory_test {

namespace {

constexpr unsigned int kLoopMs = 5;

volatile std::sig_atomic_t interrupted = 0;

void endOnSignals() {
  for (const int number : {SIGINT, SIGTERM}) std::signal(number, [](int) { interrupted = 1; });
}

int fail(const std::string& why) {
  complain(why);
  return EXIT_FAILURE;
}

void loop(FactoryTest& test) {
  while (!test.isEnded() && brimol_host_close_requested() == 0 && interrupted == 0) {
    test.update(GetTicks());
    if (MW::isDisplayUpdate(0) == 1) test.draw();
    MW::Window::updateTimer(0);
    Delay(kLoopMs);
  }
}

int showScreens(const Options& options, ResultBook book) {
  FactoryTest test(std::move(book), options.junit);
  test.draw();
  if (options.shot.empty()) {
    loop(test);
    return EXIT_SUCCESS;
  }
  if (brimol_host_screenshot(options.shot.c_str()) == 0) return fail(brimol_host_error());
  return EXIT_SUCCESS;
}

}  // namespace

int runApplication(const Options& options) {
  __android_log_set_minimum_priority(options.verbose ? ANDROID_LOG_VERBOSE : ANDROID_LOG_SILENT);
  if (options.headless) setenv("BRIMOL_DISPLAY", "headless", 1);
  std::string error;
  auto book = ResultBook::open(options.results, error);
  if (!book) return fail(error);
  if (brimol_host_open() == 0) return fail(brimol_host_error());
  brimol_host_screen_size(&MW::Window::width, &MW::Window::height);
  endOnSignals();
  const bool started = MW::Window::init() == 1;
  const int result =
      started ? showScreens(options, std::move(*book)) : fail("no memory for the dispatch thread");
  MW::Window::destroy();
  return result;
}

}  // namespace factory_test
