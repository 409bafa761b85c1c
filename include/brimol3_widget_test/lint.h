/// Layout lint: what makes a screen hard to read or to use, found in its display items.
///
///     screen.key(MW::kKeyDown);
///     brimol::test::expectLayout(screen, {"my phone", screen.size(), 401});
///
/// All lengths are judged in millimetres, by the screen's density.
#pragma once

#include <brimol3_widget_test/failure.h>
#include <brimol3_widget_test/picture.h>

#include <cstddef>
#include <filesystem>
#include <optional>
#include <string>
#include <vector>

namespace brimol::test {

class Screen;

/// A screen that is looked at.
struct Profile {
  std::string name;  ///< for the findings
  ScreenSize size;   ///< pixels
  float dpi;         ///< dots per inch, more than 0
};

/// A frame at rest, and what the user did to it next.
struct Moment {
  /// What a user can do.
  enum class Deed { None, Tap, Key };

  Frame frame = {};        ///< what was on the screen
  Deed deed = Deed::None;  ///< what came then
  int x = 0;               ///< of a tap, in pixels
  int y = 0;               ///< the same
};

/// What a screen is looked at for.
enum class Check {
  Cut,          ///< a text is wider than its item, or has lines that find no room
  Overlap,      ///< two texts touch, or a box hides a part of a text
  OffScreen,    ///< a text or a touch target is not whole on the screen
  AtEdge,       ///< a text is within 0.5 mm of the screen's left or right edge
  SmallText,    ///< letters of a font under 1.5 mm
  Contrast,     ///< text and ground differ by less than 3 to 1
  SmallTarget,  ///< a touch target under 7 mm in width or height
  NoKey         ///< no key reaches a touch target
};

/// The check's name in findings: "cut", "overlap", "off-screen", "at-edge", "small-text",
/// "contrast", "small-target", "no-key".
const char* nameOf(Check check);

/// What is wrong with one item.
struct Finding {
  Check check;         ///< which rule it breaks
  std::string item;    ///< its text, or its kind and rectangle where it shows none
  std::string page;    ///< the text that stands highest on the screen; empty: there is none
  std::string detail;  ///< what is wrong, in words
  std::size_t moment;  ///< the first in which it was found
};

/// "PROFILE: CHECK: "ITEM" on "PAGE": DETAIL".
std::string textOf(const Finding& finding, const Profile& profile);

/// The findings in a session's moments, each once, in the order in which they came.
///
/// Texts and targets that a box drawn later covers in their middle are not looked at, as what lies
/// below a dialog. A text or target that stands whole at another place in another moment was
/// scrolled, and is no finding of OffScreen or Overlap.
///
/// A touch target is an item of the kinds that buttons draw (SKIA_BUTTONBOX, SKIA_ROUNDBUTTONBOX),
/// or the topmost item under a tap, if it fills less than half of the screen. What nobody tapped
/// and is no button is not known to be one. What keys reach is known from the session alone: keys
/// reach a target if a key changed what is drawn on or around it (a mark, another colour), or led
/// to the texts to which a tap on it led. Pages on which no key was pressed give no findings of
/// NoKey.
std::vector<Finding> lint(const std::vector<Moment>& moments, const Profile& profile);

/// A list of findings that are accepted, each with its reason. Blank lines, and lines that begin
/// with `#`, are skipped; any other is
///
///     CHECK PROFILES "ITEM" "PAGE" REASON
///
/// PROFILES are names with commas between them, or `*` for all; in the texts a `*` stands for any
/// characters.
class AcceptedFindings {
 public:
  /// Accepts nothing.
  AcceptedFindings() = default;
  /// Throws std::runtime_error with "FILE:LINE: " and what is wrong with it.
  explicit AcceptedFindings(const std::filesystem::path& file);

  /// What is wrong, a line each: the findings that are not accepted, and the entries for this
  /// profile that accept nothing.
  std::vector<std::string> judge(const std::vector<Finding>& findings,
                                 const Profile& profile) const;

 private:
  struct Entry {
    std::string place;  // FILE:LINE
    Check check;
    std::vector<std::string> profiles;  // empty: all
    std::string item, page;

    bool isFor(const Profile& profile) const;
    bool fits(const Finding& finding) const;
  };
  void addLine(const std::string& line, const std::string& place);

  std::vector<Entry> entries;
};

/// Throws Failure with the lines of judge() for all that was seen of a screen: each frame that was
/// there when a finger or a key came down, and the newest.
void expectLayout(const Screen& screen, const Profile& profile,
                  const AcceptedFindings& accepted = {}, const Here& here = Here::now());

}  // namespace brimol::test
