/// Texts on one line.
#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace brimol::pc {

/// `text` in quotes, with \", \\, \n, \t and, for other control characters, \xHH.
std::string inQuotes(std::string_view text);

/// What stands between the quotes, with its escapes undone; \* becomes a star. Nothing for a wrong
/// escape.
std::optional<std::string> unescaped(std::string_view inside);

/// `text` with a question mark for each control character, for messages.
std::string printable(std::string text);

}  // namespace brimol::pc
