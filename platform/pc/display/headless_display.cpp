#include "display/headless_display.h"

#include <chrono>

namespace brimol::pc {

void HeadlessDisplay::wait(std::optional<uint32_t> ms) {
  std::unique_lock<std::mutex> lock(mutex);
  const auto wasWoken = [this] { return isWoken; };
  if (ms) {
    woken.wait_for(lock, std::chrono::milliseconds(*ms), wasWoken);
  } else {
    woken.wait(lock, wasWoken);
  }
  isWoken = false;
}

void HeadlessDisplay::wake() {
  {
    const std::lock_guard<std::mutex> lock(mutex);
    isWoken = true;
  }
  woken.notify_one();
}

}  // namespace brimol::pc
