// What the server takes from viewers and browsers, and what it makes of it.
#include <gtest/gtest.h>

#include <array>
#include <string>
#include <vector>

#include "remote/caller.h"
#include "remote/hosts.h"
#include "remote/listener.h"
#include "remote/viewer_hands.h"
#include "remote/web_answers.h"

namespace brimol::pc {
namespace {

using namespace std::string_literals;
using Kind = ViewerAction::Kind;

const std::string kHandshake = "RFB 003.008\n\2" + std::string(16, 'p') + "\1";
const std::string kKey = "\4\1\0\0\0\0\0h"s;
const std::string kFinger = "\310\1\0\5\0\6\2\0"s;
const std::string kEncodings = "\2\0\0\2\0\0\0\0\0\0\0\1"s;
const std::string kClipboard = "\6\0\0\0\0\0\0\3abc"s;
const std::string kLongClipboard =
    "\6\0\0\0\xFF\xFF\xFF\xFE"
    "ab"s;

struct Stream {
  const char* name;
  std::string bytes;
  std::string passed;
  bool isViewer = true;
};

const std::string kOld = "RFB 003.003\n" + std::string(16, 'p') + "\1";
const auto kStreams = std::to_array<Stream>(
    {{"all messages, and no clipboard",
      kHandshake + kEncodings + kClipboard + kLongClipboard + kFinger + kKey,
      kHandshake + kEncodings + kFinger + kKey},
     {"an old viewer", kOld + kKey, kOld + kKey},
     {"half a message", kHandshake + kKey.substr(0, 7), kHandshake},
     {"a browser", "GET / HTTP/1.1\r\n", "", false},
     {"a version that is half a number", "RFB 003.00A\n\2", "", false},
     {"no password wanted", "RFB 003.008\n\1", "RFB 003.008\n", false},
     {"an unknown message", kHandshake + "\7" + kKey, kHandshake, false},
     {"too many encodings", kHandshake + "\2\0\xFF\xFF"s, kHandshake, false}});

void expectPassed(const Stream& stream, std::size_t step) {
  MessageGate gate;
  std::string passed;
  bool isViewer = true;
  for (std::size_t at = 0; at < stream.bytes.size() && isViewer; at += step) {
    isViewer = gate.take(stream.bytes.substr(at, step), passed);
  }
  EXPECT_EQ(passed, stream.passed);
  EXPECT_EQ(isViewer, stream.isViewer);
}

TEST(MessageGate, PassesWholeMessagesOfViewersAlone) {
  for (const Stream& stream : kStreams) {
    for (const std::size_t step : {std::size_t{1}, std::size_t{5}, stream.bytes.size()}) {
      SCOPED_TRACE(stream.name + std::to_string(step));
      expectPassed(stream, step);
    }
  }
}

TEST(Caller, GreetsInsteadOfTheServer) {
  Caller caller;
  EXPECT_EQ(caller.forViewer().front(99), "RFB 003.008\n");
  EXPECT_TRUE(caller.hear("RFB 003.0"));
  EXPECT_FALSE(caller.isReadyForServer());
  EXPECT_TRUE(caller.hear("08\n"));
  EXPECT_TRUE(caller.isReadyForServer());
  caller.answer("RFB 003.");
  caller.answer("008\nmore");
  caller.drop(12);
  EXPECT_EQ(caller.forViewer().front(99), "more");
  EXPECT_EQ(caller.shared()->queuedBytes, 4);
}

TEST(Hosts, AreThisMachineOrAnAttackers) {
  for (const char* host : {"127.0.0.1:5800", "[::1]:5800", "[::1]", "localhost:1", "LocalHost",
                           "bench-7:5800", "192.168.0.9"}) {
    EXPECT_TRUE(isTrustedHost(host, "bench-7")) << host;
    EXPECT_TRUE(isSameOrigin(std::string("http://") + host, host)) << host;
  }
  for (const char* host : {"", "evil.example:5800", "127.0.0.1.evil.example", "localhost.evil",
                           "::1", "[127.0.0.1]:5800", "evil.example:127.0.0.1"}) {
    EXPECT_FALSE(isTrustedHost(host, "")) << host;
  }
  for (const char* origin : {"http://localhost:9999", "http://localhost", "null", "", "localhost:1",
                             "http://evil.example", "http://localhost:1/"}) {
    EXPECT_FALSE(isSameOrigin(origin, "localhost:1")) << origin;
  }
}

TEST(ListenAddress, HasAnAddressAndAPort) {
  EXPECT_EQ(parseListenAddress("0.0.0.0:5800")->port, 5800);
  EXPECT_EQ(parseListenAddress("[::1]:0")->host, "::1");
  for (const char* wrong : {"", ":5800", "127.0.0.1", "127.0.0.1:", "127.0.0.1:65535",
                            "127.0.0.1:-1", "127.0.0.1:1x", "localhost:1", "::1:5800", "[::1]"}) {
    EXPECT_FALSE(parseListenAddress(wrong)) << wrong;
  }
}

TEST(WebAnswers, ArePagePartsAndScripts) {
  EXPECT_NE(webAnswer("/")->text.find("screen.js"), std::string::npos);
  EXPECT_TRUE(webAnswer("/novnc/core/rfb.js")->file.ends_with("/core/rfb.js"));
  for (const char* path : {"", "/nothing", "/novnc/", "/novnc/core/../../x.js", "/novnc/vnc.html",
                           "/novnc/app/ui.js", "/novnc//etc/x.js", "/novnc/core/a%2e.js"}) {
    EXPECT_FALSE(webAnswer(path)) << path;
  }
}

TEST(ViewerHands, LetGoOfAllThatIsHeld) {
  ActionQueue queue;
  ViewerHands hands(7, queue);
  hands.mouse(2, {1, 1});
  hands.mouse(1, {2, 2});
  hands.mouse(3, {3, 3});
  hands.finger(FingerAction::Down, 0, {4, 4});
  hands.finger(FingerAction::Down, 1, {5, 5});
  hands.finger(FingerAction::Up, 0, {4, 4});
  hands.finger(FingerAction{9}, 3, {4, 4});
  hands.key(0xFFE1, true);  // Shift
  hands.key('H', true);
  hands.key(0xFFBE, true);  // F1
  hands.letGo();
  hands.letGo();
  const PointerId first = {7, 0};
  const PointerId second = {7, 1};
  const std::vector<ViewerAction> expected = {
      {Kind::PointerDown, kMouse, {2, 2}}, {Kind::PointerMove, kMouse, {3, 3}},
      {Kind::PointerDown, first, {4, 4}},  {Kind::PointerDown, second, {5, 5}},
      {Kind::PointerUp, first, {4, 4}},    {Kind::KeyDown, {}, {}, SDLK_LSHIFT},
      {Kind::KeyDown, {}, {}, SDLK_h},     {Kind::KeyUp, {}, {}, SDLK_h},
      {Kind::KeyUp, {}, {}, SDLK_LSHIFT},  {Kind::PointerUp, second, {5, 5}},
      {Kind::PointerUp, kMouse, {3, 3}}};
  EXPECT_EQ(queue.wait(0), expected);
}

}  // namespace
}  // namespace brimol::pc
