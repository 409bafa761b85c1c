#include "record_text.h"

namespace brimol::pc {

namespace {

std::string pair(int a, int b) { return std::to_string(a) + "," + std::to_string(b); }

std::string pointerText(const char* name, const BrimolPointerEvent& pointer) {
  std::string text = std::string(name) + " " + std::to_string(pointer.finger) + " at " +
                     pair(pointer.x, pointer.y);
  const bool moves = pointer.xrel != 0 || pointer.yrel != 0;
  if (moves || pointer.type == BRIMOL_POINTER_MOTION)
    text += " by " + pair(pointer.xrel, pointer.yrel);
  const int fitting = pointer.type == BRIMOL_POINTER_UP ? 0 : 1;
  if (pointer.state != fitting) text += " state " + std::to_string(pointer.state);
  return text;
}

std::string keyText(const char* name, const BrimolKeyEvent& key) {
  std::string text = std::string(name) + " " + std::to_string(key.code);
  const int fitting = key.type == BRIMOL_KEY_UP ? 0 : 1;
  if (key.state != fitting) text += " state " + std::to_string(key.state);
  return text;
}

}  // namespace

std::string textOf(const Event& record) {
  switch (record.type) {
    case BRIMOL_KEY_DOWN: return keyText("key down", record.key);
    case BRIMOL_KEY_UP: return keyText("key up", record.key);
    case BRIMOL_POINTER_MOTION: return pointerText("motion", record.pointer);
    case BRIMOL_POINTER_DOWN: return pointerText("down", record.pointer);
    case BRIMOL_POINTER_UP: return pointerText("up", record.pointer);
    case BRIMOL_LONG_PRESS: return pointerText("long", record.pointer);
    default: return "type " + std::to_string(record.type);
  }
}

std::vector<std::string> takeTexts(InputService& service) {
  std::vector<std::string> texts;
  Event record = {};
  while (service.poll(record)) texts.push_back(textOf(record));
  return texts;
}

}  // namespace brimol::pc
