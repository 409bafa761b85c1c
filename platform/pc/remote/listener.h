/// Sockets, and where they listen.
#pragma once

#include <unistd.h>

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <utility>

namespace brimol::pc {

/// Owns a file descriptor; -1 is none.
class Socket {
 public:
  explicit Socket(int descriptor = -1) : number(descriptor) {}
  ~Socket() { close(); }
  Socket(Socket&& other) noexcept : number(other.release()) {}
  Socket& operator=(Socket&& other) noexcept {
    close();
    number = other.release();
    return *this;
  }

  int get() const { return number; }
  int release() { return std::exchange(number, -1); }

 private:
  void close() const {
    if (number >= 0) ::close(number);
  }
  int number;
};

/// An IPv4 or IPv6 address in figures, without brackets.
struct ListenAddress {
  std::string host;
  uint16_t port;  ///< 0: any that is free
};

/// Reads "127.0.0.1:5800" or "[::1]:5800"; nothing for any other text.
std::optional<ListenAddress> parseListenAddress(std::string_view text);

/// A socket that listens. It neither blocks nor lives on in programs that are started.
struct Listener {
  Socket socket;
  uint16_t port;
};

/// The listeners of browsers and of VNC viewers, on an address and the port after it.
struct Listeners {
  Listener web;
  Listener vnc;
};

/// Listens at `address`; without one at 127.0.0.1, on the ports 5800 and 5801 or, where these are
/// taken, on free ones. Nothing, with the reason in one line in `error`, where that fails.
std::optional<Listeners> listenAt(const std::optional<ListenAddress>& address, std::string& error);

}  // namespace brimol::pc
