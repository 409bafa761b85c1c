/// A frame as its user sees it, for the checks of the lint.
#pragma once

#include <brimol3_widget_test/lint.h>

#include <functional>
#include <map>
#include <set>
#include <string>
#include <tuple>
#include <utility>
#include <vector>

#include "painter/text_painter.h"
#include "scene/rectangles.h"

namespace brimol::test {

struct SeenText {
  std::size_t item;  // its number in the frame
  std::string text;
  pc::Edges ink;  // the letters that are drawn; not cut to the screen
  pc::TextInk whole;
};

struct View {
  const Moment* moment;
  std::size_t number;  // of the moment
  std::string page;
  std::vector<SeenText> texts;
  std::vector<std::size_t> targets;  // items

  const Frame& frame() const { return moment->frame; }
  const SKIA_Item& item(std::size_t index) const { return moment->frame.at(index); }
  std::string nameOf(std::size_t index) const;
  /// The texts alone.
  std::string signature() const;
};

View viewOf(const std::vector<Moment>& moments, std::size_t number, pc::Size screen,
            pc::TextPainter& painter);

/// Millimetres on the screen that is looked at.
class Scale {
 public:
  explicit Scale(const Profile& profile)
      : screen{profile.size.width, profile.size.height}, dpi(profile.dpi) {}
  double mm(double pixels) const { return pixels * kInch / dpi; }
  std::string text(double pixels) const;

  pc::Size screen;

 private:
  static constexpr double kInch = 25.4;  // mm
  double dpi;
};

/// What was found, each finding once, and where it was not found.
class Findings {
 public:
  void add(Check check, const View& view, std::size_t item, const std::string& detail);
  /// The item was looked at, and has no such finding.
  void addGood(Check check, const View& view, std::size_t item);
  /// Without what was only scrolled.
  std::vector<Finding> taken() const;

 private:
  using Place = std::pair<int32_t, int32_t>;
  struct Kind {  // an item wherever it stands
    Check check;
    std::string name;
    int32_t w, h;
    friend bool operator<(const Kind& a, const Kind& b) {
      return std::tie(a.check, a.name, a.w, a.h) < std::tie(b.check, b.name, b.w, b.h);
    }
  };
  struct Found {
    Finding finding;
    Kind kind;
    Place place;
  };
  static Kind kindOf(Check check, const View& view, std::size_t item);

  std::vector<Found> found;
  std::set<std::tuple<Check, std::string, std::string>> known;  // check, item, page
  std::map<Kind, std::set<Place>> good;
};

void lintTexts(const View& view, const Scale& scale, Findings& findings);
void lintTargets(const View& view, const Scale& scale, Findings& findings);
void lintKeys(const std::vector<View>& views, const Scale& scale, Findings& findings);

}  // namespace brimol::test
