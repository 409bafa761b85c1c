#include "remote/browser_display.h"

#include <sys/random.h>

#include <array>
#include <cstdlib>
#include <iostream>
#include <string>
#include <utility>

#include "remote/hosts.h"
#include "remote/vnc_server.h"
#include "remote/web_answers.h"
#include "remote/web_server.h"

namespace brimol::pc {
namespace {

constexpr std::size_t kPasswordLength = 8;  // VNC's limit
constexpr std::size_t kPixelBytes = 4;
constexpr std::size_t kOverheadBytes = std::size_t{1} << 20;  // of an update, beyond its pixels

// 64 characters that need no quoting in an address.
constexpr std::string_view kPasswordCharacters =
    "abcdefghijklmnopqrstuvwxyzABCDEFGHIJKLMNOPQRSTUVWXYZ0123456789-_";
static_assert(kPasswordCharacters.size() == 64);

std::string newPassword() {
  std::array<unsigned char, kPasswordLength> random = {};
  if (getrandom(random.data(), random.size(), 0) != static_cast<ssize_t>(random.size())) {
    std::abort();  // a kernel without randomness
  }
  std::string password;
  for (const unsigned char byte : random) {
    password += kPasswordCharacters[byte % kPasswordCharacters.size()];
  }
  return password;
}

// Where others reach the machine, when it listens at all of its addresses.
std::string reachableHost(const std::string& host) {
  if (host == "0.0.0.0" || host == "::") return ownHostName();
  return host.find(':') == std::string::npos ? host : '[' + host + ']';
}

void tellAddress(const Listeners& listeners, const std::string& host, const std::string& password) {
  const std::string reachable = reachableHost(host);
  std::cerr << "The screen is at http://" << reachable << ':' << listeners.web.port << "/#"
            << password << "\nVNC viewers: " << reachable << "::" << listeners.vnc.port
            << ", password " << password << '\n';
  if (!hasNoVnc()) {
    std::cerr << "noVNC is missing, which browsers need: install Debian's package novnc.\n";
  }
}

}  // namespace

OpenedDisplay BrowserDisplay::open(Size screen, const std::optional<ListenAddress>& address,
                                   InputTranslator& input, const InputService& service) {
  for (const OnDemand* const library : {&websockets().library, &rfb().library}) {
    if (!library->error().empty()) return {nullptr, "cannot serve browsers: " + library->error()};
  }
  std::string error;
  auto listeners = listenAt(address, error);
  if (!listeners) return {nullptr, error};
  const std::string password = newPassword();
  tellAddress(*listeners, address ? address->host : "127.0.0.1", password);
  return {std::unique_ptr<Display>(
              new BrowserDisplay(screen, std::move(*listeners), password, input, service)),
          {}};
}

BrowserDisplay::BrowserDisplay(Size screen, Listeners listeners, const std::string& password,
                               InputTranslator& target, const InputService& clock)
    : input(target), service(clock), vnc(std::make_unique<VncServer>(screen, password, actions)) {
  const std::size_t update =
      static_cast<std::size_t>(screen.w) * static_cast<std::size_t>(screen.h) * kPixelBytes +
      kOverheadBytes;
  web =
      std::make_unique<WebServer>(std::move(listeners), update,
                                  ViewerService{[this](Socket end, std::shared_ptr<Viewer> viewer) {
                                                  vnc->attach(std::move(end), std::move(viewer));
                                                },
                                                [this] { vnc->lookAgain(); }});
}

// Up to its end the VNC server needs someone who takes what it still has to say.
BrowserDisplay::~BrowserDisplay() { vnc->stop(); }

void BrowserDisplay::present(cairo_surface_t* picture, const Region& changed) {
  vnc->present(picture, changed);
}

void BrowserDisplay::wait(std::optional<uint32_t> ms) {
  const std::vector<ViewerAction> done = actions.wait(ms);
  if (done.empty()) return;
  for (const ViewerAction& action : done) play(action, service.now(), input);
  vnc->lookAgain();
}

}  // namespace brimol::pc
