#include "input/pointers.h"

namespace brimol::pc {

std::optional<int> Pointers::press(PointerId pointer, ScreenPoint at) {
  for (int finger = 0; finger < kFingers; ++finger) {
    if (isDown(finger)) continue;
    slot(finger) = {Use::Held, pointer, at};
    return finger;
  }
  return std::nullopt;
}

std::optional<int> Pointers::fingerOf(PointerId pointer) const {
  for (int finger = 0; finger < kFingers; ++finger) {
    if (slot(finger).use == Use::Held && slot(finger).owner == pointer) return finger;
  }
  return std::nullopt;
}

void Pointers::move(int finger, ScreenPoint to) { slot(finger).at = to; }

void Pointers::pin(int finger) { slot(finger).use = Use::Pinned; }

void Pointers::lift(int finger) { slot(finger).use = Use::Free; }

}  // namespace brimol::pc
