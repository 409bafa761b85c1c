/// The picture on its way from the platform's thread to the VNC server's.
#pragma once

#include <cairo.h>

#include <mutex>
#include <vector>

#include "scene/geometry.h"

namespace brimol::pc {

/// A picture in screen pixels, four bytes each.
class ServedPicture {
 public:
  explicit ServedPicture(Size size)
      : width(size.w),
        pixels(static_cast<std::size_t>(size.w) * static_cast<std::size_t>(size.h)) {}
  uint32_t* row(int x, int y) {
    return pixels.data() + static_cast<std::size_t>(y) * static_cast<std::size_t>(width) + x;
  }

 private:
  int width;
  std::vector<uint32_t> pixels;
};

/// A copy of the screen of its own, so that the platform's thread waits for no more than another
/// copy: encoding and sending take their time from the VNC server's copy.
class Handover {
 public:
  explicit Handover(Size screen) : latest(screen) {}

  /// Takes what changed. On the platform's thread.
  void give(cairo_surface_t* picture, const Region& changed);
  /// Brings `shown` up to date and returns what of it changed.
  Region take(ServedPicture& shown);

 private:
  std::mutex mutex;  // guards all
  ServedPicture latest;
  Region waiting;  // what of it was not taken; its parts may overlap
};

}  // namespace brimol::pc
