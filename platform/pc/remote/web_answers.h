/// What the web server answers to a browser's requests.
#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace brimol::pc {

/// One of the page's parts, or a file of noVNC.
struct WebAnswer {
  const char* type;       ///< of the content, as browsers name it
  std::string_view text;  ///< the content; it lives as long as the process
  std::string file;       ///< or the file that has it
};

/// The answer for a path such as "/"; nothing for one that there is not. Files are the scripts of
/// noVNC's core and of what it uses, and none else.
std::optional<WebAnswer> webAnswer(std::string_view path);

/// noVNC is where it is looked for.
bool hasNoVnc();

}  // namespace brimol::pc
