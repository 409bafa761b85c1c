#include "display/sdl_display.h"

#include <algorithm>
#include <cstdlib>
#include <limits>
#include <string>
#include <utility>

namespace brimol::pc {
namespace {

constexpr const char* kTitle = "brimol (F1: keys)";
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
  sdl().setHintWithPriority(SDL_HINT_VIDEODRIVER, visibleDrivers(), SDL_HINT_DEFAULT);
  sdl().setHint(SDL_HINT_NO_SIGNAL_HANDLERS, "1");        // Ctrl-C is the application's
  sdl().setHint(SDL_HINT_MOUSE_FOCUS_CLICKTHROUGH, "1");  // the click that brings the focus counts
  sdl().setHint(SDL_HINT_TOUCH_MOUSE_EVENTS, "0");
  sdl().setHint(SDL_HINT_MOUSE_TOUCH_EVENTS, "0");
  sdl().setHint(SDL_HINT_VIDEO_ALLOW_SCREENSAVER, "1");
  sdl().setHint(SDL_HINT_VIDEO_X11_NET_WM_BYPASS_COMPOSITOR, "0");
}

// The detour over a texture, which SDL prefers, costs what WindowPixels says.
void chooseShortWay() {
  const std::string driver = sdl().getCurrentVideoDriver();
  if (driver == "x11") {
    sdl().setHintWithPriority(SDL_HINT_FRAMEBUFFER_ACCELERATION, "0", SDL_HINT_DEFAULT);
  }
}

// The room that the desktop has for a window's content.
Size desktopRoom(SDL_Window* window) {
  SDL_Rect usable = {};
  const int desktop = window != nullptr ? std::max(sdl().getWindowDisplayIndex(window), 0) : 0;
  if (sdl().getDisplayUsableBounds(desktop, &usable) != 0) {
    return {std::numeric_limits<int>::max(), std::numeric_limits<int>::max()};
  }
  int top = 0;
  int left = 0;
  int bottom = 0;
  int right = 0;
  if (window != nullptr) sdl().getWindowBordersSize(window, &top, &left, &bottom, &right);
  return {std::max(usable.w - left - right, 1), std::max(usable.h - top - bottom, 1)};
}

// No larger than the screen, nor than the desktop's room.
Size openingSize(Size screen, Size room) {
  return fittedSize(screen, {std::min(room.w, screen.w), std::min(room.h, screen.h)});
}

OpenedDisplay failed(const std::string& reason) {
  return {nullptr, "cannot open a window: " + reason + " (BRIMOL_DISPLAY=headless does without)"};
}

}  // namespace

SdlVideo::SdlVideo() {
  setHints();
  isOpen = sdl().init(SDL_INIT_VIDEO) == 0;
  if (!isOpen) return;
  chooseShortWay();
  sdl().stopTextInput();  // keys are keys here, no input method composes with them
}

SdlVideo::~SdlVideo() { sdl().quit(); }

OpenedDisplay SdlDisplay::open(Size screen, InputTranslator& input, const InputService& service) {
  if (const std::string& missing = sdl().library.error(); !missing.empty()) return failed(missing);
  std::unique_ptr<SdlDisplay> display(new SdlDisplay(screen, input, service));
  if (display->window) return {std::move(display), {}};
  return failed(sdl().getError());
}

SdlDisplay::SdlDisplay(Size screenSize, InputTranslator& target, const InputService& clock)
    : screen(screenSize), input(screenSize, target), service(clock) {
  if (!video.isOpen) return;
  wantedSize = openingSize(screen, desktopRoom(nullptr));
  window.reset(sdl().createWindow(kTitle, SDL_WINDOWPOS_UNDEFINED, SDL_WINDOWPOS_UNDEFINED,
                                  wantedSize.w, wantedSize.h,
                                  SDL_WINDOW_RESIZABLE | SDL_WINDOW_ALLOW_HIGHDPI));
  if (!window) return;
  pixels = WindowPixels::of(window.get());
  takeWindowSize();
}

