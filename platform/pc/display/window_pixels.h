/// The way of pixels into a window.
#pragma once

#include <SDL_render.h>
#include <SDL_video.h>
#include <cairo.h>

#include <memory>

#include "scene/geometry.h"

namespace brimol::pc {

/// What shows a content in a window, which outlives it. The window's thread uses it.
class WindowPixels {
 public:
  /// The way that suits SDL's driver.
  static std::unique_ptr<WindowPixels> of(SDL_Window* window);

  WindowPixels() = default;
  WindowPixels(const WindowPixels&) = delete;
  WindowPixels& operator=(const WindowPixels&) = delete;
  virtual ~WindowPixels() = default;

  /// Of the window at the moment. On a desktop of high density they are more than its points.
  virtual Size size() = 0;

  /// Shows `parts` of `content`, CAIRO_FORMAT_RGB24 of that size. What cannot be shown at the
  /// moment is left out: SDL will expose the window later.
  virtual void show(cairo_surface_t* content, const Region& parts) = 0;
};

}  // namespace brimol::pc
