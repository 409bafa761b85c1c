#include "plan/json_lines.h"

#include <cstddef>
#include <iterator>
#include <nlohmann/json.hpp>
#include <utility>

#include "utf8.h"

namespace factory_test {

namespace {

using nlohmann::json;

constexpr std::size_t kDeepest = 16;

// The line of the last token. The parser has read one character more than a number has.
class LineCount {
 public:
  void pass(char passed) {
    if (isAtEnd) ++lastLine;
    isAtEnd = passed == '\n';
  }
  int line() const { return lastLine; }

 private:
  int lastLine = 1;
  bool isAtEnd = false;  // the last character ended its line
};

// Walks over the text for the parser and counts its lines.
class CountingIterator {
 public:
  using iterator_category = std::input_iterator_tag;
  using value_type = char;
  using difference_type = std::ptrdiff_t;
  using pointer = const char*;
  using reference = const char&;

  CountingIterator(const char* start, LineCount* lineCount) : at(start), count(lineCount) {}
  reference operator*() const { return *at; }
  CountingIterator& operator++() {
    count->pass(*at++);
    return *this;
  }
  bool operator==(const CountingIterator& other) const { return at == other.at; }
  bool operator!=(const CountingIterator& other) const { return at != other.at; }

 private:
  const char* at;
  LineCount* count;
};

// The parser's words without their head, "[json.exception.parse_error.101] parse error at line 1,
// column 2: ", as its lines are told by us.
std::string wordsOf(const json::exception& exception) {
  constexpr std::size_t kMostBytes = 160;
  const std::string_view words = exception.what();
  const std::size_t head = words.find("] ");
  const std::size_t place = words.find("parse error at ");
  const std::size_t colon = place == std::string_view::npos ? place : words.find(": ", place);
  if (colon != std::string_view::npos) return shortened(words.substr(colon + 2), kMostBytes);
  return shortened(head == std::string_view::npos ? words : words.substr(head + 2), kMostBytes);
}

// What the parser calls, value by value; the names are the parser's.
class TreeBuilder {
 public:
  TreeBuilder(const LineCount& lineCount, Complaint& firstComplaint)
      : count(lineCount), complaint(firstComplaint) {}

  bool null() { return add({.kind = JsonNode::Kind::Null}); }
  bool boolean(bool) { return add({.kind = JsonNode::Kind::Boolean}); }
  bool number_integer(json::number_integer_t value) { return number(static_cast<double>(value)); }
  bool number_unsigned(json::number_unsigned_t value) { return number(static_cast<double>(value)); }
  bool number_float(json::number_float_t value, const std::string&) { return number(value); }
  bool string(std::string& value) {
    return add({.kind = JsonNode::Kind::Text, .text = std::move(value)});
  }
  static bool binary(json::binary_t&) { return false; }  // JSON has none
  bool start_object(std::size_t) { return open(JsonNode::Kind::Object); }
  bool start_array(std::size_t) { return open(JsonNode::Kind::List); }
  bool end_object() { return close(); }
  bool end_array() { return close(); }
  bool key(std::string& value) {
    nextName = std::move(value);
    nextLine = count.line();
    return true;
  }
  bool parse_error(std::size_t, const std::string&, const json::exception& exception) {
    return complain("is not JSON: " + wordsOf(exception));
  }

  JsonNode takeRoot() { return std::move(root); }

 private:
  bool complain(std::string what) {
    complaint = {count.line(), std::move(what)};
    return false;
  }

  bool number(double value) { return add({.kind = JsonNode::Kind::Number, .number = value}); }

  bool add(JsonNode node) {
    place(std::move(node));
    return true;
  }

  JsonNode& place(JsonNode node) {
    const bool isMember = !opened.empty() && opened.back()->kind == JsonNode::Kind::Object;
    node.line = isMember ? nextLine : count.line();
    if (isMember) node.name = std::move(nextName);
    if (opened.empty()) return root = std::move(node);
    return opened.back()->items.emplace_back(std::move(node));
  }

  bool open(JsonNode::Kind kind) {
    if (opened.size() == kDeepest) return complain("is nested too deep");
    opened.push_back(&place({.kind = kind}));
    return true;
  }

  bool close() {
    opened.pop_back();
    return true;
  }

  const LineCount& count;
  Complaint& complaint;
  JsonNode root;
  std::vector<JsonNode*> opened;  // outermost first; none of their lists grows but the last one's
  std::string nextName;
  int nextLine = 1;
};

}  // namespace

std::optional<JsonNode> parseJson(std::string_view text, Complaint& complaint) {
  if (const int line = lineOfNul(text); line > 0) {
    complaint = {line, "is not JSON: holds a NUL byte"};
    return {};
  }
  LineCount count;
  TreeBuilder builder(count, complaint);
  const CountingIterator first(text.data(), &count);
  const CountingIterator last(text.data() + text.size(), &count);
  if (!json::sax_parse(first, last, &builder)) return {};
  return builder.takeRoot();
}

}  // namespace factory_test
