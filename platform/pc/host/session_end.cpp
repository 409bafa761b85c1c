// How a session ends before the application does.
#include <cerrno>
#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <iostream>
#include <system_error>

#include "host/open_platform.h"
#include "host/png_file.h"
#include "host/session.h"
#include "host/whole_file.h"
#include "scene/item_text.h"
#include "scene/quoted_text.h"

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

std::string writeItems(const std::vector<std::string>& items, const std::string& path) {
  return writeWhole(path, [&items](const std::string& unfinished) -> std::string {
    errno = 0;
    std::ofstream out(unfinished);
    for (const std::string& each : items) out << each << '\n';
    out.close();
    return out ? "" : std::generic_category().message(errno);
  });
}

// For the user: where a file is, or why there is none.
std::string outcomeOf(const std::string& path, const std::string& error) {
  return (error.empty() ? "Kept as " + printable(path) : error) + '\n';
}

}  // namespace

void Session::endWithBadTrace() {
  std::cerr << parsed.error << '\n';
  if (report) {
    report->error(0, parsed.error, &parsed.wrong);
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
  const std::string place =
      line.file == nullptr ? settings.trace : line.place() + ": " + std::string(line.text);
  const std::string message = printable(place) + ": " + failure.why;
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
  const CairoSurface picture =
      open == nullptr ? nullptr : open->copyPicture(std::chrono::seconds(10));
  const std::string png = stem + ".png";
  const std::string items = stem + ".items.txt";
  return outcomeOf(png, picture ? writePng(picture.get(), png) : "there is no picture") +
         outcomeOf(items, writeItems(textOfFrame(runner->frame()), items));
}

void Session::tellBlocked(const std::string& name, pid_t thread) {
  std::cerr << "brimol: thread " << thread << " (" << name
            << ") blocks outside the platform; simulated time goes on without it\n";
  const std::lock_guard lock(mutex);
  if (report && !isOver) report->blocked(now(), name, thread);
}

}  // namespace brimol::pc
