/// Which finger the mouse and every touch plays, and where it is.
#pragma once

#include <array>
#include <cstdint>
#include <optional>

#include "input/event_records.h"

namespace brimol::pc {

/// Something that points: a finger on a touch device, by the device's and its own number.
struct PointerId {
  int64_t device;
  int64_t finger;
  friend bool operator==(const PointerId&, const PointerId&) = default;
};

/// The mouse's left button, whatever mouse it is. SDL gives no touch device this number.
inline constexpr PointerId kMouse = {-2, 0};

/// The fingers that are down. A pointer takes the lowest free one and keeps it until it lifts, or
/// leaves it pinned: down where it is, with no pointer, until all pinned ones are lifted.
class Pointers {
 public:
  static constexpr int kFingers = 10;

  /// The finger that `pointer` took; none when all are taken. It must not have one yet.
  std::optional<int> press(PointerId pointer, ScreenPoint at);
  /// The finger that `pointer` has.
  std::optional<int> fingerOf(PointerId pointer) const;

  bool isDown(int finger) const { return slot(finger).use != Use::Free; }
  bool isPinned(int finger) const { return slot(finger).use == Use::Pinned; }
  ScreenPoint position(int finger) const { return slot(finger).at; }
  void move(int finger, ScreenPoint to);
  void pin(int finger);
  void lift(int finger);

 private:
  enum class Use { Free, Held, Pinned };
  struct Slot {
    Use use = Use::Free;
    PointerId owner = {};
    ScreenPoint at = {};
  };
  Slot& slot(int finger) { return slots[static_cast<std::size_t>(finger)]; }
  const Slot& slot(int finger) const { return slots[static_cast<std::size_t>(finger)]; }

  std::array<Slot, kFingers> slots;
};

}  // namespace brimol::pc
