/// JSON that remembers where in its text each value stands.
#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace factory_test {

struct JsonNode {
  enum class Kind { Null, Boolean, Number, Text, List, Object };

  Kind kind = Kind::Null;
  int line = 1;                      // from 1; of a member, where its name stands
  std::string name = {};             // of a member
  double number = 0;                 // of a number
  std::string text = {};             // of a text, UTF-8
  std::vector<JsonNode> items = {};  // of a list, or the members of an object, as they stand there
};

/// A fault of a text: where, and what.
struct Complaint {
  int line = 1;
  std::string what = {};
};

/// What the text holds; nothing, and the complaint, for a text that is not JSON, or is nested more
/// than sixteen deep.
std::optional<JsonNode> parseJson(std::string_view text, Complaint& complaint);

}  // namespace factory_test
