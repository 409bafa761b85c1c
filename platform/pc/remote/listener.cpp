#include "remote/listener.h"

#include <arpa/inet.h>
#include <netdb.h>
#include <sys/socket.h>

#include <array>
#include <cerrno>
#include <charconv>
#include <cstring>
#include <limits>
#include <memory>
#include <system_error>

#include "remote/hosts.h"

namespace brimol::pc {
namespace {

const ListenAddress kUsual = {"127.0.0.1", 5800};

struct AddressDeleter {
  void operator()(addrinfo* found) const { freeaddrinfo(found); }
};
using Address = std::unique_ptr<addrinfo, AddressDeleter>;

Address resolve(const ListenAddress& address) {
  addrinfo hints = {};
  hints.ai_flags = AI_NUMERICHOST | AI_NUMERICSERV | AI_PASSIVE;
  hints.ai_socktype = SOCK_STREAM;
  addrinfo* found = nullptr;
  const std::string port = std::to_string(address.port);
  if (getaddrinfo(address.host.c_str(), port.c_str(), &hints, &found) != 0) return nullptr;
  return Address(found);
}

std::optional<uint16_t> portOf(const Socket& socket) {
  sockaddr_storage name = {};
  socklen_t length = sizeof name;
  std::array<char, NI_MAXSERV> digits = {};
  uint16_t port = 0;
  // The cast is that of the socket calls: every kind of address begins like a sockaddr.
  auto* const any = reinterpret_cast<sockaddr*>(&name);
  if (getsockname(socket.get(), any, &length) != 0) return std::nullopt;
  if (getnameinfo(any, length, nullptr, 0, digits.data(), digits.size(), NI_NUMERICSERV) != 0) {
    return std::nullopt;
  }
  std::from_chars(digits.data(), digits.data() + std::strlen(digits.data()), port);
  return port;
}

std::optional<Listener> listenOnOne(const ListenAddress& address) {
  const Address found = resolve(address);
  if (!found) return std::nullopt;
  Socket socket(::socket(found->ai_family, SOCK_STREAM | SOCK_NONBLOCK | SOCK_CLOEXEC, 0));
  const int yes = 1;
  const bool listens = socket.get() >= 0 &&
                       setsockopt(socket.get(), SOL_SOCKET, SO_REUSEADDR, &yes, sizeof yes) == 0 &&
                       bind(socket.get(), found->ai_addr, found->ai_addrlen) == 0 &&
                       listen(socket.get(), SOMAXCONN) == 0;
  if (!listens) return std::nullopt;
  const std::optional<uint16_t> port = portOf(socket);
  if (!port) return std::nullopt;
  return Listener{std::move(socket), *port};
}

std::optional<Listeners> listenOnBoth(const ListenAddress& address) {
  const int next = address.port == 0 ? 0 : address.port + 1;
  auto web = listenOnOne(address);
  if (!web) return std::nullopt;
  auto vnc = listenOnOne({address.host, static_cast<uint16_t>(next)});
  if (!vnc) return std::nullopt;
  return Listeners{std::move(*web), std::move(*vnc)};
}

}  // namespace

std::optional<ListenAddress> parseListenAddress(std::string_view text) {
  const std::size_t colon = text.rfind(':');
  if (colon == std::string_view::npos) return std::nullopt;
  const std::string_view host = text.substr(0, colon);
  const std::string_view digits = text.substr(colon + 1);
  uint16_t port = 0;
  const char* const end = digits.data() + digits.size();
  const auto [stop, problem] = std::from_chars(digits.data(), end, port);
  const bool hasNext = port < std::numeric_limits<uint16_t>::max();
  if (problem != std::errc() || stop != end || !hasNext || !isAddress(host)) return std::nullopt;
  return ListenAddress{std::string(withoutBrackets(host)), port};
}

std::optional<Listeners> listenAt(const std::optional<ListenAddress>& address, std::string& error) {
  auto listeners = listenOnBoth(address.value_or(kUsual));
  if (!listeners && !address) listeners = listenOnBoth({kUsual.host, 0});
  if (!listeners) {
    const ListenAddress& wanted = address.value_or(kUsual);
    error = "cannot listen at " + wanted.host + ", port " + std::to_string(wanted.port) +
            " and the next: " + std::strerror(errno);
  }
  return listeners;
}

}  // namespace brimol::pc
