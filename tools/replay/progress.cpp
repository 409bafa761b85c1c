#include "progress.h"

#include <sys/ioctl.h>
#include <unistd.h>

#include <algorithm>

namespace brimol::replay {

namespace {

constexpr auto kClearLine = "\r\033[K";
constexpr std::size_t kUsualColumns = 80;

std::size_t columnsOf(std::FILE* stream) {
  winsize size{};
  const bool isKnown = ::ioctl(::fileno(stream), TIOCGWINSZ, &size) == 0 && size.ws_col > 1;
  return isKnown ? size.ws_col - 1U : kUsualColumns;
}

}  // namespace

Progress::Progress(std::FILE* shownOn)
    : stream(::isatty(::fileno(shownOn)) != 0 ? shownOn : nullptr) {}

Progress::~Progress() {
  if (stream == nullptr) return;
  std::fputs(kClearLine, stream);
  std::fflush(stream);
}

void Progress::show(const Session& session) {
  if (stream == nullptr) return;
  std::fputs((kClearLine + progressLine(session, columnsOf(stream))).c_str(), stream);
  std::fflush(stream);
}

std::string progressLine(const Session& session, std::size_t columns) {
  constexpr int kSecond = 1000;
  constexpr int kTenth = 100;
  std::string line = std::to_string(session.lastTime / kSecond) + "." +
                     std::to_string(session.lastTime % kSecond / kTenth) + " s  " +
                     std::to_string(session.frames.size()) + " frames";
  const auto isStep = [](const Happening& one) { return one.kind == Happening::Kind::Step; };
  const auto step = std::find_if(session.happenings.rbegin(), session.happenings.rend(), isStep);
  if (step != session.happenings.rend()) line += "  " + step->place.text() + " " + step->text;
  std::ranges::replace_if(
      line, [](char letter) { return letter < ' ' || letter > '~'; }, '?');
  return line.substr(0, columns);
}

}  // namespace brimol::replay
