/// From which pages a browser may come.
#pragma once

#include <string>
#include <string_view>

namespace brimol::pc {

/// An IPv4 address, or an IPv6 address in brackets.
bool isAddress(std::string_view host);
std::string_view withoutBrackets(std::string_view host);

/// Whether a browser that asks for `host` ("name:port") means this machine: by an address, as
/// localhost, or by `ownName`. An attacker's page can make a name of its own point here, and would
/// then count as a page of ours; an address it cannot.
bool isTrustedHost(std::string_view host, std::string_view ownName);

/// Whether the page that opens a connection to `host` was loaded from there.
bool isSameOrigin(std::string_view origin, std::string_view host);

/// The machine's name; empty where it has none.
std::string ownHostName();

}  // namespace brimol::pc
