/// The store behind property_get and property_set.
#pragma once

#include <brimol/properties.h>

#include <map>
#include <mutex>
#include <string>
#include <string_view>

namespace brimol::pc {

/// Texts by name, kept in memory. Any thread.
class PropertyStore {
 public:
  static constexpr std::size_t kMaxBytes = BRIMOL_PROPERTY_BYTES - 1;  // of a value, without NUL

  /// The value of `key`; `fallback`, cut to kMaxBytes, where it is not set or empty.
  std::string get(std::string_view key, std::string_view fallback) const;

  /// False, and nothing is changed, for an empty key or a value of over kMaxBytes.
  bool set(std::string_view key, std::string_view value);

 private:
  mutable std::mutex mutex;  // guards values
  std::map<std::string, std::string, std::less<>> values;
};

}  // namespace brimol::pc
