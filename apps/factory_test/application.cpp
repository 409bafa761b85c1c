#include "application.h"

#include <MW/widget.h>
#include <MW/window.h>
#include <brimol/host.h>
#include <brimol/input.h>

#include <algorithm>
#include <array>
#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <optional>
#include <string>
#include <utility>

#include "complain.h"
#include "factory_test.h"
#include "language/language.h"
#include "pages/table.h"
#include "process/inherited.h"
#include "results/whole_file.h"
#include "run_start.h"
#include "task.h"

namespace factory_test {

namespace {

constexpr unsigned int kLoopMs = 5;

volatile std::sig_atomic_t interrupted = 0;

void endOnSignals() {
  for (const int number : {SIGINT, SIGTERM, SIGHUP}) {
    if (!brimol::process::isIgnored(number)) std::signal(number, [](int) { interrupted = 1; });
  }
}

ExitCode fail(const std::string& why) {
  complain(why);
  return ExitCode::Trouble;
}

// What became of the last unit, where the exit code tells of tests.
ExitCode judgeLast(const Options& options, const ResultBook& book) {
  if (!options.shot.empty() || !options.monkey.empty()) return ExitCode::Passed;
  if (options.test.empty()) return judgeRun(book, book.run().tests);
  return judgeRun(book, std::array{options.test});
}

std::string wrongScreen() {
  constexpr int kLeastWidth = 320;   // pixels
  constexpr int kLeastHeight = 480;  // the menu's head takes 340 of them
  constexpr int kMostRatio = 3;
  int width = 0;
  int height = 0;
  brimol_host_screen_size(&width, &height);
  const auto [shorter, longer] = std::minmax(width, height);
  if (width >= kLeastWidth && height >= kLeastHeight && longer <= kMostRatio * shorter) return {};
  return "the screen of " + std::to_string(width) + "x" + std::to_string(height) +
         " pixels has no room for the pages: at least 320 wide and 480 high, and no side more than "
         "three times the other";
}

void loop(FactoryTest& test, bool stays) {
  while (brimol_host_close_requested() == 0 && interrupted == 0) {
    if (test.isEnded() && !stays) return;
    if (test.isEnded()) test.stay();
    test.update(GetTicks());
    if (MW::isDisplayUpdate(0) == 1) test.draw();
    MW::Window::updateTimer(MW::kUnused);
    Delay(kLoopMs);
  }
}

// The file as a text of the toolkit, which ends at a NUL: spaces stand for these. Nothing, with the
// reason in `error`, for one that cannot be read.
std::optional<std::string> readLog(const std::string& path, std::string& error) {
  constexpr std::size_t kMostMiB = 16;
  std::optional<std::string> text = readFile(path, error, kMostMiB);
  if (text) std::ranges::replace(*text, '\0', ' ');
  return text;
}

void letMonkeyPlay(const Options& options) {
  const std::string events = options.events.empty() ? "" : ":" + options.events;
  const std::string trace =
      options.monkeyTrace.empty() ? "monkey-" + options.monkey + ".trace" : options.monkeyTrace;
  setenv("BRIMOL_MONKEY", (options.monkey + events).c_str(), 1);
  setenv("BRIMOL_RECORD", trace.c_str(), 1);
  setenv("BRIMOL_DISPLAY", "headless", 1);
}

// What became of all units but the last one.
ExitCode showScreens(const Options& options, ResultBook& book, const Context& context,
                     const Task& task) {
  FactoryTest test(book, context, task);
  if (!book.hasBegun()) test.askForUnits();
  if (!options.test.empty()) test.open(placeOf(options.test), GetTicks());
  test.draw();
  if (options.shot.empty()) {
    loop(test, options.stays);
    return options.monkey.empty() ? test.earlier() : ExitCode::Passed;
  }
  if (brimol_host_screenshot(options.shot.c_str()) == 0) return fail(brimol_host_error());
  return ExitCode::Passed;
}

void tellWaiting(const ResultBook& book) {
  const auto line = book.lineStatus();
  if (!line || line->waiting == 0 || line->error.empty()) return;
  complain(std::to_string(line->waiting) +
           (line->waiting == 1 ? " verdict waits" : " verdicts wait") +
           " for the line: " + line->error);
}

}  // namespace

ExitCode runApplication(const Options& options) {
  SessionLog log(options.verbose ? SessionLog::Echo::ToStderr : SessionLog::Echo::None);
  chooseLanguage(options.language);
  if (!options.language.empty() && !hasCatalogue(options.language)) {
    complain("no catalogue of the language '" + options.language + "': texts are English");
  }
  if (options.headless) setenv("BRIMOL_DISPLAY", "headless", 1);
  if (!options.device.empty()) setenv("BRIMOL_DEVICE", options.device.c_str(), 1);
  if (!options.monkey.empty()) letMonkeyPlay(options);
  std::string error;
  const auto task = chooseTask(options, error);
  if (!task) {
    complain(error);
    return ExitCode::WrongUse;
  }
  std::optional<std::string> logText;
  if (!options.log.empty()) {
    logText = readLog(options.log, error);
    if (!logText) return fail(error);
  }
  if (brimol_host_open() == 0) return ExitCode::Trouble;
  if (const std::string wrong = wrongScreen(); !wrong.empty()) return fail(wrong);
  // Last of all: a start that is refused leaves no run.
  auto book = ResultBook::open(keepingOf(options), runStartOf(options, task->plan), error);
  if (!book) return fail(error);
  const Context context = {*book, log, std::move(logText), options.shell, task->plan};
  brimol_host_screen_size(&MW::Window::width, &MW::Window::height);
  endOnSignals();
  const bool started = MW::Window::init() == 1;
  const ExitCode result = started ? showScreens(options, *book, context, *task)
                                  : fail("no memory for the dispatch thread");
  MW::Window::destroy();
  if (!book->close(error)) complain(error);
  tellWaiting(*book);
  return result == ExitCode::Trouble ? result : worse(result, judgeLast(options, *book));
}

}  // namespace factory_test
