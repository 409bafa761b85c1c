#include "lint_view.h"

#include <algorithm>
#include <iomanip>
#include <sstream>
#include <tuple>

#include "scene/item.h"
#include "scene/item_text.h"
#include "scene/shown_texts.h"

namespace brimol::test {

namespace {

using pc::Edges;
using pc::Pixels;

Pixels middleOf(const Pixels& area) {
  return {area.x + area.width / 2, area.y + area.height / 2, 1, 1};
}

bool isGround(const SKIA_Item& item) {
  return pc::groundOf(item) != pc::Ground::None && pc::alphaOf(item.rect.color) != 0;
}

// A text's letters are cut at its item's sides.
Edges drawnPart(const Edges& ink, const SKIA_Rect& rect) {
  const Edges box = pc::edgesOf(rect);
  return {std::max(ink.left, box.left), ink.top, std::min(ink.right, box.right), ink.bottom};
}

std::vector<SeenText> textsOf(const Frame& frame, pc::Size screen, pc::TextPainter& painter) {
  std::vector<SeenText> texts;
  for (const pc::ShownText& shown : pc::shownTexts(frame, screen)) {
    const SKIA_Item& item = frame.at(shown.item);
    const pc::TextInk ink = painter.inkOf(item.rect, item.text);
    if (pc::isEmpty(ink.area)) continue;
    texts.push_back({shown.item, shown.text, drawnPart(ink.area, item.rect), ink});
  }
  return texts;
}

std::string pageOf(const Frame& frame, const std::vector<SeenText>& texts) {
  const auto rank = [&frame](const SeenText& seen) {
    const SKIA_Item& item = frame.at(seen.item);
    return std::tuple(item.rect.y, -item.text.size);
  };
  const auto top = std::ranges::min_element(texts, {}, rank);
  return top == texts.end() ? "" : top->text;
}

bool isButton(const SKIA_Item& item) {
  return item.kind == SKIA_BUTTONBOX || item.kind == SKIA_ROUNDBUTTONBOX;
}

bool isPage(const SKIA_Item& item, pc::Size screen) {
  return 2 * int64_t{item.rect.w} * item.rect.h >= int64_t{screen.w} * screen.h;
}

// The number of items: nothing small lies there. What has a box goes before what stands on it.
std::size_t itemUnder(const Moment& moment, pc::Size screen) {
  const Frame& frame = moment.frame;
  const Pixels spot = {moment.x, moment.y, 1, 1};
  std::size_t best = frame.size();
  for (std::size_t i = frame.size(); i-- > 0;) {
    const SKIA_Item& item = frame[i];
    const bool isBox = isGround(item);
    const bool isFigure = pc::figureOf(item) != pc::Figure::None;
    if (!(isBox || isFigure) || !pc::covers(pc::edgesOf(item.rect), spot)) continue;
    if (isPage(item, screen)) break;
    if (isBox) return i;
    if (best == frame.size()) best = i;
  }
  return best;
}

bool isSeen(const Frame& frame, std::size_t index, pc::Size screen) {
  const Pixels area = pc::within(pc::edgesOf(frame[index].rect), pc::wholeOf(screen));
  if (pc::isEmpty(area)) return false;
  const auto hides = [middle = middleOf(area)](const SKIA_Item& later) {
    return isGround(later) && pc::covers(pc::edgesOf(later.rect), middle);
  };
  return std::none_of(frame.begin() + static_cast<std::ptrdiff_t>(index) + 1, frame.end(), hides);
}

std::vector<std::size_t> targetsOf(const Moment& moment, pc::Size screen) {
  const std::size_t tapped =
      moment.deed == Moment::Deed::Tap ? itemUnder(moment, screen) : moment.frame.size();
  std::vector<std::size_t> targets;
  for (std::size_t i = 0; i < moment.frame.size(); ++i) {
    const bool isTarget = i == tapped || isButton(moment.frame[i]);
    if (isTarget && isSeen(moment.frame, i, screen)) targets.push_back(i);
  }
  return targets;
}

}  // namespace

std::string View::nameOf(std::size_t index) const {
  const Edges area = pc::edgesOf(item(index).rect);
  for (const SeenText& seen : texts) {
    const Pixels middle = {static_cast<int>((seen.ink.left + seen.ink.right) / 2),
                           static_cast<int>((seen.ink.top + seen.ink.bottom) / 2), 1, 1};
    if (seen.item == index || pc::covers(area, middle)) return seen.text;
  }
  std::string line = pc::textOfItem(item(index));
  return line.substr(0, line.find(" #"));
}

std::string View::signature() const {
  std::string all;
  for (const SeenText& seen : texts) all += seen.text + '\n';
  return all;
}

View viewOf(const std::vector<Moment>& moments, std::size_t number, pc::Size screen,
            pc::TextPainter& painter) {
  const Moment& moment = moments.at(number);
  View view{&moment, number, {}, textsOf(moment.frame, screen, painter), {}};
  view.page = pageOf(moment.frame, view.texts);
  view.targets = targetsOf(moment, screen);
  return view;
}

std::string Scale::text(double pixels) const {
  std::ostringstream text;
  text << std::fixed << std::setprecision(1) << mm(pixels) << " mm";
  return text.str();
}

Findings::Kind Findings::kindOf(Check check, const View& view, std::size_t item) {
  const SKIA_Rect& rect = view.item(item).rect;
  return {check, view.nameOf(item), rect.w, rect.h};
}

void Findings::add(Check check, const View& view, std::size_t item, const std::string& detail) {
  const Kind kind = kindOf(check, view, item);
  if (!known.emplace(check, kind.name, view.page).second) return;
  const SKIA_Rect& rect = view.item(item).rect;
  found.push_back(
      {{check, kind.name, view.page, detail, view.number}, kind, Place{rect.x, rect.y}});
}

void Findings::addGood(Check check, const View& view, std::size_t item) {
  const SKIA_Rect& rect = view.item(item).rect;
  good[kindOf(check, view, item)].emplace(rect.x, rect.y);
}

std::vector<Finding> Findings::taken() const {
  std::vector<Finding> all;
  for (const Found& each : found) {
    const auto elsewhere = good.find(each.kind);
    const bool wasScrolled =
        elsewhere != good.end() &&
        std::ranges::any_of(elsewhere->second, [&](const Place& at) { return at != each.place; });
    if (!wasScrolled) all.push_back(each.finding);
  }
  return all;
}

}  // namespace brimol::test
