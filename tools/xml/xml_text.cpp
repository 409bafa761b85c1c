#include "xml/xml_text.h"

#include <nlohmann/json.hpp>

namespace brimol::xml {

namespace {

using nlohmann::json;

constexpr std::string_view kReplacement = "\xef\xbf\xbd";  // U+FFFD

std::string escaped(char letter) {
  switch (letter) {
    case '&': return "&amp;";
    case '<': return "&lt;";
    case '>': return "&gt;";
    case '"': return "&quot;";
    case '\n': return "&#10;";
    case '\t': return "&#9;";
    default: break;
  }
  const bool isControl = letter >= '\0' && letter < ' ';
  return isControl ? std::string(kReplacement) : std::string(1, letter);
}

}  // namespace

// The JSON library checks the texts that it writes.
std::string validUtf8(std::string_view bytes) {
  return json::parse(json(bytes).dump(-1, ' ', false, json::error_handler_t::replace))
      .get<std::string>();
}

std::string escaped(std::string_view bytes) {
  std::string text;
  for (const char letter : validUtf8(bytes)) text += escaped(letter);
  // UTF-8's own last two characters, which XML does not know.
  for (const std::string_view unknown : {"\xef\xbf\xbe", "\xef\xbf\xbf"}) {
    for (auto at = text.find(unknown); at != std::string::npos; at = text.find(unknown, at)) {
      text.replace(at, unknown.size(), kReplacement);
    }
  }
  return text;
}

}  // namespace brimol::xml
