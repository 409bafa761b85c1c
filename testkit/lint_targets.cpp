#include <algorithm>
#include <map>
#include <set>
#include <tuple>

#include "lint_view.h"
#include "scene/item.h"
#include "scene/item_text.h"

namespace brimol::test {

namespace {

using pc::Edges;
using pc::Pixels;

constexpr double kSmallestTargetMm = 7;
constexpr double kRoundingMm = 0.05;  // a size of 7 mm, rounded to pixels

int64_t sizeOf(const Pixels& area) { return int64_t{area.width} * area.height; }

// A target of a page, wherever it stands.
using Target = std::pair<std::string, std::string>;  // page, name

Target targetOf(const View& view, std::size_t item) { return {view.page, view.nameOf(item)}; }

// The items of the one frame that the other does not have.
std::vector<SKIA_Item> missingIn(const Frame& other, const Frame& one) {
  std::multiset<std::string> left;
  for (const SKIA_Item& item : other) left.insert(pc::textOfItem(item));
  std::vector<SKIA_Item> missing;
  for (const SKIA_Item& item : one) {
    const auto same = left.find(pc::textOfItem(item));
    if (same == left.end()) {
      missing.push_back(item);
    } else {
      left.erase(same);
    }
  }
  return missing;
}

/// What the keys of a session have reached.
class KeyReach {
 public:
  explicit KeyReach(const Scale& scale) : screen(pc::wholeOf(scale.screen)) {}

  void add(const View& before, const View& after) {
    const auto way = std::pair(before.signature(), after.signature());
    if (before.moment->deed == Moment::Deed::Key) {
      pages.insert(before.page);
      if (way.first != way.second) keyWays.insert(way);
      if (before.page == after.page) addMarked(before, after);
    } else if (before.moment->deed == Moment::Deed::Tap) {
      for (const std::size_t target : before.targets) {
        const Pixels spot = {before.moment->x, before.moment->y, 1, 1};
        const bool isTapped = pc::covers(pc::edgesOf(before.item(target).rect), spot);
        if (isTapped) tapWays.emplace(targetOf(before, target), way);
      }
    }
  }

  bool isTried(const View& view) const { return pages.contains(view.page); }

  bool reaches(const Target& target) const {
    const auto [first, last] = tapWays.equal_range(target);
    return marked.contains(target) || std::any_of(first, last, [this](const auto& way) {
             return keyWays.contains(way.second);
           });
  }

 private:
  void addMarked(const View& before, const View& after) {
    auto changes = missingIn(after.frame(), before.frame());
    const auto appeared = missingIn(before.frame(), after.frame());
    changes.insert(changes.end(), appeared.begin(), appeared.end());
    for (const View* const view : {&before, &after}) {
      for (const std::size_t target : view->targets) {
        const auto marks = [&](const SKIA_Item& change) {
          return isAround(change, view->item(target));
        };
        if (std::ranges::any_of(changes, marks)) marked.insert(targetOf(*view, target));
      }
    }
  }

  // Of about the target's size, and over most of it; or on it.
  bool isAround(const SKIA_Item& change, const SKIA_Item& target) const {
    const Pixels area = pc::within(pc::edgesOf(target.rect), screen);
    const Pixels mark = pc::boundsOf(change, screen);
    const int64_t common = sizeOf(pc::within(area, mark));
    const int64_t smaller = std::min(sizeOf(area), sizeOf(mark));
    return smaller > 0 && 2 * common >= smaller && sizeOf(mark) <= 2 * sizeOf(area);
  }

  using Way = std::pair<std::string, std::string>;  // the texts before and after
  Pixels screen;
  std::set<std::string> pages;  // on which a key was pressed
  std::set<Way> keyWays;
  std::multimap<Target, Way> tapWays;
  std::set<Target> marked;
};

}  // namespace

void lintTargets(const View& view, const Scale& scale, Findings& findings) {
  const Edges screen = pc::edgesOf(pc::wholeOf(scale.screen));
  for (const std::size_t target : view.targets) {
    const SKIA_Rect& rect = view.item(target).rect;
    const int side = std::min(rect.w, rect.h);
    if (scale.mm(side) < kSmallestTargetMm - kRoundingMm) {
      findings.add(
          Check::SmallTarget, view, target,
          scale.text(side) + (rect.h <= rect.w ? " high" : " wide") + ", at least 7 mm wanted");
    }
    const Edges area = pc::edgesOf(rect);
    const bool isInside = area.left >= screen.left && area.right <= screen.right &&
                          area.top >= screen.top && area.bottom <= screen.bottom;
    if (isInside) {
      findings.addGood(Check::OffScreen, view, target);
    } else {
      findings.add(Check::OffScreen, view, target, "a part of it is not on the screen");
    }
  }
}

void lintKeys(const std::vector<View>& views, const Scale& scale, Findings& findings) {
  KeyReach reach(scale);
  for (std::size_t i = 0; i + 1 < views.size(); ++i) reach.add(views[i], views[i + 1]);
  for (const View& view : views) {
    if (!reach.isTried(view)) continue;
    for (const std::size_t target : view.targets) {
      if (reach.reaches(targetOf(view, target))) continue;
      findings.add(Check::NoKey, view, target, "no key reached it");
    }
  }
}

}  // namespace brimol::test
