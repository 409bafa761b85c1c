#include "host/open_platform.h"

#include <mutex>
#include <system_error>
#include <utility>

#include "clock/inside_wait.h"
#include "clock/process_clock.h"
#include "host/session.h"
#include "host/settings.h"
#include "input/input_service.h"
#include "scene/frame_sink.h"

namespace brimol::pc {
namespace {

// Held while the platform opens or closes, so that one does not meet the other half-way.
constinit std::mutex turnMutex;
constinit std::mutex openedMutex;  // guards opened; held for no more than a copy
// Never deleted: an application may leave its threads drawing while the process ends.
std::shared_ptr<Platform>& opened = *new std::shared_ptr<Platform>;

void setOpened(std::shared_ptr<Platform> platform) {
  const std::lock_guard<std::mutex> lock(openedMutex);
  opened = std::move(platform);
}

// Closes what the application left open.
struct ProcessEnd {
  ProcessEnd() = default;
  ProcessEnd(const ProcessEnd&) = delete;
  ProcessEnd& operator=(const ProcessEnd&) = delete;
  ~ProcessEnd() {
    const std::shared_ptr<Platform> left = openedPlatform();
    setOpened(nullptr);
    if (left) left->close();
  }
};
const ProcessEnd processEnd;

std::string threadProblem(const std::system_error& failure) {
  return "a thread cannot be started: " + failure.code().message();
}

// Null, with the reason in `error`, and neither is open.
std::shared_ptr<Platform> openDisplayAndInput(const Settings& settings, std::string& error) {
  InputService& input = inputService();
  input.open();
  try {
    if (auto platform = Platform::open(settings, input, error)) return platform;
  } catch (const std::system_error& failure) {
    error = threadProblem(failure);
  }
  input.close();
  return nullptr;
}

}  // namespace

std::string openPlatform() try {
  if (auto* const clock = turnClock()) clock->takePart();
  const InsideWait wait(turnClock());
  const std::lock_guard<std::mutex> turn(turnMutex);
  if (openedPlatform()) return {};
  SettingsResult wanted = readSettings();
  Session* const played = session();
  if (played != nullptr) {
    std::string problem = played->prepare();
    if (!problem.empty()) return problem;
    wanted.settings.screen = played->screen();
    wanted.settings.density = played->dotsPerInch();
  }
  if (!wanted.error.empty()) return wanted.error;
  std::string error;
  const std::shared_ptr<Platform> platform = openDisplayAndInput(wanted.settings, error);
  if (platform) {
    if (played != nullptr) played->begin(*platform);
    setOpened(platform);
  } else if (played != nullptr) {
    played->giveUp();
  }
  return error;
} catch (const std::system_error& failure) {
  return threadProblem(failure);  // the clock's
}

void closePlatform() {
  if (auto* const clock = turnClock()) clock->takePart();
  const InsideWait wait(turnClock());
  const std::lock_guard<std::mutex> turn(turnMutex);
  const std::shared_ptr<Platform> platform = openedPlatform();
  if (!platform) return;
  if (Session* const played = session()) played->close();
  setOpened(nullptr);
  platform->close();
  inputService().close();
}

std::shared_ptr<Platform> openedPlatform() {
  const std::lock_guard<std::mutex> lock(openedMutex);
  return opened;
}

void submitFrame(Frame& frame) {
  Session* const played = session();
  const auto platform = openedPlatform();
  if (!platform) return;
  inputService().hearOfFrame();
  played != nullptr ? played->frame(*platform, frame) : platform->submit(frame);
}

}  // namespace brimol::pc
