#include "remote/hosts.h"

#include <arpa/inet.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <cctype>

namespace brimol::pc {
namespace {

constexpr std::size_t kLongestName = 256;

bool isSameName(std::string_view one, std::string_view other) {
  const auto isSame = [](unsigned char a, unsigned char b) {
    return std::tolower(a) == std::tolower(b);
  };
  return std::ranges::equal(one, other, isSame);
}

bool isOfFamily(int family, std::string_view host) {
  std::array<unsigned char, sizeof(in6_addr)> bytes = {};
  return inet_pton(family, std::string(host).c_str(), bytes.data()) == 1;
}

std::string_view withoutPort(std::string_view host) {
  const std::size_t colon = host.rfind(':');
  const std::size_t bracket = host.rfind(']');
  const bool hasPort =
      colon != std::string_view::npos && (bracket == std::string_view::npos || colon > bracket);
  return hasPort ? host.substr(0, colon) : host;
}

}  // namespace

std::string_view withoutBrackets(std::string_view host) {
  const bool isBracketed = host.size() > 2 && host.front() == '[' && host.back() == ']';
  return isBracketed ? host.substr(1, host.size() - 2) : host;
}

bool isAddress(std::string_view host) {
  const std::string_view inside = withoutBrackets(host);
  return isOfFamily(inside.size() == host.size() ? AF_INET : AF_INET6, inside);
}

bool isTrustedHost(std::string_view host, std::string_view ownName) {
  const std::string_view name = withoutPort(host);
  return isAddress(name) || isSameName(name, "localhost") ||
         (!ownName.empty() && isSameName(name, ownName));
}

bool isSameOrigin(std::string_view origin, std::string_view host) {
  constexpr std::string_view kScheme = "http://";
  return origin.starts_with(kScheme) && isSameName(origin.substr(kScheme.size()), host);
}

std::string ownHostName() {
  std::array<char, kLongestName> name = {};
  if (gethostname(name.data(), name.size() - 1) != 0) return {};
  return name.data();
}

}  // namespace brimol::pc
