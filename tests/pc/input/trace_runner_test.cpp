#include "input/trace_runner.h"

#include <gtest/gtest.h>

#include <map>

#include "input/trace_parser.h"
#include "input/trace_recorder.h"
#include "pc/support/painting.h"
#include "scene/item_text.h"

namespace brimol::pc {
namespace {

constexpr Size kScreen = {200, 300};

SKIA_Item button(const char* text, SKIA_Rect area) {
  return textItem(SKIA_BUTTONBOX, area, textOf(text, 12, kBlue, SKIA_ALIGN_CENTRE));
}

// Two buttons of one name, one of another, one below a veil, and one outside of the screen.
const Frame kScene = {
    button("Same", {0, 0, 50, 20, kRed}),      button(" Same ", {0, 30, 50, 20, kRed}),
    button("Below", {100, 200, 50, 50, kRed}), boxItem({90, 190, 110, 110, 0x80000000}),
    button("PASS", {20, 100, 40, 20, kRed}),   button("PASS", {20, 100, 40, 20, kBlue}),
    button("Out", {200, 0, 50, 50, kRed})};

/// Plays a trace on a stage that keeps what happens to it, as one line: "100:down 0 40 110 ".
class Played {
 public:
  explicit Played(const std::string& lines)
      : parsed(parseTrace("main", [&](const std::string&) { return "brimol-trace 1\n" + lines; })),
        runner(parsed.trace, stage()) {
    EXPECT_EQ(parsed.error, "");
  }

  void show(const Frame& frame) { runner.seeFrame(now, frame, textOfFrame(frame)); }
  /// Lets the time pass up to `end`, and whatever `at` says happen at its times.
  Played& until(uint64_t end, std::map<uint64_t, std::function<void()>> at = {}) {
    for (; now <= end; ++now) {
      if (const auto due = runner.due(now); due && *due <= now) runner.act(now);
      if (const auto found = at.find(now); found != at.end()) found->second();
    }
    return *this;
  }
  std::string failure() const {
    return runner.failure()
               ? std::string(runner.failure()->line.text) + ": " + runner.failure()->why
               : "";
  }

  uint64_t now = 0;
  std::string journal;
  uint32_t colour = 0x123456;
  ParsedTrace parsed;
  TraceRunner runner;

