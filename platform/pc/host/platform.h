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
#include <vector>

#include "display/display.h"
#include "host/settings.h"
#include "input/input_service.h"
#include "input/input_translator.h"
#include "scene/cairo_handles.h"
#include "scene/scene.h"

namespace brimol::pc {

/// An open screen. Its thread sleeps until a frame, the user or a long press that falls due gives
/// it something to do. Any thread may call any operation; a closed platform ignores them.
class Platform {
 public:
  /// Something that the user does, told to the input on the platform's thread.
  using Action = std::function<void(InputTranslator& input)>;

  /// Opens the display that the settings choose; input records go to `service`, which is open and
  /// outlives the platform. Null, with the reason in one line in `error`, where there is none.
  static std::shared_ptr<Platform> open(const Settings& settings, InputService& service,
                                        std::string& error);
  ~Platform() { close(); }
  Platform(const Platform&) = delete;
  Platform& operator=(const Platform&) = delete;

  /// Closes the display and ends the thread. Who waits for a picture gets none. One of the other
  /// threads at a time may close; a second time does nothing.
  void close();

  Size screen() const { return settings.screen; }

  /// Has `frame` shown in place of one that still waits. Never waits itself.
  void submit(Frame&& frame);

  /// Darkens the frames that are submitted from now on. Full light is 100 per cent, none is 0, and
  /// what lies beyond is taken for the nearest.
  void setBrightness(int percent) { brightness = std::clamp(percent, 0, kFullLight); }

  /// A copy of the picture as it is once the newest frame is painted and all actions are done. Null
  /// when that takes longer than `bound`, or when the platform closes.
  CairoSurface copyPicture(std::chrono::milliseconds bound);

  /// Has `action` done soon, and all actions in their order, as if the display had seen them.
  /// False: the platform is closed, or is about to.
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

  Platform(const Settings& wanted, InputService& target) : settings(wanted), service(target) {}
  void run(std::promise<std::string> opened);
  void serve(Display& display, InputTranslator& input);
  std::optional<Work> takeWork();
  void setDisplay(Display* display);
  template <typename Change>
  bool addWork(Change change);

  const Settings settings;
  InputService& service;
  std::atomic<bool> closeRequested = false;  // written by the platform's thread; orders nothing
  std::atomic<int> brightness = kFullLight;  // per cent; orders nothing

  std::mutex mutex;  // guards the three below
  bool isOver = false;
  Work waiting;
  Display* awakener = nullptr;  // the display while it can be woken; the thread owns it

  std::thread thread;
};

}  // namespace brimol::pc
