/// What the sources of the text viewer share.
#pragma once

#include <climits>
#include <cstring>
#include <string_view>

#include "core/class_log.h"

namespace MW {

inline constexpr ClassLog kStaticTextLog("STATICTEXT");

/// An application's text of any length, cut where ints no longer count its lines. Null is empty.
inline std::string_view wholeText(const char* given) {
  if (given == nullptr) return "";
  return {given, strnlen(given, INT_MAX - 1)};
}

}  // namespace MW
