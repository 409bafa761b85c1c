#include "report_data.h"

#include <algorithm>
#include <array>
#include <nlohmann/json.hpp>

#include "album.h"

namespace brimol::replay {

namespace {

using nlohmann::json;
using Kind = Happening::Kind;
using Weight = Happening::Weight;

constexpr std::size_t kMostTextBytes = 4000;        // of one text on the page
constexpr std::size_t kMostDescriptionBytes = 300;  // of a picture

constexpr const char* nameOf(Kind kind) {
  switch (kind) {
    case Kind::Step: return "step";
    case Kind::Event: return "event";
    case Kind::Log: return "log";
    case Kind::Expectation: return "check";
    case Kind::Shot: return "shot";
    case Kind::World: return "world";
    case Kind::Error: return "error";
    default: return "blocked";
  }
}

constexpr const char* nameOf(FramePair::Kind kind) {
  switch (kind) {
    case FramePair::Kind::Same: return "same";
    case FramePair::Kind::Moved: return "moved";
    case FramePair::Kind::Differs: return "differs";
    case FramePair::Kind::OnlyHere: return "only here";
    default: return "only there";
  }
}

std::string cut(std::string text, std::size_t most) {
  if (text.size() <= most) return text;
  constexpr unsigned char kContinues = 0x80;  // a byte that goes on with a character
  constexpr unsigned char kMask = 0xC0;
  while (most > 0 && (static_cast<unsigned char>(text[most]) & kMask) == kContinues) --most;
  return text.substr(0, most) + "…";
}

// What a picture shows, for those who do not see it.
std::string describe(const Frame& frame) {
  std::string texts;
  for (const std::string& text : frame.texts) {
    if (!texts.empty()) texts += " · ";
    texts += text;
    if (texts.size() > kMostDescriptionBytes) break;
  }
  return cut(std::move(texts), kMostDescriptionBytes);
}

// Below the trace's folder a file is named from there.
std::string placeText(const Place& place, const std::filesystem::path& traces) {
  const std::string folder = traces.native() + "/";
  const std::string text = place.text();
  return !traces.empty() && text.starts_with(folder) ? text.substr(folder.size()) : text;
}

json entryOf(const Happening& happening, const std::filesystem::path& traces) {
  json entry = {{"kind", happening.isDetail ? "debug" : nameOf(happening.kind)},
                {"time", happening.time},
                {"text", cut(happening.text, kMostTextBytes)}};
  if (!happening.place.file.empty()) entry["where"] = placeText(happening.place, traces);
  if (!happening.why.empty()) entry["why"] = cut(happening.why, kMostTextBytes);
  if (happening.kind == Kind::Expectation) entry["passed"] = happening.passed;
  if (happening.weight == Weight::Warning) entry["weight"] = "warning";
  if (happening.weight == Weight::Failure) entry["weight"] = "failure";
  if (happening.input == "down" && happening.touch) {
    entry["touch"] = {happening.touch->x, happening.touch->y};
  }
  return entry;
}

bool isMotion(const Happening& one) { return one.kind == Kind::Event && one.input == "motion"; }

bool isFailure(const Happening& one) {
  const bool isKind = one.kind == Kind::Error || one.kind == Kind::Expectation;
  return isKind && one.weight == Weight::Failure;
}

/// The entries of each frame; those at 0 came before the first one.
class Entries {
 public:
  explicit Entries(const ReportInput& input)
      : ofFrames(input.run.session.frames.size() + 1, json::array()), traces(input.traces) {
    for (const Happening& happening : input.run.session.happenings) add(happening);
  }

  json& of(std::size_t frames) { return ofFrames[frames]; }
  /// What ended the session, where no line of it tells.
  void addEnd(int64_t time, const Judgement& judgement) {
    json entry = {{"kind", "error"}, {"time", time}, {"text", judgement.headline}};
    entry["weight"] = "failure";
    ofFrames.back().push_back(std::move(entry));
  }
  std::size_t leftOut = 0;

 private:
  void add(const Happening& happening) {
    json& list = ofFrames[std::min(happening.frames, ofFrames.size() - 1)];
    json entry = entryOf(happening, traces);
    // A movement is one line, however many records it has.
    if (isMotion(happening) && !list.empty() && list.back().contains("motions")) {
      json& movement = list.back();
      movement["text"] = happening.text;
      movement["motions"] = movement["motions"].get<int>() + 1;
      return;
    }
    const bool repeatsStep = happening.kind == Kind::Expectation && !list.empty() &&
                             list.back()["kind"] == nameOf(Kind::Step) &&
                             list.back().value("where", "") == entry.value("where", "");
    if (repeatsStep) list.erase(list.size() - 1);
    if (count >= kMostHappenings && !isFailure(happening)) {
      ++leftOut;
      return;
    }
    ++count;
    list.push_back(std::move(entry));
    if (isMotion(happening)) list.back()["motions"] = 1;
  }

