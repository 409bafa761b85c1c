#include "host/open_platform.h"

#include <mutex>
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
constinit std::shared_ptr<Platform> opened;

void setOpened(std::shared_ptr<Platform> platform) {
  const std::lock_guard<std::mutex> lock(openedMutex);
  opened = std::move(platform);
}

}  // namespace

std::string openPlatform() {
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
  InputService& input = inputService();
  input.open();
  std::string error;
  if (auto platform = Platform::open(wanted.settings, input, error)) {
    if (played != nullptr) played->begin(*platform);
    setOpened(std::move(platform));
  } else {
    if (played != nullptr) played->giveUp();
    input.close();
  }
  return error;
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
