#include "host/open_platform.h"

#include <mutex>
#include <utility>

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
  const std::lock_guard<std::mutex> turn(turnMutex);
  if (openedPlatform()) return {};
  const SettingsResult wanted = readSettings();
  if (!wanted.error.empty()) return wanted.error;
  InputService& input = inputService();
  input.open();
  std::string error;
  if (auto platform = Platform::open(wanted.settings, input, error)) {
    setOpened(std::move(platform));
  } else {
    input.close();
  }
  return error;
}

void closePlatform() {
  const std::lock_guard<std::mutex> turn(turnMutex);
  const std::shared_ptr<Platform> platform = openedPlatform();
  if (!platform) return;
  setOpened(nullptr);
  platform->close();
  inputService().close();
}

std::shared_ptr<Platform> openedPlatform() {
  const std::lock_guard<std::mutex> lock(openedMutex);
  return opened;
}

void submitFrame(Frame&& frame) {
  if (const auto platform = openedPlatform()) platform->submit(std::move(frame));
}

}  // namespace brimol::pc
