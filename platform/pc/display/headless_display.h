/// The display of a platform without a window.
#pragma once

#include <condition_variable>
#include <mutex>

#include "display/display.h"

namespace brimol::pc {

/// Shows nothing and has no user. Only wake() and the time end its waits.
class HeadlessDisplay : public Display {
 public:
  void present(cairo_surface_t*, const Region&) override {}
  void wait(std::optional<uint32_t> ms) override;
  void wake() override;
  bool isCloseRequested() const override { return false; }

 private:
  std::mutex mutex;
  std::condition_variable woken;
  bool isWoken = false;  // guarded by mutex
};

}  // namespace brimol::pc
