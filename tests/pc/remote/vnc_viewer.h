/// A VNC viewer of LibVNCClient, and connections that are none.
#pragma once

#include <rfb/rfbclient.h>

#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "remote/listener.h"
#include "scene/rectangles.h"

namespace brimol::test {

/// Is connected from its construction to its destruction, unless it was refused.
class VncViewer {
 public:
  VncViewer(int port, std::string password);
  ~VncViewer() { close(); }
  VncViewer(const VncViewer&) = delete;
  VncViewer& operator=(const VncViewer&) = delete;

  bool isConnected() const { return client != nullptr; }
  void close();

  /// Receives until the pixel has that colour; false when the connection ends.
  bool waitForPixel(int x, int y, uint32_t colour);
  /// The parts of the picture that were received since the last call.
  std::vector<pc::Pixels> takeParts();

  void mouse(int buttons, int x, int y) { SendPointerEvent(client, x, y, buttons); }
  void key(uint32_t symbol, bool isDown) { SendKeyEvent(client, symbol, isDown ? TRUE : FALSE); }
  void sendRaw(std::string_view bytes);

 private:
  rfbClient* client;
  std::string secret;
  std::vector<pc::Pixels> parts;
};

/// A connection to 127.0.0.1 over which `bytes` were sent.
pc::Socket rawConnection(int port, std::string_view bytes);
/// Waits for the other side's bytes up to a line's end, or to its end.
std::string readLine(const pc::Socket& connection);
/// Waits until the other side ends the connection, and reads nothing. False: it does not.
bool waitForEnd(const pc::Socket& connection);

}  // namespace brimol::test
