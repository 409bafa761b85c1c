#include "scene/item_text.h"

#include <algorithm>
#include <array>
#include <cstdio>
#include <iterator>

#include "scene/item.h"
#include "scene/quoted_text.h"

namespace brimol::pc {

namespace {

constexpr auto kKindNames =
    std::to_array<const char*>({"label", "textbox", "buttonbox", "box", "roundbox", "staticbox",
                                "line", "image", "roundtextbox", "roundbuttonbox", "arrow"});
static_assert(kKindNames.size() == kItemKinds.size());

template <typename... Number>
std::string numbers(Number... each) {
  std::string text;
  ((text += ' ', text += std::to_string(each)), ...);
  return text;
}

std::string colour(uint32_t word) {
  std::array<char, 16> text = {};
  std::snprintf(text.data(), text.size(), " #%08x", word);
  return text.data();
}

std::string figureText(const SKIA_Item& item) {
  const SKIA_Point& line = item.point;
  const SKIA_Text& text = item.text;
  switch (figureOf(item)) {
    case Figure::Text:
      return ' ' + inQuotes(shownText(text)) + numbers(text.size, text.align) + colour(text.color);
    // Without its folder, which is another one on another machine.
    case Figure::Picture: {
      const std::string_view name = shownText(text);
      return ' ' + inQuotes(name.substr(name.rfind('/') + 1));
    }
    case Figure::Line:
      return numbers(line.x1, line.y1, line.x2, line.y2, line.width) + colour(line.color);
    case Figure::Arrow:
      return (line.width == SKIA_ARROW_RIGHT ? " right" : " left") + colour(line.color);
    case Figure::None: break;
  }
  return {};
}

}  // namespace

std::string textOfItem(const SKIA_Item& item) {
  if (!isKnownKind(item.kind)) return "nothing";
  const SKIA_Rect& rect = item.rect;
  std::string text = kKindNames.at(static_cast<std::size_t>(item.kind));
  if (figureOf(item) != Figure::Line) text += numbers(rect.x, rect.y, rect.w, rect.h);
  if (groundOf(item) != Ground::None) text += colour(rect.color);
  return text + figureText(item);
}

std::vector<std::string> textOfFrame(const Frame& frame) {
  std::vector<std::string> lines;
  lines.reserve(frame.size());
  std::ranges::transform(frame, std::back_inserter(lines), textOfItem);
  return lines;
}

uint64_t hashOf(const std::vector<std::string>& lines) {
  constexpr uint64_t kOffset = 0xcbf29ce484222325;
  constexpr uint64_t kPrime = 0x100000001b3;
  uint64_t hash = kOffset;
  const auto add = [&hash](char byte) { hash = (hash ^ static_cast<uint8_t>(byte)) * kPrime; };
  for (const std::string& line : lines) {
    std::ranges::for_each(line, add);
    add('\n');
  }
  return hash;
}

std::string hashText(uint64_t hash) {
  std::array<char, 17> text = {};
  std::snprintf(text.data(), text.size(), "%016llx", static_cast<unsigned long long>(hash));
  return text.data();
}

}  // namespace brimol::pc
