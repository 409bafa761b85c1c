#include "input/event_records.h"

namespace brimol::pc {

Event pointerRecord(BrimolEventType type, int finger, ScreenPoint at) {
  Event record = {};
  record.pointer.type = static_cast<uint8_t>(type);
  record.pointer.finger = static_cast<uint8_t>(finger);
  record.pointer.state = type == BRIMOL_POINTER_UP ? 0 : 1;
  record.pointer.x = static_cast<uint16_t>(at.x);
  record.pointer.y = static_cast<uint16_t>(at.y);
  return record;
}

Event userRecord(uint32_t word1, uint32_t word2) {
  Event record = {};
  record.user.type = BRIMOL_USER_EVENT;
  record.user.word1 = word1;
  record.user.word2 = word2;
  return record;
}

Event keyRecord(BrimolEventType type, uint32_t code) {
  Event record = {};
  record.key.type = static_cast<uint8_t>(type);
  record.key.state = type == BRIMOL_KEY_UP ? 0 : 1;
  record.key.code = code;
  return record;
}

}  // namespace brimol::pc
