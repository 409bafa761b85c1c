/// What a display draws over the screen's picture for its user.
#pragma once

#include <chrono>
#include <optional>

#include "display/frame_figures.h"
#include "display/window_fit.h"
#include "input/two_finger_mouse.h"
#include "painter/fonts.h"
#include "scene/cairo_handles.h"

namespace brimol::pc {

/// The list of keys, the figures and outlines of the newest frame, and the two fingers of a mouse:
/// each where it is wanted. It draws into a picture of its own, so that nothing of it comes into
/// the screen's. One thread uses it.
class Overlay {
 public:
  void toggleKeys() { hasKeys = !hasKeys; }
  void toggleFigures() { hasFigures = !hasFigures; }
  /// True where the fingers are others than before.
  bool setFingers(const std::optional<TwoFingerMouse::Fingers>& now);
  /// The items are borrowed until the next note().
  void note(const FrameFigures& figures);

  /// Nothing is wanted.
  bool isEmpty() const { return !hasKeys && !hasFigures && !fingers; }

  /// A copy of `shown` with what is wanted over it. `shown` is a window's content in
  /// CAIRO_FORMAT_RGB24, in which the screen stands as `fit` says. Owned by the overlay until the
  /// next call; null where there is no memory for it.
  cairo_surface_t* drawOver(cairo_surface_t* shown, const WindowFit& fit);

 private:
  Fonts& fonts();
  void drawFigures(cairo_t* context, const WindowFit& fit);
  void drawKeys(cairo_t* context, const WindowFit& fit);

  bool hasKeys = false;
  bool hasFigures = false;
  std::optional<TwoFingerMouse::Fingers> fingers;

  // Of the newest frame.
  const Frame* items = nullptr;
  Region changed;
  std::chrono::microseconds painting{0};
  std::optional<std::chrono::microseconds> sinceInput;  // of the newest that had an event
  int frames = 0;

  BorrowedFonts borrowed;  // once words are drawn
  CairoSurface picture;
};

}  // namespace brimol::pc