void SdlDisplay::present(cairo_surface_t* picture, const Region& changed) {
  latest = picture;
  const Region parts = canvas->update(picture, changed);
  overlay.isEmpty() ? pixels->show(canvas->pixels(), parts) : showAll();
}

void SdlDisplay::wait(std::optional<uint32_t> ms) {
  constexpr uint32_t kLongest = std::numeric_limits<int>::max();
  const std::optional<uint32_t> tick = input.msToTick(service.now());
  const uint32_t least = std::min({ms.value_or(kLongest), tick.value_or(kLongest), kLongest});
  SDL_Event event;
  int isEvent = ms || tick ? sdl().waitEventTimeout(&event, static_cast<int>(least))
                           : sdl().waitEvent(&event);
  for (int count = 1; isEvent != 0; ++count) {
    handle(event);
    isEvent = count < kEventsPerWait ? sdl().pollEvent(&event) : 0;
  }
  input.tick(service.now());
  if (overlay.setFingers(input.fingers())) showAll();
}

void SdlDisplay::wake() {
  if (wakeIsComing.exchange(true)) return;
  SDL_Event event = {};
  event.type = kWakeEvent;
  // A full queue has no room for it, and ends the wait without it.
  if (sdl().pushEvent(&event) != 1) wakeIsComing = false;
}

void SdlDisplay::handle(const SDL_Event& event) {
  switch (event.type) {
    case kWakeEvent: wakeIsComing = false; return;
    case SDL_WINDOWEVENT: return handleWindow(event.window);
    case SDL_QUIT: closeRequested = true; return input.releaseAll();
    case SDL_KEYDOWN:
    case SDL_KEYUP:
      if (takeDisplayKey(event.key)) return;
      break;
    default: break;
  }
  input.take(event, {canvas->fit(), points}, service.now());
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

bool SdlDisplay::takeDisplayKey(const SDL_KeyboardEvent& event) {
  const std::optional<DisplayKey> key = displayKey(event.keysym.sym);
  if (key && event.type == SDL_KEYDOWN && event.repeat == 0) play(*key);
  return key.has_value();
}

void SdlDisplay::play(DisplayKey key) {
  switch (key) {
    case DisplayKey::ListKeys: overlay.toggleKeys(); return showAll();
    case DisplayKey::ShowFigures: overlay.toggleFigures(); return showAll();
    case DisplayKey::FullScreen: return toggleFullScreen();
    case DisplayKey::SavePicture: wantsPicture = true; return;
  }
}

void SdlDisplay::toggleFullScreen() {
  const bool isFull = (sdl().getWindowFlags(window.get()) & SDL_WINDOW_FULLSCREEN_DESKTOP) != 0;
  sdl().setWindowFullscreen(window.get(), isFull ? 0 : SDL_WINDOW_FULLSCREEN_DESKTOP);
}

// The borders are known only once a window manager has put them around the window. A window that
// has another size than it was asked to have was sized by somebody else, and stays so.
void SdlDisplay::fitToDesktop() {
  const Size fitted = openingSize(screen, desktopRoom(window.get()));
  if (fitted == wantedSize || points != wantedSize) return;
  wantedSize = fitted;
  sdl().setWindowSize(window.get(), fitted.w, fitted.h);
}

void SdlDisplay::takeWindowSize() {
  sdl().getWindowSize(window.get(), &points.w, &points.h);
  canvas.emplace(screen, pixels->size());
  if (latest != nullptr) canvas->update(latest, {{0, 0, screen.w, screen.h}});
  showAll();
}

void SdlDisplay::showAll() {
  const WindowFit& fit = canvas->fit();
  cairo_surface_t* const dressed =
      overlay.isEmpty() ? nullptr : overlay.drawOver(canvas->pixels(), fit);
  pixels->show(dressed == nullptr ? canvas->pixels() : dressed,
               {{0, 0, fit.window.w, fit.window.h}});
}

}  // namespace brimol::pc
