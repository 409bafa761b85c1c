/// Text that may hold any bytes.
#pragma once

#include <string>
#include <string_view>

namespace factory_test {

/// U+FFFD, the sign for what is no character.
constexpr std::string_view kReplacement = "\xef\xbf\xbd";

/// `text` with kReplacement for what is no UTF-8.
std::string validUtf8(std::string_view text);

}  // namespace factory_test
