// How a session ends before the application does.
#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <iostream>

#include "host/open_platform.h"
#include "host/png_file.h"
#include "host/session.h"
#include "scene/item_text.h"

namespace brimol::pc {

namespace {

constexpr int kFailed = 1;
constexpr int kBadTrace = 2;

// The other threads still run and must not meet what the end of a process destroys.
[[noreturn]] void endProcess(int exitCode) {
  std::fflush(nullptr);
  std::cerr.flush();
  std::_Exit(exitCode);
}

std::string textsOf(const Frame& frame, Size screen) {
  std::string list;
  for (const ShownText& each : shownTexts(frame, screen)) list += "  " + each.text + '\n';
  return list.empty() ? "  (none)\n" : list;
}

}  // namespace

void Session::endWithBadTrace() {
  std::cerr << parsed.error << '\n';
  if (report) {
    report->error(0, parsed.error, nullptr);
    report->end(0, kBadTrace, "error");
  }
  endProcess(kBadTrace);
}

void Session::endIfFailed() {
  if (runner && runner->failure()) endWithFailure(*runner->failure());
}

void Session::endMonkey(const std::string& why) {
  isOver = true;
  std::cerr << "brimol: monkey " << settings.monkey->seed << ": " << why
            << "\nTexts on the screen, at " << now() << " ms:\n"
            << textsOf(lastFrame, screenSize);
  if (report) report->end(now(), kFailed, "failed");
  endProcess(kFailed);
}

void Session::endWithFailure(const TraceFailure& failure) {
  isOver = true;
  const TraceLine& line = failure.line;
  const std::string message = line.number == 0 ? settings.trace + ": " + failure.why
                                               : line.file + ':' + std::to_string(line.number) +
                                                     ": " + line.text + ": " + failure.why;
  std::cerr << message << "\nTexts on the screen, at " << now() << " ms:\n"
            << textsOf(runner->frame(), screenSize) << keepFailure();
  if (report) {
    report->error(now(), message, &line);
    report->end(now(), kFailed, "failed");
  }
  endProcess(kFailed);
}

// The picture and the items, for who looks for the reason. What is to be said about them.
std::string Session::keepFailure() {
  const std::string stem =
      report ? (report->directory() / "failed").native() : settings.trace + ".failed";
  std::ofstream items(stem + ".items.txt");
  for (const std::string& each : textOfFrame(runner->frame())) items << each << '\n';
  items.close();
  if (const CairoSurface picture =
          open == nullptr ? nullptr : open->copyPicture(std::chrono::seconds(10))) {
    (void)writePng(picture.get(), stem + ".png");
  }
  return "Kept as " + stem + ".png and " + stem + ".items.txt\n";
}

void Session::tellBlocked(const std::string& name, pid_t thread) {
  std::cerr << "brimol: thread " << thread << " (" << name
            << ") blocks outside the platform; simulated time goes on without it\n";
  const std::lock_guard lock(mutex);
  if (report && !isOver) report->blocked(now(), name, thread);
}

}  // namespace brimol::pc
