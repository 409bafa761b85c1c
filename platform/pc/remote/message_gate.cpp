#include "remote/message_gate.h"

#include <algorithm>
#include <array>

namespace brimol::pc {
namespace {

// The protocol's handshake.
constexpr std::size_t kVersionBytes = 12;
constexpr char kPasswordSecurity = 2;
constexpr std::size_t kPasswordBytes = 16;

// A viewer's messages.
constexpr uint8_t kPixelFormat = 0;
constexpr uint8_t kEncodings = 2;
constexpr uint8_t kUpdateRequest = 3;
constexpr uint8_t kKey = 4;
constexpr uint8_t kPointer = 5;
constexpr uint8_t kClipboard = 6;
constexpr std::size_t kMaxEncodings = 256;
constexpr std::size_t kClipboardHead = 8;

constexpr std::size_t kBroken = 0;

struct Version {
  std::string_view greeting;
  bool choosesSecurity;  // in older versions the server alone does
};
// What viewers answer to 3.8. The server takes whatever looks like a number in their place, and
// might read another one there than the gate.
constexpr auto kVersions = std::to_array<Version>({{"RFB 003.003\n", false},
                                                   {"RFB 003.005\n", false},
                                                   {"RFB 003.007\n", true},
                                                   {"RFB 003.008\n", true},
                                                   {"RFB 003.889\n", true}});

std::size_t number(std::string_view message, std::size_t at, std::size_t bytes) {
  std::size_t value = 0;
  for (const char byte : message.substr(at, bytes)) {
    value = value << 8 | static_cast<unsigned char>(byte);
  }
  return value;
}

std::size_t encodingsBytes(std::string_view message) {
  constexpr std::size_t kHead = 4;
  constexpr std::size_t kEach = 4;
  if (message.size() < kHead) return kHead;
  const std::size_t count = number(message, 2, 2);
  return count <= kMaxEncodings ? kHead + kEach * count : kBroken;
}

// A negative length is that of an extension's data.
std::size_t clipboardBytes(std::string_view head) {
  const auto length = static_cast<int32_t>(number(head, 4, 4));
  return length < 0 ? static_cast<std::size_t>(-int64_t{length}) : static_cast<std::size_t>(length);
}

std::size_t messageBytes(std::string_view message) {
  switch (static_cast<uint8_t>(message.front())) {
    case kPixelFormat: return 20;
    case kEncodings: return encodingsBytes(message);
    case kUpdateRequest: return 10;
    case kKey: return 8;
    case kPointer: return 6;
    case kClipboard: return kClipboardHead;
    case MessageGate::kFingerMessage: return MessageGate::kFingerBytes;
    default: return kBroken;
  }
}

}  // namespace

bool MessageGate::take(std::string_view bytes, std::string& whole) {
  while (!bytes.empty()) {
    if (toSwallow > 0) {
      const std::size_t swallowed = std::min(toSwallow, bytes.size());
      toSwallow -= swallowed;
      bytes.remove_prefix(swallowed);
      continue;
    }
    // A message's length may show only when some of it is there: one byte, or its head.
    const std::size_t known = partial.empty() ? 1 : wantedBytes(partial);
    const std::size_t more = std::min(known - partial.size(), bytes.size());
    partial += bytes.substr(0, more);
    bytes.remove_prefix(more);
    const std::size_t wanted = wantedBytes(partial);
    if (wanted == kBroken) return false;
    if (partial.size() < wanted) continue;
    if (!pass(partial, whole)) return false;
    partial.clear();
  }
  return true;
}

std::size_t MessageGate::wantedBytes(std::string_view message) const {
  switch (stage) {
    case Stage::Version: return kVersionBytes;
    case Stage::Password: return kPasswordBytes;
    case Stage::Normal: return messageBytes(message);
    default: return 1;
  }
}

bool MessageGate::pass(std::string_view message, std::string& whole) {
  switch (stage) {
    case Stage::Version: {
      const auto* const version = std::ranges::find(kVersions, message, &Version::greeting);
      if (version == kVersions.end()) return false;
      stage = version->choosesSecurity ? Stage::Security : Stage::Password;
      break;
    }
    case Stage::Security:
      if (message.front() != kPasswordSecurity) return false;
      stage = Stage::Password;
      break;
    case Stage::Password: stage = Stage::Start; break;
    case Stage::Start: stage = Stage::Normal; break;
    case Stage::Normal:
      if (message.front() != kClipboard) break;
      toSwallow = clipboardBytes(message);
      return true;
  }
  whole += message;
  return true;
}

}  // namespace brimol::pc