 private:
  void add(const std::string& what) { journal += std::to_string(now) + ':' + what + ' '; }
  TraceStage stage() {
    return {.screen = kScreen,
            .post = [this](const Event& record) { add(textOfRecord(record)); },
            .close = [this] { add("close"); },
            .pixel = [this](ScreenPoint) { return std::optional(colour); },
            .shoot = [this](const std::string& file) { return add(file), std::string(); },
            .changeWorld = [this](const WorldChange& change) { add(change.value); },
            .begin = [](const TraceLine&) {},
            .judge = [this](const TraceLine&,
                            const std::string& why) { add(why.empty() ? "passed" : "failed"); }};
  }
};

template <typename Row>
std::string nameOf(const testing::TestParamInfo<Row>& row) {
  return row.param.name;
}

struct RunCase {
  const char* name;
  const char* lines;
  const char* journal;
};
class TraceRun : public testing::TestWithParam<RunCase> {};

TEST_P(TraceRun, ActsAtItsTimes) {
  Played played(GetParam().lines);
  played.show(kScene);
  played.until(3000);
  EXPECT_EQ(played.failure(), "");
  EXPECT_EQ(played.journal, GetParam().journal);
}

INSTANTIATE_TEST_SUITE_P(
    Steps, TraceRun,
    testing::Values(
        RunCase{"TapByName", "tap \"PASS\"\ntap 1 2 for 10 finger 3",
                "100:down 0 40 110 150:up 0 40 110 250:down 3 1 2 260:up 3 1 2 360:close "},
        RunCase{"LongPress", "press 50% 1000 finger 2\nwait 600\nrelease finger 2",
                "100:down 2 100 299 600:long 2 100 299 700:up 2 100 299 800:close "},
        RunCase{"NoLongPressOnceMoved", "press 0 0\nmove by 20 5\nwait 600\nrelease",
                "100:down 0 0 0 100:motion 0 20 5 20 5 700:up 0 20 5 800:close "},
        RunCase{
            "Drag", "drag 0 0 to 30 0 over 30",
            "100:down 0 0 0 110:motion 0 10 0 10 0 120:motion 0 20 0 10 0 130:motion 0 30 0 10 0 "
            "130:up 0 30 0 230:close "},
        RunCase{"Keys", "key select\n1000 key down 7\n+5 key up 7\nleave running",
                "100:keydown 327 150:keyup 327 1000:keydown 7 1005:keyup 7 "},
        RunCase{"Linger", "linger 400\nkey down 7", "100:keydown 7 500:close "},
        RunCase{"RawRecords", "5 down 1 3 4\n5 motion 1 5 4 2 0\n6 long 1 5 4\n7 close\n9 end",
                "5:down 1 3 4 5:motion 1 5 4 2 0 6:long 1 5 4 7:close 10:close "},
        RunCase{"Looks",
                "expect text \"PA*\"\nexpect no text \"Below\"\nexpect no text \"Same\" in "
                "100 0 100 300\nexpect pixel 1 2 #123456\nwait 50\nshot a.png",
                "100:passed 100:passed 100:passed 100:passed 150:a.png 150:close "},
        RunCase{"World", "wait 10\nworld figure \"a\" \"v\"", "110:v 110:close "}),
    nameOf<RunCase>);

TEST(TraceRunner, WaitsForWhatItLooksFor) {
  Played played(
      "wait until text \"Late\"\ntap \"Later\"\nexpect log \"b*d\" within 400\nexpect no log "
      "\"b\"");
  const Frame late = {button("Late", {0, 0, 10, 10, kRed})};
  const Frame later = {button("Later", {0, 0, 10, 10, kRed})};
  played.until(3000, {{10, [&] { played.show(kScene); }},
                      {500, [&] { played.show(late); }},
                      {900, [&] { played.show(later); }},
                      {1000, [&] { played.runner.seeLog("T: ab"); }},
                      {1200, [&] { played.runner.seeLog("T: abcd"); }}});
  EXPECT_EQ(played.failure(), "");
  EXPECT_EQ(played.journal,
            "501:passed 901:down 0 5 5 951:up 0 5 5 1201:passed 1201:passed 1201:close ");
}

TEST(TraceRunner, TypesOnTheKeyboardThatItSeesAndNotOnWhatWasTyped) {
  Played played("type \"aB \"");
  const Frame small = {button("a", {0, 0, 10, 10, kRed}), button("b", {20, 0, 10, 10, kRed}),
                       button("shift", {40, 0, 10, 10, kRed}),
                       button("space", {60, 0, 10, 10, kRed})};
  Frame capitals = small;
  SKIA_Item field = button("B", {0, 40, 10, 10, kRed});
  field.kind = SKIA_TEXTBOX;
  capitals.push_back(field);
  capitals[1] = button("B", {20, 0, 10, 10, kRed});
  played.until(3000, {{0, [&] { played.show(small); }}, {220, [&] { played.show(capitals); }}});
  EXPECT_EQ(played.failure(), "");
  EXPECT_EQ(
      played.journal,
      "100:down 0 5 5 150:up 0 5 5 200:down 0 45 5 250:up 0 45 5 300:down 0 25 5 350:up 0 25 5 "
      "400:down 0 65 5 450:up 0 65 5 600:close ");
}

struct FailCase {
  const char* name;
  const char* lines;
  std::vector<const char*> words;
};
class TraceFail : public testing::TestWithParam<FailCase> {};

TEST_P(TraceFail, NamesTheLineAndWhatIsThere) {
  Played played(GetParam().lines);
  played.show(kScene);
  played.until(30'000);
  for (const char* word : GetParam().words) {
    EXPECT_NE(played.failure().find(word), std::string::npos) << word << " in " << played.failure();
  }
}

INSTANTIATE_TEST_SUITE_P(
    Steps, TraceFail,
    testing::Values(
        FailCase{"NothingFits", "tap \"Below\"", {"tap \"Below\": no item", "\"PASS\" at 40 110"}},
        FailCase{"SeveralFit", "tap \"Same\"", {"several", "at 25 10", "at 25 40"}},
        FailCase{"NotShown", "expect text \"Out\"", {"not shown", "\"Same\""}},
        FailCase{"Shown", "expect no text \"PASS\"", {"shown:\n  \"PASS\""}},
        FailCase{"Pixel", "expect pixel 1 2 #654321", {"the pixel is #123456"}},
        FailCase{"Log", "expect log \"a\"", {"no such line was logged"}},
        FailCase{"NotDown", "move 1 2", {"finger 0 is not down"}},
        FailCase{"NoEnd", "wait 1", {"still runs 10 seconds"}}),
    nameOf<FailCase>);

TEST(TraceRunner, ComparesFramesWithTheRecordedOnes) {
  const Frame one = {button("one", {0, 0, 10, 10, kRed})};
  const Frame two = {button("two", {0, 0, 10, 10, kRed})};
  const auto lineOf = [](uint64_t time, const Frame& frame) {
    const std::vector<std::string> items = textOfFrame(frame);
    return std::to_string(time) + " frame " + hashText(hashOf(items)) + " 1\n| 0 " + items[0] +
           "\n";
  };
  const std::string lines = lineOf(5, one) + lineOf(9, two) + "20 end\n";
  const auto failureWith = [&](const std::map<uint64_t, const Frame*>& frames) {
    Played played(lines);
    std::map<uint64_t, std::function<void()>> at;
    for (const auto& [time, frame] : frames)
      at[time] = [&played, shown = frame] { played.show(*shown); };
    return played.until(25, at).failure();
  };
  EXPECT_EQ(failureWith({{5, &one}, {9, &two}}), "");
  const std::string differs = failureWith({{5, &one}, {9, &one}});
  EXPECT_NE(differs.find("frame 2 differs"), std::string::npos) << differs;
  EXPECT_NE(differs.find("- 0 " + textOfItem(two[0])), std::string::npos) << differs;
  EXPECT_NE(differs.find("+ 0 " + textOfItem(one[0])), std::string::npos) << differs;
  EXPECT_NE(failureWith({{5, &one}, {10, &two}}).find("another time"), std::string::npos);
  EXPECT_NE(failureWith({{5, &one}}).find("frame 2 did not come"), std::string::npos);
}

TEST(TraceRunner, SaysThatTheApplicationEndedTooEarly) {
  Played played("wait 100\nwait 200");
  played.show(kScene);
  played.until(250).runner.seeEnd();
  EXPECT_EQ(played.failure(), "wait 200: the application ended before this step");
}

}  // namespace
}  // namespace brimol::pc
