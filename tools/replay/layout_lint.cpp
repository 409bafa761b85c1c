#include "layout_lint.h"

#include <algorithm>
#include <cstdlib>

namespace brimol::replay {

namespace {

using test::Moment;
using Kind = Happening::Kind;
using Entry = std::vector<Happening>::const_iterator;

constexpr int64_t kRestMs = 100;
constexpr int kTapPixels = 20;  // that a finger may move in a tap

// Whether the finger that comes down there goes up close by.
bool isTap(Entry down, Entry end) {
  const auto up = std::find_if(down + 1, end, [](const Happening& one) {
    return one.kind == Kind::Event && (one.input == "up" || one.input == "down");
  });
  return up != end && up->input == "up" && up->touch &&
         std::abs(up->touch->x - down->touch->x) <= kTapPixels &&
         std::abs(up->touch->y - down->touch->y) <= kTapPixels;
}

// What the user does to the newest frame there. Nothing: no input begins there.
std::optional<Moment> momentAt(Entry entry, Entry end, const Frame& frame) {
  if (entry->kind != Kind::Event) return {};
  if (entry->input == "keydown") return Moment{frame.drawn, Moment::Deed::Key};
  if (entry->input != "down" || !entry->touch) return {};
  const auto deed = isTap(entry, end) ? Moment::Deed::Tap : Moment::Deed::None;
  return Moment{frame.drawn, deed, entry->touch->x, entry->touch->y};
}

int64_t endOf(const Session& session, std::size_t frame) {
  return frame + 1 < session.frames.size() ? session.frames[frame + 1].time : session.lastTime;
}

}  // namespace

std::vector<Moment> momentsOf(const Session& session) {
  std::vector<Moment> moments;
  auto entry = session.happenings.begin();
  const auto end = session.happenings.end();
  for (std::size_t i = 0; i < session.frames.size(); ++i) {
    const Frame& frame = session.frames[i];
    const std::size_t before = moments.size();
    for (; entry != end && entry->frames <= i + 1; ++entry) {
      if (entry->frames <= i) continue;
      if (const auto moment = momentAt(entry, end, frame)) moments.push_back(*moment);
    }
    const bool rests = endOf(session, i) - frame.time >= kRestMs;
    if (rests && moments.size() == before) moments.push_back({frame.drawn});
  }
  return moments;
}

test::Profile profileOf(const Session& session) {
  const SessionStart start = session.start.value_or(SessionStart());
  test::Profile profile{{}, {start.width, start.height}, start.density};
  const auto device = start.environment.find("BRIMOL_DEVICE");
  const bool isNamed = device != start.environment.end() && !device->second.empty();
  profile.name =
      isNamed ? device->second : std::to_string(start.width) + "x" + std::to_string(start.height);
  return profile;
}

Judgement judgeLayout(const Judgement& judgement, const Session& session,
                      const test::AcceptedFindings& accepted) {
  if (judgement.verdict != Verdict::Passed) return judgement;
  const std::vector<Moment> moments = momentsOf(session);
  const test::Profile profile = profileOf(session);
  const bool isListed =
      std::ranges::any_of(moments, [](const Moment& one) { return !one.frame.empty(); });
  if (!isListed || !(profile.dpi > 0)) {
    return {
        Verdict::Unusable, "The layout cannot be looked at.",
        "The session lists no items or no density: is the application's platform an older one?"};
  }
  const auto wrong = accepted.judge(test::lint(moments, profile), profile);
  if (wrong.empty()) return judgement;
  Judgement worse{Verdict::Failed, "The layout has " + std::to_string(wrong.size()) +
                                       (wrong.size() == 1 ? " fault." : " faults.")};
  for (const std::string& line : wrong) worse.detail += (worse.detail.empty() ? "" : "\n") + line;
  return worse;
}

}  // namespace brimol::replay
