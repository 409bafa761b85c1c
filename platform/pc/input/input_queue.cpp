#include "input/input_queue.h"

#include <algorithm>
#include <limits>

namespace brimol::pc {

namespace {

bool isPointer(const Event& record) {
  switch (record.type) {
    case BRIMOL_POINTER_MOTION:
    case BRIMOL_POINTER_DOWN:
    case BRIMOL_POINTER_UP:
    case BRIMOL_LONG_PRESS: return true;
    default: return false;
  }
}

bool isMotion(const Event& record) { return record.type == BRIMOL_POINTER_MOTION; }

bool isPress(const Event& record) {
  return record.type == BRIMOL_POINTER_DOWN || record.type == BRIMOL_KEY_DOWN;
}

bool isDownOrUp(const Event& record) {
  return isPress(record) || record.type == BRIMOL_POINTER_UP || record.type == BRIMOL_KEY_UP;
}

bool isReleaseOf(const Event& press, const Event& record) {
  if (press.type == BRIMOL_KEY_DOWN) {
    return record.type == BRIMOL_KEY_UP && record.key.code == press.key.code;
  }
  return record.type == BRIMOL_POINTER_UP && record.pointer.finger == press.pointer.finger;
}

bool isOfSameFinger(const Event& one, const Event& other) {
  return isPointer(one) && isPointer(other) && one.pointer.finger == other.pointer.finger;
}

int16_t boundedSum(int16_t a, int16_t b) {
  using Limits = std::numeric_limits<int16_t>;
  return static_cast<int16_t>(std::clamp<int>(a + b, Limits::min(), Limits::max()));
}

bool hasExactSum(int16_t a, int16_t b) { return boundedSum(a, b) == a + b; }

}  // namespace

void InputQueue::push(const Event& record) {
  if (isMotion(record) && mergeWithWaiting(record)) return;
  records.push_back(record);
  if (records.size() > capacity) makeRoom();
}

bool InputQueue::take(Event& record) {
  if (records.empty()) return false;
  record = records.front();
  records.pop_front();
  return true;
}

// Only other fingers' motions may lie between: everything else keeps its place in the order.
bool InputQueue::mergeWithWaiting(const Event& motion) {
  for (auto one = records.rbegin(); one != records.rend() && isMotion(*one); ++one) {
    BrimolPointerEvent& waiting = one->pointer;
    if (waiting.finger != motion.pointer.finger) continue;
    if (!hasExactSum(waiting.xrel, motion.pointer.xrel)) return false;
    if (!hasExactSum(waiting.yrel, motion.pointer.yrel)) return false;
    const BrimolPointerEvent before = waiting;
    waiting = motion.pointer;
    waiting.xrel = boundedSum(before.xrel, waiting.xrel);
    waiting.yrel = boundedSum(before.yrel, waiting.yrel);
    return true;
  }
  return false;
}

void InputQueue::makeRoom() {
  // The newest record stays, or a finger's last position would be lost.
  const auto newest = records.end() - 1;
  const auto ofSameFinger = [&](const Event& record) {
    return isMotion(record) && isOfSameFinger(record, *newest);
  };
  auto leaving = std::find_if(records.begin(), newest, ofSameFinger);
  if (leaving == newest) leaving = std::find_if(records.begin(), newest, isMotion);
  if (leaving != newest) return dropMotion(leaving);

  leaving = std::find_if_not(records.begin(), newest, isDownOrUp);
  if (leaving != newest) {
    records.erase(leaving);
  } else {
    dropOldestPress();
  }
}

void InputQueue::dropMotion(Place motion) {
  const auto ofSameFinger = [&](const Event& record) { return isOfSameFinger(record, *motion); };
  const auto next = std::find_if(motion + 1, records.end(), ofSameFinger);
  if (next != records.end() && isMotion(*next)) {
    next->pointer.xrel = boundedSum(next->pointer.xrel, motion->pointer.xrel);
    next->pointer.yrel = boundedSum(next->pointer.yrel, motion->pointer.yrel);
  }
  records.erase(motion);
}

void InputQueue::dropOldestPress() {
  for (auto press = records.begin(); press != records.end(); ++press) {
    if (!isPress(*press)) continue;
    const auto releases = [&](const Event& record) { return isReleaseOf(*press, record); };
    const auto release = std::find_if(press + 1, records.end(), releases);
    if (release == records.end()) continue;
    const auto distance = release - press;
    const auto afterPress = records.erase(press);
    records.erase(afterPress + (distance - 1));
    return;
  }
  records.pop_front();
}

}  // namespace brimol::pc
