/// One viewer's connection.
#pragma once

#include <cstddef>
#include <memory>
#include <string>
#include <string_view>

#include "remote/message_gate.h"
#include "remote/viewer.h"

namespace brimol::pc {

/// Bytes in their order.
class ByteQueue {
 public:
  void push(std::string_view more) { bytes += more; }
  std::string_view front(std::size_t most) const {
    return std::string_view(bytes).substr(taken, most);
  }
  void drop(std::size_t count);
  std::size_t size() const { return bytes.size() - taken; }
  bool isEmpty() const { return size() == 0; }

 private:
  std::string bytes;
  std::size_t taken = 0;
};

/// What is on its way between a viewer and the VNC server. The server is not bothered before the
/// viewer has said its version of the protocol: its greeting comes from here.
class Caller {
 public:
  Caller();

  /// What the viewer sent. False when it is no viewer's, and the connection has to end.
  bool hear(std::string_view bytes);
  bool isReadyForServer() const { return gate.hasVersion(); }
  /// What the server sent.
  void answer(std::string_view bytes);
  /// The viewer was sent so many bytes.
  void drop(std::size_t count);

  const std::shared_ptr<Viewer>& shared() const { return viewer; }
  const ByteQueue& forViewer() const { return toViewer; }
  ByteQueue& forServer() { return toServer; }

 private:
  MessageGate gate;
  ByteQueue toViewer;
  ByteQueue toServer;
  std::size_t greetingLeft;  // bytes of the server's greeting that are still to come
  std::shared_ptr<Viewer> viewer = std::make_shared<Viewer>();
};

}  // namespace brimol::pc
