// What browsers and VNC viewers may send: the bytes of a connection, cut anywhere, the messages in
// them, up to input records; and the requests of browsers.

#include <brimol3_widget_test/input.h>

#include <cstdio>
#include <cstdlib>
#include <string>

#include "arguments.h"
#include "input/input_service.h"
#include "remote/caller.h"
#include "remote/hosts.h"
#include "remote/viewer_hands.h"
#include "remote/web_answers.h"

namespace {

using namespace brimol::pc;  // NOLINT(google-build-using-namespace): its own words
using brimol::test::Arguments;

void fail() { std::abort(); }

// The server reads the version as a number, and waits for all of a handshake's message that begins.
bool endsWithinTheHandshake(const std::string& passed) {
  constexpr std::size_t kVersion = 12;
  constexpr unsigned int kSecuritySince = 7;
  unsigned int major = 0;
  unsigned int minor = 0;
  if (passed.empty()) return false;
  if (std::sscanf(passed.c_str(), "RFB %03u.%03u\n", &major, &minor) != 2) return true;
  const std::size_t beforePassword = kVersion + (minor >= kSecuritySince ? 1 : 0);
  const std::size_t password = 16;
  return passed.size() < kVersion ||
         (passed.size() > beforePassword && passed.size() < beforePassword + password);
}

// Whole messages alone get through, and no more bytes than came.
void sendBytes(const std::string& bytes, std::size_t step) {
  Caller caller;
  std::size_t heard = 0;
  for (std::size_t i = 0; i < bytes.size(); i += step) {
    const std::string piece = bytes.substr(i, step);
    heard += piece.size();
    if (!caller.hear(piece)) return;
    if (caller.forServer().size() > heard) fail();
    if (!caller.isReadyForServer() && !caller.forServer().isEmpty()) fail();
  }
  MessageGate again;
  std::string whole;
  const std::string passed(caller.forServer().front(heard));
  // What got through gets through once more, as it is.
  if (!again.take(passed, whole) || whole != passed) fail();
  if (endsWithinTheHandshake(passed)) fail();
}

void ask(Arguments& from) {
  const std::string host = from.bytes();
  const std::string origin = from.bytes();
  const auto answer = webAnswer(from.bytes());
  if (answer && answer->file.find("..") != std::string::npos) fail();
  if (isTrustedHost(host, "bench-7") && isSameOrigin(origin, host) &&
      !origin.starts_with("http://")) {
    fail();
  }
}

// A viewer's hands, and what the application gets: never a finger or a place that there is not.
void act(Arguments& from) {
  constexpr Size kScreen = {480, 800};
  InputService service;
  service.open();
  InputTranslator input(kScreen, service);
  ActionQueue queue;
  ViewerHands hands(1, queue);
  uint32_t now = from.take<uint32_t>();
  while (!from.isAtEnd()) {
    const ScreenPoint at = {from.take<int>(), from.take<int>()};
    switch (from.below(4)) {
      case 0: hands.mouse(from.byte(), at); break;
      case 1: hands.finger(static_cast<FingerAction>(from.byte()), from.byte(), at); break;
      case 2: hands.key(from.take<uint32_t>(), from.take<bool>()); break;
      default: hands.letGo(); break;
    }
    now += from.byte();
    queue.wake();
    for (const ViewerAction& action : queue.wait(0)) play(action, now, input);
    input.tick(now);
  }
  for (Event record = {}; service.poll(record);) {
    const bool isPointer = record.type == BRIMOL_POINTER_DOWN ||
                           record.type == BRIMOL_POINTER_MOTION ||
                           record.type == BRIMOL_POINTER_UP || record.type == BRIMOL_LONG_PRESS;
    if (!isPointer) continue;
    const BrimolPointerEvent& pointer = record.pointer;
    if (pointer.finger > 9 || pointer.x >= kScreen.w || pointer.y >= kScreen.h) fail();
  }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* bytes, std::size_t count) {
  Arguments from({bytes, count});
  const std::size_t kind = from.below(4);
  if (kind == 0) {
    ask(from);
  } else if (kind == 1) {
    act(from);
  } else {
    const std::size_t step = 1 + from.byte();
    sendBytes((kind == 2 ? "RFB 003.008\n\2" + std::string(17, 'x') : "") + from.remaining(), step);
  }
  return 0;
}
