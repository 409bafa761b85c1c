#include "host/platform.h"

#include <cstdio>
#include <cstdlib>
#include <ctime>
#include <exception>
#include <filesystem>
#include <system_error>
#include <utility>

#include "clock/process_clock.h"
#include "host/saved_picture.h"
#include "host/session.h"
#include "painter/painter.h"
#include "remote/browser_display.h"
#include "scene/new_picture.h"

namespace brimol::pc {
namespace {

using std::chrono::duration_cast;
using std::chrono::microseconds;
using std::chrono::steady_clock;

// A frame that comes later than this after an event is none that the event caused.
constexpr std::chrono::seconds kLongestAnswer{1};

CairoSurface copyOf(cairo_surface_t* picture) {
  CairoSurface copy =
      newPicture({cairo_image_surface_get_width(picture), cairo_image_surface_get_height(picture)});
  const CairoContext context(cairo_create(copy.get()));
  cairo_set_operator(context.get(), CAIRO_OPERATOR_SOURCE);
  cairo_set_source_surface(context.get(), picture, 0, 0);
  cairo_paint(context.get());
  cairo_surface_flush(copy.get());
  return copy;
}

// What takes so many per cent of a screen's light away.
SKIA_Item veilOver(Size screen, int percent) {
  constexpr int kOpaqueAlpha = 255;
  constexpr int kWhole = 100;
  constexpr int kAlphaShift = 24;
  const auto alpha = static_cast<uint32_t>(percent * kOpaqueAlpha / kWhole);
  return {SKIA_BOX, {0, 0, screen.w, screen.h, alpha << kAlphaShift}, {}, {}};
}

OpenedDisplay openChosen(const Settings& settings, InputTranslator& input,
                         const InputService& service) {
  if (settings.display == DisplayChoice::Browser) {
    return BrowserDisplay::open(settings.screen, settings.listen, input, service);
  }
  return openDisplay(settings.display, settings.screen, input, service);
}

constinit thread_local bool isPlatformThread = false;

// A lost X server makes its library end the process from the platform's thread, while the others
// still run: they must not meet what the end of the process destroys. Registered as late as the
// first screen opens, it comes before all that.
void endAtOnceOnPlatformThread() {
  [[maybe_unused]] static const int registered = std::atexit([] {
    if (!isPlatformThread) return;
    std::fflush(nullptr);
    std::_Exit(EXIT_FAILURE);
  });
}

}  // namespace

std::shared_ptr<Platform> Platform::open(const Settings& settings, InputService& service,
                                         std::string& error) {
  endAtOnceOnPlatformThread();
  std::shared_ptr<Platform> platform(new Platform(settings, service));
  std::promise<std::string> opened;
  std::future<std::string> outcome = opened.get_future();
  platform->thread = std::thread([raw = platform.get(), answer = std::move(opened)]() mutable {
    raw->run(std::move(answer));
  });
  error = outcome.get();
  return error.empty() ? platform : nullptr;
}

void Platform::close() {
  if (!thread.joinable()) return;
  addWork([this](Work&) { isOver = true; });
  thread.join();
  for (auto& picture : waiting.pictures) picture.set_value(nullptr);
  waiting = {};
}

void Platform::submit(Frame& frame) {
  const int light = brightness;
  if (light < kFullLight) frame.push_back(veilOver(settings.screen, kFullLight - light));
  addWork([this, &frame](Work& work) {
    if (!work.frame) work.frame.emplace(std::exchange(shown, {}));
    work.frame->swap(frame);
  });
}

CairoSurface Platform::copyPicture(std::chrono::milliseconds bound) {
  std::promise<CairoSurface> wanted;
  std::future<CairoSurface> picture = wanted.get_future();
  const auto ask = [&wanted](Work& work) { work.pictures.push_back(std::move(wanted)); };
  if (!addWork(ask)) return nullptr;
  return picture.wait_for(bound) == std::future_status::ready ? picture.get() : nullptr;
}

bool Platform::act(Action action) {
  return addWork([&action](Work& work) { work.actions.push_back(std::move(action)); });
}

// False, and nothing changes, once the platform is closed.
template <typename Change>
bool Platform::addWork(Change change) {
  const std::lock_guard<std::mutex> lock(mutex);
  if (isOver) return false;
  change(waiting);
  if (awakener != nullptr) awakener->wake();
  return true;
}

void Platform::keepMemoryOf(Frame& painted) {
  const std::lock_guard<std::mutex> lock(mutex);
  shown.swap(painted);
}

// Nothing once the platform is to close.
std::optional<Platform::Work> Platform::takeWork() {
  const std::lock_guard<std::mutex> lock(mutex);
  if (isOver) return std::nullopt;
  return std::exchange(waiting, {});
}

void Platform::setDisplay(Display* display) {
  const std::lock_guard<std::mutex> lock(mutex);
  awakener = display;
}

void Platform::run(std::promise<std::string> opened) {
  isPlatformThread = true;
  if (auto* const clock = turnClock()) clock->stayOutside();
  InputTranslator input(settings.screen, service);
  OpenedDisplay outcome;
  try {
    outcome = openChosen(settings, input, service);
  } catch (const std::system_error&) {
    opened.set_exception(std::current_exception());
    return;
  }
  if (!outcome.display) {
    opened.set_value(outcome.error);
    return;
  }
  setDisplay(outcome.display.get());
  service.setTimeWatcher([this] { addWork([](Work&) {}); });
  opened.set_value({});
  serve(*outcome.display, input);
  service.setTimeWatcher({});
  setDisplay(nullptr);
}

void Platform::serve(Display& display, InputTranslator& input) {
  Painter painter(settings.screen);
  for (auto work = takeWork(); work; work = takeWork()) {
    if (work->frame) {
      show(*work->frame, painter, display);
      keepMemoryOf(*work->frame);
    }
    for (const Action& action : work->actions) action(input);
    for (auto& picture : work->pictures) picture.set_value(copyOf(painter.picture()));
    input.tick(service.now());
    display.wait(input.msToLongPress(service.now()));
    attend(display, painter);
  }
}

void Platform::show(const Frame& frame, Painter& painter, Display& display) const {
  const auto start = steady_clock::now();
  const Region& changed = painter.paint(frame);
  const auto end = steady_clock::now();
  FrameFigures figures = {painter.frame(), changed, duration_cast<microseconds>(end - start), {}};
  if (const auto arrival = service.takeFirstArrival(); arrival && end - *arrival < kLongestAnswer) {
    figures.sinceInput = duration_cast<microseconds>(end - *arrival);
  }
  display.note(figures);
  display.present(painter.picture(), changed);
}

// To what the user asked of the display.
void Platform::attend(Display& display, const Painter& painter) {
  if (display.takePictureWish()) {
    const std::string outcome =
        savePicture(painter.picture(), std::filesystem::current_path(), std::time(nullptr));
    std::fprintf(stderr, "brimol: %s\n", outcome.c_str());
  }
  if (display.isCloseRequested() && !closeRequested.exchange(true)) {
    if (Session* const recorded = session()) recorded->userCloses();
  }
}

}  // namespace brimol::pc
