/// The texts that a coloured page takes.
#pragma once

#include <MW/color_page.h>

#include "dialogs/dialog_parts.h"

namespace MW {

/// None: it is too long for a box. Null is the empty text.
inline std::optional<std::string_view> pageText(const char* given) {
  return wholeText(given != nullptr ? given : "", ColorPage::kPageTextMax);
}
static_assert(ColorPage::kPageTextMax < SKIA_TEXT_BYTES, "a record is not read beyond its end");

}  // namespace MW
