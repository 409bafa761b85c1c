/// Texts that are looked for, as people write them.
#pragma once

#include <string>

#include "scene/shown_texts.h"

namespace brimol::test {

/// Its pieces between stars; `\*` is a star.
pc::TextPattern patternOf(const std::string& text);

}  // namespace brimol::test
