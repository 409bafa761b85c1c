/// What the two threads that serve a viewer tell each other.
#pragma once

#include <atomic>
#include <cstddef>

namespace brimol::pc {

struct Viewer {
  /// Bytes that wait for the viewer to read them; the web server's thread writes it. Orders
  /// nothing.
  std::atomic<std::size_t> queuedBytes = 0;
  /// It knew the password; the VNC server's thread writes it. Orders nothing.
  std::atomic<bool> isAdmitted = false;
};

}  // namespace brimol::pc
