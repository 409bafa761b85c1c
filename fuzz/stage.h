/// The toolkit under a fuzzer: started once, its threads held, so that a run does everything on the
/// fuzzer's thread and always the same.
#pragma once

#include <MW/widget.h>
#include <brimol/input.h>

#include <array>
#include <memory>

#include "arguments.h"
#include "widget_classes.h"

namespace brimol::fuzz {

/// A screen of some size, a clock that begins at some time, and widgets in a few places. One at a
/// time; it leaves the toolkit as it found it.
class FuzzStage {
 public:
  static constexpr std::size_t kPlaces = 6;

  explicit FuzzStage(test::Arguments& given);
  ~FuzzStage();
  FuzzStage(const FuzzStage&) = delete;
  FuzzStage& operator=(const FuzzStage&) = delete;

  /// Makes a widget that is active and told of in callbacks, in place of the one that was there.
  void make(std::size_t place);
  void remove(std::size_t place) { occupants.at(place).reset(); }
  /// Null: the place is empty.
  MW::Widget* at(std::size_t place) const { return occupants.at(place).widget.get(); }
  /// Calls something that the widget has; an empty place: nothing.
  void operate(std::size_t place);

  /// Sends an event through the queue and the dispatcher.
  static void dispatch(const Event& event);
  /// A random one, or a finger at a place on the screen.
  void dispatchRecord() { dispatch(from.take<Event>()); }
  void dispatchTouch();
  /// Time passes, and now and then jumps.
  void wait();
  /// A round of the application's loop: timers and a frame. Stops the fuzzer where a text is drawn
  /// that does not fit into its record.
  static void round();

 private:
  struct Occupant {
    std::unique_ptr<MW::Widget> widget = nullptr;
    const test::WidgetClass* itsClass = nullptr;
    void reset() { widget.reset(); }
  };

  test::Arguments& from;
  std::array<Occupant, kPlaces> occupants;
};

}  // namespace brimol::fuzz
