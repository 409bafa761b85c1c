/// One finger's hold of a widget.
#pragma once

#include <MW/records.h>

#include <atomic>

namespace MW {

/// Who holds a widget, as one finger asks.
enum class HeldBy { Nobody, ThisFinger, AnotherFinger };

/// Records which finger holds a widget, in the widget's `select`, which event routing reads too: 0
/// for none, else the finger's number + 1. Finger 0xFFFFFFFF therefore never holds. Safe on any
/// thread.
class FingerHold {
 public:
  explicit FingerHold(std::atomic<int>& selectionWord) : selection(selectionWord) {}

  /// What stands for the finger in a selection.
  static constexpr int wordOf(const mouse_event& mouse) {
    return static_cast<int>(mouse.finger + 1);
  }

  void press(const mouse_event& mouse) { selection = wordOf(mouse); }
  void letGo() { selection = 0; }
  bool isHeld() const { return selection != 0; }
  /// Whether this finger holds.
  bool isOwner(const mouse_event& mouse) const { return heldBy(mouse) == HeldBy::ThisFinger; }
  /// Read once, so that the answer does not change halfway.
  HeldBy heldBy(const mouse_event& mouse) const {
    const int holder = selection;
    if (holder == 0) return HeldBy::Nobody;
    return holder == wordOf(mouse) ? HeldBy::ThisFinger : HeldBy::AnotherFinger;
  }
  /// Whether another finger than this one holds.
  bool isOthers(const mouse_event& mouse) const { return heldBy(mouse) == HeldBy::AnotherFinger; }

 private:
  std::atomic<int>& selection;
};

}  // namespace MW
