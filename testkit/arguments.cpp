#include "arguments.h"

#include <algorithm>
#include <array>
#include <climits>

#include <MW/event_service.h>

namespace brimol::test {

namespace {

constexpr auto kEnds = std::to_array<int32_t>(
    {INT_MIN, INT_MAX, INT_MIN + 1, INT_MAX - 1, -1, 127, 128, 255, 256, 1440, 2560, 65535});
constexpr int kSmall = 224;     // of the 256 values of a byte, those that are a small number
constexpr int kNegative = 16;   // of these, the numbers under 0
constexpr int kRaw = 240;       // from here on the number is the next four bytes
constexpr int kNullEvery = 16;  // of so many texts one is null

}  // namespace

uint8_t Arguments::byte() {
  if (rest.empty()) return 0;
  const uint8_t first = rest.front();
  rest = rest.subspan(1);
  return first;
}

std::string Arguments::remaining() {
  std::string all(rest.begin(), rest.end());
  rest = {};
  return all;
}

std::string Arguments::bytes() {
  const std::size_t wanted = byte();  // taken before what is left is asked for
  const std::size_t count = std::min(wanted, rest.size());
  std::string taken(rest.begin(), rest.begin() + static_cast<std::ptrdiff_t>(count));
  rest = rest.subspan(count);
  return taken;
}

int32_t Arguments::number() {
  if (rest.empty()) return 0;
  const int first = byte();
  if (first < kSmall) return first - (first < kSmall - kNegative ? 0 : kSmall);
  if (first < kRaw) return kEnds.at(static_cast<std::size_t>(first) % kEnds.size());
  uint32_t word = 0;
  for (int i = 0; i < 4; ++i) word = word << 8 | byte();
  return static_cast<int32_t>(word);
}

char* Arguments::text() {
  const std::string given = bytes();
  if (given.empty() && byte() % kNullEvery == 1) return nullptr;
  const std::size_t size = given.size() + 1;
  auto* const block = static_cast<char*>(memory.allocate(size, 1));
  *std::ranges::copy(given, block).out = '\0';
  const auto release = [from = &memory, size](char* bytes) { from->deallocate(bytes, size, 1); };
  return keep(
      std::shared_ptr<char>(block, release, std::pmr::polymorphic_allocator<char>(&memory)));
}

SKIA_Rect Arguments::record(const SKIA_Rect*) {
  SKIA_Rect taken = {};
  for (int32_t* const side : {&taken.x, &taken.y, &taken.w, &taken.h}) *side = number();
  taken.color = unsignedNumber();
  return taken;
}

SKIA_Point Arguments::record(const SKIA_Point*) {
  SKIA_Point taken = {};
  for (int32_t* const end : {&taken.x1, &taken.y1, &taken.x2, &taken.y2}) *end = number();
  taken.color = unsignedNumber();
  taken.width = number();
  return taken;
}

// Its length is mostly that of its text, which may lack the NUL.
SKIA_Text Arguments::record(const SKIA_Text*) {
  SKIA_Text taken = {};
  taken.string_len = static_cast<int32_t>(bytes().copy(taken.text, SKIA_TEXT_BYTES));
  if (byte() % 4 == 1) taken.string_len = number();
  taken.color = unsignedNumber();
  taken.align = number();
  taken.size = number();
  return taken;
}

Event Arguments::record(const Event*) {
  constexpr auto kTypes = std::to_array<uint8_t>(
      {BRIMOL_POINTER_DOWN, BRIMOL_POINTER_MOTION, BRIMOL_POINTER_UP, BRIMOL_LONG_PRESS,
       BRIMOL_KEY_DOWN, BRIMOL_KEY_UP, BRIMOL_USER_EVENT});
  constexpr std::size_t kReadBytes = 12;
  Event taken = {};
  const uint8_t type = byte();
  for (std::size_t i = 1; i < kReadBytes; ++i) taken.bytes[i] = byte();
  taken.type = type % 8 == 7 ? type : kTypes.at(type % 8);
  return taken;
}

MW::mouse_event Arguments::record(const MW::mouse_event*) {
  MW::mouse_event taken = {};
  taken.state = byte();
  taken.finger = unsignedNumber();
  for (int32_t* const each : {&taken.x, &taken.y, &taken.xrel, &taken.yrel}) *each = number();
  return taken;
}

MW::kbd_event Arguments::record(const MW::kbd_event*) {
  constexpr auto kKeys =
      std::to_array<uint32_t>({MW::kKeyUp, MW::kKeyDown, MW::kKeyRight, MW::kKeyLeft, MW::kKeyHook,
                               MW::kKeySelect, BRIMOL_CODE_BACK});
  const uint8_t which = byte();
  return {byte(), which % 8 == 7 ? unsignedNumber() : kKeys.at(which % 8)};
}

MW::event_data Arguments::record(const MW::event_data*) {
  const Event raw = take<Event>();
  MW::event_data taken = {};
  MW::EventService::parseEvent(&raw, &taken);
  return taken;
}

}  // namespace brimol::test
