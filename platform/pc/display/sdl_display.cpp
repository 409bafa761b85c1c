#include "display/sdl_display.h"

#include <SDL.h>

#include <algorithm>
#include <cstdlib>
#include <limits>
#include <string>
#include <utility>
#include <vector>

#include "display/sdl_input.h"

namespace brimol::pc {
namespace {

constexpr const char* kTitle = "brimol";
constexpr Uint32 kWakeEvent = SDL_USEREVENT;
// One wait passes on no more than this many events, so that frames get their turn in a flood.
constexpr int kEventsPerWait = 256;

// What a user can see, in the order of trying. Left to itself, SDL ends with drivers that show
// nothing. Asking for a desktop that cannot be there would print a complaint.
const char* visibleDrivers() {
  return std::getenv("XDG_RUNTIME_DIR") != nullptr ? "x11,wayland,KMSDRM" : "x11,KMSDRM";
}

void setHints() {
  // The default priority leaves the last word to the environment.
  SDL_SetHintWithPriority(SDL_HINT_VIDEODRIVER, visibleDrivers(), SDL_HINT_DEFAULT);
  SDL_SetHint(SDL_HINT_NO_SIGNAL_HANDLERS, "1");        // Ctrl-C is the application's
  SDL_SetHint(SDL_HINT_MOUSE_FOCUS_CLICKTHROUGH, "1");  // the click that brings the focus counts
  SDL_SetHint(SDL_HINT_TOUCH_MOUSE_EVENTS, "0");
  SDL_SetHint(SDL_HINT_MOUSE_TOUCH_EVENTS, "0");
  SDL_SetHint(SDL_HINT_VIDEO_ALLOW_SCREENSAVER, "1");
  SDL_SetHint(SDL_HINT_VIDEO_X11_NET_WM_BYPASS_COMPOSITOR, "0");
}

// On X11 the server takes the pixels as they are. The detour over a texture, which SDL prefers,
// brings the whole window across for every change, and threads and start-up time of a graphics
// driver. The other drivers know no other way.
void chooseShortWay() {
  const std::string driver = SDL_GetCurrentVideoDriver();
  if (driver == "x11") {
    SDL_SetHintWithPriority(SDL_HINT_FRAMEBUFFER_ACCELERATION, "0", SDL_HINT_DEFAULT);
  }
}

// The room that the desktop has for a window's content.
Size desktopRoom(SDL_Window* window) {
  SDL_Rect usable = {};
  const int desktop = window != nullptr ? std::max(SDL_GetWindowDisplayIndex(window), 0) : 0;
  if (SDL_GetDisplayUsableBounds(desktop, &usable) != 0) {
    return {std::numeric_limits<int>::max(), std::numeric_limits<int>::max()};
  }
  int top = 0;
  int left = 0;
  int bottom = 0;
  int right = 0;
  if (window != nullptr) SDL_GetWindowBordersSize(window, &top, &left, &bottom, &right);
  return {std::max(usable.w - left - right, 1), std::max(usable.h - top - bottom, 1)};
}

SDL_Rect toSdl(const cairo_rectangle_int_t& part) {
  return {part.x, part.y, part.width, part.height};
}

}  // namespace

SdlVideo::SdlVideo() {
  setHints();
  isOpen = SDL_Init(SDL_INIT_VIDEO) == 0;
  if (!isOpen) return;
  chooseShortWay();
  SDL_StopTextInput();  // keys are keys here, no input method composes with them
}

SdlVideo::~SdlVideo() { SDL_Quit(); }

OpenedDisplay SdlDisplay::open(Size screen, InputTranslator& input, const InputService& service) {
  std::unique_ptr<SdlDisplay> display(new SdlDisplay(screen, input, service));
  if (display->window) return {std::move(display), {}};
  return {nullptr, std::string("cannot open a window: ") + SDL_GetError() +
                       " (BRIMOL_DISPLAY=headless does without)"};
}

SdlDisplay::SdlDisplay(Size screenSize, InputTranslator& target, const InputService& clock)
    : screen(screenSize), input(target), service(clock) {
  if (!video.isOpen) return;
  wantedSize = fittedSize(screen, desktopRoom(nullptr));
  window.reset(SDL_CreateWindow(kTitle, SDL_WINDOWPOS_UNDEFINED, SDL_WINDOWPOS_UNDEFINED,
                                wantedSize.w, wantedSize.h, 0));
  if (window) takeWindowSize();
}

void SdlDisplay::present(cairo_surface_t* picture, const Region& changed) {
  latest = picture;
  show(canvas->update(picture, changed));
}

void SdlDisplay::wait(std::optional<uint32_t> ms) {
  const uint32_t longest = std::numeric_limits<int>::max();
  SDL_Event event;
  int isEvent = ms ? SDL_WaitEventTimeout(&event, static_cast<int>(std::min(*ms, longest)))
                   : SDL_WaitEvent(&event);
  for (int count = 1; isEvent != 0; ++count) {
    handle(event);
    isEvent = count < kEventsPerWait ? SDL_PollEvent(&event) : 0;
  }
}

void SdlDisplay::wake() {
  if (wakeIsComing.exchange(true)) return;
  SDL_Event event = {};
  event.type = kWakeEvent;
  // A full queue has no room for it, and ends the wait without it.
  if (SDL_PushEvent(&event) != 1) wakeIsComing = false;
}

void SdlDisplay::handle(const SDL_Event& event) {
  switch (event.type) {
    case kWakeEvent: wakeIsComing = false; return;
    case SDL_WINDOWEVENT: return handleWindow(event.window);
    case SDL_QUIT: closeRequested = true; return input.releaseAll();
    default: return passOn(event, canvas->fit(), service.now(), input);
  }
}

void SdlDisplay::handleWindow(const SDL_WindowEvent& event) {
  switch (event.event) {
    case SDL_WINDOWEVENT_CLOSE: closeRequested = true; [[fallthrough]];
    case SDL_WINDOWEVENT_FOCUS_LOST: return input.releaseAll();
    case SDL_WINDOWEVENT_SIZE_CHANGED: return takeWindowSize();
    case SDL_WINDOWEVENT_SHOWN:
    case SDL_WINDOWEVENT_EXPOSED: fitToDesktop(); return showAll();
    default: return;
  }
}

// The borders are known only once a window manager has put them around the window.
void SdlDisplay::fitToDesktop() {
  const Size fitted = fittedSize(screen, desktopRoom(window.get()));
  if (fitted == wantedSize) return;
  wantedSize = fitted;
  SDL_SetWindowSize(window.get(), fitted.w, fitted.h);
}

void SdlDisplay::takeWindowSize() {
  Size size = {};
  SDL_GetWindowSize(window.get(), &size.w, &size.h);
  canvas.emplace(screen, size);
  cairo_surface_t* const pixels = canvas->pixels();
  content.reset(SDL_CreateRGBSurfaceWithFormatFrom(
      cairo_image_surface_get_data(pixels), canvas->fit().window.w, canvas->fit().window.h,
      SDL_BITSPERPIXEL(SDL_PIXELFORMAT_RGB888), cairo_image_surface_get_stride(pixels),
      SDL_PIXELFORMAT_RGB888));
  if (latest != nullptr) canvas->update(latest, {{0, 0, screen.w, screen.h}});
  showAll();
}

void SdlDisplay::showAll() { show({{0, 0, canvas->fit().window.w, canvas->fit().window.h}}); }

// Where SDL has no surface for the window at the moment, it will expose the window later.
void SdlDisplay::show(const Region& parts) {
  SDL_Surface* const shown = SDL_GetWindowSurface(window.get());
  if (shown == nullptr || !content || parts.empty()) return;
  std::vector<SDL_Rect> updated;
  for (const cairo_rectangle_int_t& part : parts) {
    const SDL_Rect from = toSdl(part);
    SDL_Rect to = from;
    SDL_BlitSurface(content.get(), &from, shown, &to);  // leaves in `to` what the window has of it
    updated.push_back(to);
  }
  SDL_UpdateWindowSurfaceRects(window.get(), updated.data(), static_cast<int>(updated.size()));
}

}  // namespace brimol::pc
