/// The window on a desktop or a bare console.
#pragma once

#include <SDL_events.h>
#include <SDL_surface.h>
#include <SDL_video.h>

#include <atomic>
#include <memory>
#include <optional>

#include "display/display.h"
#include "display/window_canvas.h"

namespace brimol::pc {

struct SdlWindowDeleter {
  void operator()(SDL_Window* window) const { SDL_DestroyWindow(window); }
};
struct SdlSurfaceDeleter {
  void operator()(SDL_Surface* surface) const { SDL_FreeSurface(surface); }
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

/// A window that the user cannot size. It shows the whole screen, scaled down by one factor where
/// the desktop has less room, and fitted in where something else changes the window's size. What
/// the user does in it becomes input. When it loses the focus or is to be closed, all fingers and
/// keys are released.
class SdlDisplay : public Display {
 public:
  /// An error where SDL has no video driver whose pictures a user can see. SDL_VIDEODRIVER chooses
  /// any other driver.
  static OpenedDisplay open(Size screen, InputTranslator& input, const InputService& service);

  void present(cairo_surface_t* picture, const Region& changed) override;
  void wait(std::optional<uint32_t> ms) override;
  void wake() override;
  bool isCloseRequested() const override { return closeRequested; }

 private:
  using Window = std::unique_ptr<SDL_Window, SdlWindowDeleter>;

  SdlDisplay(Size screenSize, InputTranslator& target, const InputService& clock);
  void handle(const SDL_Event& event);
  void handleWindow(const SDL_WindowEvent& event);
  void fitToDesktop();
  void takeWindowSize();
  void showAll();
  void show(const Region& parts);

  const Size screen;
  InputTranslator& input;
  const InputService& service;
  SdlVideo video;
  Window window;
  Size wantedSize = {};  // what the window was last asked to be
  std::optional<WindowCanvas> canvas;
  std::unique_ptr<SDL_Surface, SdlSurfaceDeleter> content;  // the canvas's pixels, as SDL sees them
  cairo_surface_t* latest = nullptr;                        // the picture shown; the painter's
  bool closeRequested = false;
  std::atomic<bool> wakeIsComing = false;  // a wake event is under way, one is enough
};

}  // namespace brimol::pc
