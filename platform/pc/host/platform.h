/// The platform's own thread: it owns the display and the painter.
#pragma once

#include <algorithm>
#include <atomic>
#include <chrono>
#include <functional>
#include <future>
#include <memory>
#include <mutex>
#include <optional>
#include <string>
#include <thread>
#include <utility>
#include <vector>

#include "display/display.h"
#include "host/settings.h"
#include "input/input_service.h"
#include "input/input_translator.h"
#include "scene/cairo_handles.h"
#include "scene/scene.h"

namespace brimol::pc {

class Painter;

/// An open screen. Its thread sleeps until a frame, the user or a long press that falls due gives
/// it something to do. Any thread may call any operation; a closed platform ignores them.
class Platform {
 public:
  /// Something that the user does, told to the input on the platform's thread.
  using Action = std::function<void(InputTranslator& input)>;

  /// Opens the display that the settings choose; input records go to `service`, which is open and
  /// outlives the platform. Null, with the reason in one line in `error`, where there is none.
  /// Throws std::system_error where one of its threads cannot be started.
  static std::shared_ptr<Platform> open(const Settings& settings, InputService& service,
                                        std::string& error);
  ~Platform() { close(); }
  Platform(const Platform&) = delete;
  Platform& operator=(const Platform&) = delete;

  /// Closes the display and ends the thread. A thread that waits in copyPicture() gets null. Not to
  /// be called on the platform's own thread, nor by two threads at once; a second call does
  /// nothing.
  void close();

  Size screen() const { return settings.screen; }
  float density() const { return settings.density; }

  /// Shows `frame` soon, instead of one that still waits to be shown. Never waits itself.
  /// Afterwards `frame` is another one: which is overtaken, or shown before.
  void submit(Frame& frame);

  /// Darkens the frames that are submitted from now on. `percent` is clamped to 0, dark, to 100,
  /// full light.
  void setBrightness(int percent) { brightness = std::clamp(percent, 0, kFullLight); }

  /// Waits until the newest frame is painted and all actions are done, and returns a copy of the
  /// picture. Null when that takes longer than `bound`, or when the platform closes.
  CairoSurface copyPicture(std::chrono::milliseconds bound);

  /// Runs `action` soon on the platform's thread, as if the display had reported it. Actions keep
  /// their order. False where the platform is closed or about to close.
  bool act(Action action);

  bool isCloseRequested() const { return closeRequested; }

 private:
  // What the thread finds when it wakes up.
  struct Work {
    std::optional<Frame> frame;
    std::vector<Action> actions;
    std::vector<std::promise<CairoSurface>> pictures;
  };

  static constexpr int kFullLight = 100;  // per cent

  Platform(Settings wanted, InputService& target) : settings(std::move(wanted)), service(target) {}
  void run(std::promise<std::string> opened);
  void serve(Display& display, InputTranslator& input);
  void show(const Frame& frame, Painter& painter, Display& display) const;
  void attend(Display& display, const Painter& painter);
  std::optional<Work> takeWork();
  void keepMemoryOf(Frame& painted);
  void setDisplay(Display* display);
  template <typename Change>
  bool addWork(Change change);

  const Settings settings;
  InputService& service;
  std::atomic<bool> closeRequested = false;  // written by the platform's thread; orders nothing
  std::atomic<int> brightness = kFullLight;  // per cent; orders nothing

  std::mutex mutex;  // guards the four below
  bool isOver = false;
  Work waiting;
  Frame shown;                  // painted already: its memory is for one to come
  Display* awakener = nullptr;  // the display while it can be woken; the thread owns it

  std::thread thread;
};

}  // namespace brimol::pc
