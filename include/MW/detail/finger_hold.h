/// One finger's hold of a widget.
#pragma once

#include <MW/records.h>

#include <atomic>

namespace MW {

/// The finger that pressed holds until it lifts. The hold is kept in the widget's selection, which
/// the window's routing reads, too: 0 while no finger holds, else the finger's number + 1. Finger
/// 0xFFFFFFFF therefore never holds. Any thread.
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
  bool isOwner(const mouse_event& mouse) const {
    const int holder = selection;
    return holder != 0 && holder == wordOf(mouse);
  }
  /// Whether another finger than this one holds.
  bool isOthers(const mouse_event& mouse) const {
    const int holder = selection;
    return holder != 0 && holder != wordOf(mouse);
  }

 private:
  std::atomic<int>& selection;
};

}  // namespace MW
