/// A screen's size.
#pragma once

namespace factory_test {

struct ScreenSize {
  int width = 0;  // pixels, 0 or more
  int height = 0;

  bool operator==(const ScreenSize&) const = default;
};

}  // namespace factory_test
