/// The window on a desktop or a bare console.
#pragma once

#include <atomic>
#include <memory>
#include <optional>
#include <utility>

#include "display/display.h"
#include "display/overlay.h"
#include "display/sdl_calls.h"
#include "display/sdl_input.h"
#include "display/window_canvas.h"
#include "display/window_pixels.h"
#include "input/keymap.h"

namespace brimol::pc {

struct SdlWindowDeleter {
  void operator()(SDL_Window* window) const { sdl().destroyWindow(window); }
};

/// SDL's video part, begun with the object and ended with it. Nothing else in the process uses it.
class SdlVideo {
 public:
  SdlVideo();
  ~SdlVideo();
  SdlVideo(const SdlVideo&) = delete;
  SdlVideo& operator=(const SdlVideo&) = delete;

  bool isOpen;  // SDL says why not
};

/// A window that the user may size. It shows the whole screen, scaled by one factor and with black
/// beside it where the window has other proportions; it opens no larger than the screen and the
/// desktop. What the user does in it becomes input, but for the keys that are the display's own.
/// When it loses the focus or is to be closed, all fingers and keys are released.
class SdlDisplay : public Display {
 public:
  /// An error where SDL has no video driver whose pictures a user can see. SDL_VIDEODRIVER chooses
  /// any other driver.
  static OpenedDisplay open(Size screen, InputTranslator& input, const InputService& service);

  void present(cairo_surface_t* picture, const Region& changed) override;
  void wait(std::optional<uint32_t> ms) override;
  void wake() override;
  bool isCloseRequested() const override { return closeRequested; }
  void note(const FrameFigures& figures) override { overlay.note(figures); }
  bool takePictureWish() override { return std::exchange(wantsPicture, false); }

 private:
  using Window = std::unique_ptr<SDL_Window, SdlWindowDeleter>;

  SdlDisplay(Size screenSize, InputTranslator& target, const InputService& clock);
  void handle(const SDL_Event& event);
  void handleWindow(const SDL_WindowEvent& event);
  bool takeDisplayKey(const SDL_KeyboardEvent& event);
  void play(DisplayKey key);
  void toggleFullScreen();
  void fitToDesktop();
  void takeWindowSize();
  void showAll();

  const Size screen;
  SdlInput input;
  const InputService& service;
  SdlVideo video;
  Window window;
  std::unique_ptr<WindowPixels> pixels;  // null without a window
  Size wantedSize = {};                  // what the window was last asked to be
  Size points = {};                      // the window's size as the mouse counts it
  std::optional<WindowCanvas> canvas;
  Overlay overlay;
  cairo_surface_t* latest = nullptr;  // the picture shown; the painter's
  bool closeRequested = false;
  bool wantsPicture = false;
  std::atomic<bool> wakeIsComing = false;  // a wake event is under way, one is enough
};

}  // namespace brimol::pc