  std::vector<json> ofFrames;
  const std::filesystem::path& traces;
  std::size_t count = 0;
};

std::string secondsText(double ms) {
  constexpr double kSecond = 1000;
  std::array<char, 32> text{};
  std::snprintf(text.data(), text.size(), "%.2f s", ms / kSecond);
  return text.data();
}

std::string counted(std::ptrdiff_t count, const std::string& what) {
  return std::to_string(count) + " " + what + (count == 1 ? "" : "s");
}

auto countOf(const Session& session, auto isWanted) {
  return std::ranges::count_if(session.happenings, isWanted);
}

std::string checksText(const Session& session) {
  const auto all =
      countOf(session, [](const Happening& one) { return one.kind == Kind::Expectation; });
  const auto failed = countOf(session, [](const Happening& one) { return !one.passed; });
  if (all == 0) return "none";
  const std::string passed = std::to_string(all - failed) + " passed";
  return failed == 0 ? passed : passed + ", " + std::to_string(failed) + " failed";
}

std::string logText(const Session& session) {
  const auto isLog = [](const Happening& one) { return one.kind == Kind::Log; };
  const auto heavy = countOf(
      session, [&](const Happening& one) { return isLog(one) && one.weight != Weight::Plain; });
  const std::string lines = counted(countOf(session, isLog), "line");
  return heavy == 0 ? lines : lines + ", " + counted(heavy, "warning");
}

json factsOf(const ReportInput& input) {
  const Session& session = input.run.session;
  const auto isEvent = [](const Happening& one) { return one.kind == Kind::Event; };
  json facts = json::array();
  const auto add = [&](const char* name, const std::string& value) {
    facts.push_back({name, value});
  };
  add("Expectations", checksText(session));
  add("Frames", std::to_string(session.frames.size()));
  add("Input events", std::to_string(countOf(session, isEvent)));
  add("Log", logText(session));
  add("Session time", secondsText(static_cast<double>(session.lastTime)));
  add("Real time", secondsText(static_cast<double>(input.end.realTime.count())));
  return facts;
}

json aboutOf(const ReportInput& input) {
  json about = json::array();
  for (const auto& [name, value] : input.about) about.push_back({name, value});
  if (!input.run.session.start) return about;
  const SessionStart& start = *input.run.session.start;
  const std::string size = std::to_string(start.width) + " × " + std::to_string(start.height);
  for (const auto& [name, value] : {std::pair<const char*, std::string>{"Toolkit", start.version},
                                    {"Screen", size},
                                    {"Display", start.display},
                                    {"Clock", start.clock},
                                    {"Began", start.utc}}) {
    if (!value.empty()) about.push_back({name, value});
  }
  for (const auto& [name, value] : start.environment) about.push_back({name, value});
  return about;
}

std::optional<std::size_t> addPicture(const PlayedRun& run, const std::string& name, Album& album) {
  const auto file = fileOf(run.folder, name);
  return file ? album.addFile(*file) : std::nullopt;
}

json placeIn(const std::optional<std::size_t>& picture) {
  return picture ? json(*picture) : json(nullptr);
}

json failuresOf(const ReportInput& input, Album& album) {
  const PlayedRun& run = input.run;
  json failures = json::array();
  for (const Happening& happening : run.session.happenings) {
    if (!isFailure(happening)) continue;
    json failure = entryOf(happening, input.traces);
    const std::size_t frames = std::min(happening.frames, run.session.frames.size());
    if (frames > 0) {
      failure["frame"] = frames - 1;
      addPicture(run, run.session.frames[frames - 1].picture, album);
    }
    failures.push_back(std::move(failure));
  }
  const auto atEnd = addPicture(run, "failed.png", album);
  if (!failures.empty() && atEnd) failures.back()["picture"] = *atEnd;
  return failures;
}

// The first and the last of them, when there are too many.
json framesOf(const PlayedRun& run, Entries& entries, Album& album) {
  const std::vector<Frame>& frames = run.session.frames;
  if (!frames.empty()) addPicture(run, frames.back().picture, album);
  json list = json::array();
  for (std::size_t i = 0; i < frames.size(); ++i) {
    const bool isLeftOut =
        frames.size() > kMostFrames && i >= kMostFrames / 2 && i < frames.size() - kMostFrames / 2;
    if (isLeftOut) continue;
    const Frame& frame = frames[i];
    list.push_back({{"index", i},
                    {"number", frame.number},
                    {"time", frame.time},
                    {"hash", frame.hash},
                    {"items", frame.items},
                    {"paint", frame.paintMs},
                    {"shows", describe(frame)},
                    {"picture", placeIn(addPicture(run, frame.picture, album))},
                    {"entries", std::move(entries.of(i + 1))}});
  }
  return list;
}

json pairOf(const ReportInput& input, const FramePair& pair, Album& album) {
  json entry = {{"kind", nameOf(pair.kind)}, {"pixels", pair.pixels}};
  const auto addSide = [&](const char* name, const PlayedRun& run, std::size_t index) {
    if (index == FramePair::kNone) return;
    const Frame& frame = run.session.frames[index];
    entry[name] = {{"number", frame.number},
                   {"time", frame.time},
                   {"shows", describe(frame)},
                   {"picture", placeIn(addPicture(run, frame.picture, album))}};
  };
  addSide("here", input.run, pair.here);
  addSide("there", *input.other, pair.there);
  if (!pair.picture.empty()) entry["picture"] = placeIn(album.addPng(pair.picture));
  return entry;
}

json comparisonOf(const ReportInput& input, Album& album) {
  if (input.comparison == nullptr) return nullptr;
  json pairs = json::array();
  for (const FramePair& pair : input.comparison->pairs) {
    if (!pair.isDifferent()) continue;
    if (pairs.size() == kMostPairs) break;
    pairs.push_back(pairOf(input, pair, album));
  }
  return {{"with", input.other->folder.native()},
          {"frames", input.comparison->pairs.size()},
          {"differences", input.comparison->differences},
          {"pairs", std::move(pairs)}};
}

// What the page does not show, and what could not be read.
json notesOf(const ReportInput& input, const Album& album, std::size_t leftOut) {
  const Session& session = input.run.session;
  json notes = json::array();
  if (session.damaged > 0) {
    notes.push_back("session.jsonl could not be read in full: " + counted(session.damaged, "line") +
                    " damaged, the first is line " + std::to_string(session.firstDamaged) + ".");
  }
  if (session.unknown > 0) {
    notes.push_back(counted(session.unknown, "line") +
                    " of kinds that this program does not know.");
  }
  if (session.frames.size() > kMostFrames) {
    notes.push_back("Of " + counted(std::ssize(session.frames), "frame") + " the first and last " +
                    std::to_string(kMostFrames / 2) + " are shown.");
  }
  if (leftOut > 0) {
    notes.push_back(counted(static_cast<std::ptrdiff_t>(leftOut), "line") +
                    " of what happened are in session.jsonl alone.");
  }
  if (album.withoutFull() > 0) {
    notes.push_back(counted(static_cast<std::ptrdiff_t>(album.withoutFull()), "picture") +
                    " in full size are files beside the session alone.");
  }
  if (input.output.size() > kMostOutputBytes) {
    notes.push_back("Of the application's output the end is shown.");
  }
  return notes;
}

bool endsWithoutFailure(const ReportInput& input) {
  return input.judgement.verdict != Verdict::Passed && !input.run.session.end;
}

json timesOf(const ReportInput& input) {
  const Session& session = input.run.session;
  json frames = json::array();
  json events = json::array();
  json passed = json::array();
  json failed = json::array();
  for (const Frame& frame : session.frames) frames.push_back(frame.time);
  for (const Happening& one : session.happenings) {
    if (one.kind == Kind::Event) events.push_back(one.time);
    if (one.kind == Kind::Expectation && one.passed) passed.push_back(one.time);
    if (isFailure(one)) failed.push_back(one.time);
  }
  if (endsWithoutFailure(input)) failed.push_back(session.lastTime);
  return {{"frames", frames}, {"input", events}, {"passed", passed}, {"failed", failed}};
}

// Of many pictures the thumbnails are small, so that there is room for more of them.
Album::Bounds boundsFor(std::size_t frames) {
  constexpr std::size_t kMany = 400;
  Album::Bounds bounds;
  if (frames > kMany) bounds.thumbWidth /= 2;
  return bounds;
}

json screenOf(const Session& session) {
  return session.start ? json{session.start->width, session.start->height} : json{0, 0};
}

}  // namespace

json reportData(const ReportInput& input) {
  const Session& session = input.run.session;
  Album album(input.page, boundsFor(session.frames.size()));
  Entries entries(input);
  if (endsWithoutFailure(input)) entries.addEnd(session.lastTime, input.judgement);
  json data = {{"verdict", verdictName(input.judgement.verdict)},
               {"headline", input.judgement.headline},
               {"detail", cut(input.judgement.detail, kMostTextBytes)},
               {"where", placeText(input.judgement.place, input.traces)},
               {"facts", factsOf(input)},
               {"about", aboutOf(input)},
               {"duration", session.lastTime},
               {"screen", screenOf(session)},
               {"times", timesOf(input)}};
  data["failures"] = failuresOf(input, album);
  data["comparison"] = comparisonOf(input, album);
  data["before"] = std::move(entries.of(0));
  data["frames"] = framesOf(input.run, entries, album);
  data["notes"] = notesOf(input, album, entries.leftOut);
  data["pictures"] = album.json();
  const std::size_t skipped = input.output.size() - std::min(input.output.size(), kMostOutputBytes);
  data["output"] = input.output.substr(skipped);
  return data;
}

}  // namespace brimol::replay
