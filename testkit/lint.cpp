#include <brimol3_widget_test/lint.h>

#include <algorithm>
#include <array>
#include <fstream>
#include <sstream>
#include <stdexcept>

#include "lint_view.h"
#include "scene/quoted_text.h"
#include "text_pattern.h"

namespace brimol::test {

namespace {

struct CheckRow {
  Check check;
  const char* name;
};
constexpr auto kChecks = std::to_array<CheckRow>({
    {Check::Cut, "cut"},
    {Check::Overlap, "overlap"},
    {Check::OffScreen, "off-screen"},
    {Check::AtEdge, "at-edge"},
    {Check::SmallText, "small-text"},
    {Check::Contrast, "contrast"},
    {Check::SmallTarget, "small-target"},
    {Check::NoKey, "no-key"},
});

std::vector<std::string> splitAtCommas(const std::string& names) {
  std::istringstream in(names);
  std::vector<std::string> parts;
  for (std::string part; std::getline(in, part, ',');) parts.push_back(part);
  return parts;
}

// The next text between double quotes, its escapes kept as patterns want them. False: there is
// none.
bool readQuoted(std::istringstream& in, std::string& text) {
  in >> std::ws;
  if (in.get() != '"') return false;
  text.clear();
  for (char letter = 0; in.get(letter) && letter != '"';) {
    if (letter == '\\' && in.peek() == '"') in.get(letter);
    text += letter;
  }
  return in.good();
}

}  // namespace

const char* nameOf(Check check) {
  return std::ranges::find(kChecks, check, &CheckRow::check)->name;
}

std::string textOf(const Finding& finding, const Profile& profile) {
  return profile.name + ": " + nameOf(finding.check) + ": " + pc::inQuotes(finding.item) + " on " +
         pc::inQuotes(finding.page) + ": " + finding.detail;
}

std::vector<Finding> lint(const std::vector<Moment>& moments, const Profile& profile) {
  if (!(profile.dpi > 0)) throw std::invalid_argument("a profile without a density");
  const Scale scale(profile);
  pc::TextPainter painter;
  std::vector<View> views;
  views.reserve(moments.size());
  Findings findings;
  for (std::size_t i = 0; i < moments.size(); ++i) {
    views.push_back(viewOf(moments, i, scale.screen, painter));
    lintTexts(views.back(), scale, findings);
    lintTargets(views.back(), scale, findings);
  }
  lintKeys(views, scale, findings);
  return findings.taken();
}

AcceptedFindings::AcceptedFindings(const std::filesystem::path& file) {
  std::ifstream in(file);
  if (!in) throw std::runtime_error(file.native() + ": cannot be read");
  int number = 0;
  for (std::string line; std::getline(in, line);) {
    const std::string place = file.native() + ":" + std::to_string(++number);
    const bool isEntry = !line.empty() && line.front() != '#';
    if (isEntry) addLine(line, place);
  }
}

void AcceptedFindings::addLine(const std::string& line, const std::string& place) {
  std::istringstream in(line);
  std::string check;
  std::string profiles;
  in >> check >> profiles;
  const auto* const row = std::ranges::find(kChecks, check, &CheckRow::name);
  if (row == kChecks.end()) throw std::runtime_error(place + ": no such check: " + check);
  Entry entry{place, row->check, {}, {}, {}};
  if (profiles != "*") entry.profiles = splitAtCommas(profiles);
  std::string reason;
  const bool isWhole = readQuoted(in, entry.item) && readQuoted(in, entry.page) && in >> reason;
  if (!isWhole) {
    throw std::runtime_error(place + R"(: wanted CHECK PROFILES "ITEM" "PAGE" REASON)");
  }
  entries.push_back(std::move(entry));
}

bool AcceptedFindings::Entry::isFor(const Profile& profile) const {
  return profiles.empty() || std::ranges::count(profiles, profile.name) > 0;
}

bool AcceptedFindings::Entry::fits(const Finding& finding) const {
  return check == finding.check && patternOf(item).matches(finding.item) &&
         patternOf(page).matches(finding.page);
}

std::vector<std::string> AcceptedFindings::judge(const std::vector<Finding>& findings,
                                                 const Profile& profile) const {
  std::vector<std::string> wrong;
  for (const Finding& finding : findings) {
    const bool isAccepted = std::ranges::any_of(
        entries, [&](const Entry& entry) { return entry.isFor(profile) && entry.fits(finding); });
    if (!isAccepted) wrong.push_back(textOf(finding, profile));
  }
  for (const Entry& entry : entries) {
    const auto fits = [&entry](const Finding& finding) { return entry.fits(finding); };
    if (!entry.isFor(profile) || std::ranges::any_of(findings, fits)) continue;
    wrong.push_back(entry.place + ": accepted, but not found on " + profile.name);
  }
  return wrong;
}

}  // namespace brimol::test
