/// What the sources of the text widgets share.
#pragma once

#include <MW/text_panel.h>

#include <algorithm>
#include <climits>
#include <cstring>
#include <string_view>

#include "core/bounded_text.h"
#include "core/class_log.h"

namespace MW {

/// The scroll bar and the keys that a layout takes away.
inline constexpr uint32_t kPanelGrey = 0xFF7F7F7F;

inline constexpr ClassLog kViewerLog("STATICTEXT");

/// An application's text of any length, cut where ints no longer count its lines. Null is empty.
inline std::string_view wholeText(const char* given) {
  if (given == nullptr) return "";
  return {given, strnlen(given, INT_MAX - 1)};
}

/// An application's text cut to what is kept of typed and wanted texts; NULs behind it.
inline ShortText shortText(const char* given) {
  ShortText kept = {};
  std::ranges::copy(cutText(wholeText(given), kept.size() - 1), kept.begin());
  return kept;
}

}  // namespace MW
