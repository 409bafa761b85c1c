#include "scene/shown_texts.h"

#include <algorithm>

#include "scene/item.h"

namespace brimol::pc {

namespace {

constexpr std::string_view kBlanks = " \t\r\n";

std::string_view trimmed(std::string_view text) {
  const std::size_t first = text.find_first_not_of(kBlanks);
  if (first == std::string_view::npos) return {};
  return text.substr(first, text.find_last_not_of(kBlanks) + 1 - first);
}

Pixels pointIn(const Pixels& area) {
  return {area.x + area.width / 2, area.y + area.height / 2, 1, 1};
}

bool hidesMiddle(const SKIA_Item& item, const Pixels& middle) {
  const bool isDrawn = groundOf(item) != Ground::None && alphaOf(item.rect.color) != 0;
  return isDrawn && covers(edgesOf(item.rect), middle);
}

}  // namespace

std::vector<ShownText> shownTexts(const Frame& frame, Size screen) {
  std::vector<ShownText> texts;
  for (auto item = frame.begin(); item != frame.end(); ++item) {
    const std::string_view text = trimmed(shownText(item->text));
    if (figureOf(*item) != Figure::Text || text.empty()) continue;
    const Pixels area = within(edgesOf(item->rect), wholeOf(screen));
    if (isEmpty(area)) continue;
    const auto hides = [middle = pointIn(area)](const SKIA_Item& later) {
      return hidesMiddle(later, middle);
    };
    if (std::any_of(item + 1, frame.end(), hides)) continue;
    texts.push_back({std::string(text), area, static_cast<std::size_t>(item - frame.begin())});
  }
  return texts;
}

bool TextPattern::matches(std::string_view text) const {
  text = trimmed(text);
  if (pieces.size() < 2) return !pieces.empty() && text == trimmed(pieces.front());
  if (!text.starts_with(pieces.front())) return false;
  text.remove_prefix(pieces.front().size());
  for (auto piece = pieces.begin() + 1; piece != pieces.end() - 1; ++piece) {
    const std::size_t found = text.find(*piece);
    if (found == std::string_view::npos) return false;
    text.remove_prefix(found + piece->size());
  }
  return text.ends_with(pieces.back());
}

bool TextPattern::isFoundIn(std::string_view text) const {
  for (const std::string& piece : pieces) {
    const std::size_t found = text.find(piece);
    if (found == std::string_view::npos) return false;
    text.remove_prefix(found + piece.size());
  }
  return true;
}

}  // namespace brimol::pc
