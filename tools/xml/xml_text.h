/// Texts for XML files that this project's programs write.
#pragma once

#include <string>
#include <string_view>

namespace brimol::xml {

/// `bytes` with U+FFFD in the place of what is no UTF-8.
std::string validUtf8(std::string_view bytes);

/// `bytes` as the text of an element or of an attribute in double quotes, in UTF-8. What is no
/// character, or none that XML can hold, becomes U+FFFD; line ends and tabs keep their value in
/// attributes, too.
std::string escaped(std::string_view bytes);

}  // namespace brimol::xml
