#include "results/utf8.h"

#include <nlohmann/json.hpp>

namespace factory_test {

using nlohmann::json;

// The JSON library checks the texts that it writes.
std::string validUtf8(std::string_view text) {
  const auto replaced = json(text).dump(-1, ' ', false, json::error_handler_t::replace);
  return json::parse(replaced).get<std::string>();
}

}  // namespace factory_test
