#include "host/properties.h"

#include <cstring>

namespace brimol::pc {

namespace {

// Never destroyed: threads may still read while the process ends.
PropertyStore& gProperties = *new PropertyStore;

std::string_view textOf(const char* text) {
  return text == nullptr ? std::string_view() : std::string_view(text);
}

}  // namespace

std::string PropertyStore::get(std::string_view key, std::string_view fallback) const {
  const std::lock_guard lock(mutex);
  const auto found = values.find(key);
  // As on a phone, a property that is set to nothing reads like one that is not set.
  const bool isSet = found != values.end() && !found->second.empty();
  return isSet ? found->second : std::string(fallback.substr(0, kMaxBytes));
}

bool PropertyStore::set(std::string_view key, std::string_view value) {
  if (key.empty() || value.size() > kMaxBytes) return false;
  const std::lock_guard lock(mutex);
  values.insert_or_assign(std::string(key), value);
  return true;
}

}  // namespace brimol::pc

using brimol::pc::gProperties;
using brimol::pc::textOf;

// NOLINTNEXTLINE(readability-identifier-naming): the parameters are named as in the contract
int property_get(const char* key, char* value, const char* default_value) {
  const std::string text = gProperties.get(textOf(key), textOf(default_value));
  if (value != nullptr) std::memcpy(value, text.c_str(), text.size() + 1);
  return static_cast<int>(text.size());
}

int property_set(const char* key, const char* value) {
  return gProperties.set(textOf(key), textOf(value)) ? 0 : -1;
}
