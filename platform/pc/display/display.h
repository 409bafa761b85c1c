/// Where the picture is shown, and where the user's actions come from.
#pragma once

#include <cairo.h>

#include <cstdint>
#include <memory>
#include <optional>
#include <string>

#include "display/frame_figures.h"
#include "input/input_service.h"
#include "input/input_translator.h"
#include "scene/geometry.h"

namespace brimol::pc {

enum class DisplayChoice {
  Window,            ///< a window; an error where none can be opened
  WindowIfPossible,  ///< a window where SDL finds a video driver, headless otherwise
  Browser,           ///< web browsers and VNC viewers; not by openDisplay()
  Headless,
};

/// A window or what stands in for one. The platform's thread opens it, calls it and destroys it;
/// wake() alone may be called by any thread.
class Display {
 public:
  Display() = default;
  Display(const Display&) = delete;
  Display& operator=(const Display&) = delete;
  virtual ~Display() = default;

  /// Shows what changed of `picture`, which is CAIRO_FORMAT_RGB24 in the screen's size. The picture
  /// stays the caller's; it must live, at the same address, until the last wait() has returned.
  virtual void present(cairo_surface_t* picture, const Region& changed) = 0;

  /// What is known of the frame that is presented next, for a display that shows it.
  virtual void note(const FrameFigures&) {}

  /// Sleeps until the user does something, wake() was called, or `ms` milliseconds have passed,
  /// where they are given. Tells the input what the user did.
  virtual void wait(std::optional<uint32_t> ms) = 0;

  /// Ends the wait that is under way, or else the next one.
  virtual void wake() = 0;

  /// True once the user has asked to close the window.
  virtual bool isCloseRequested() const = 0;

  /// True once each time the user has asked for a picture of the screen.
  virtual bool takePictureWish() { return false; }
};

/// An open display, or one line that says why there is none.
struct OpenedDisplay {
  std::unique_ptr<Display> display;
  std::string error;
};

/// Opens a display for a picture of the size `screen`. `input` is told what the user does, in the
/// time of `service`. Both outlive the display.
OpenedDisplay openDisplay(DisplayChoice choice, Size screen, InputTranslator& input,
                          const InputService& service);

}  // namespace brimol::pc
