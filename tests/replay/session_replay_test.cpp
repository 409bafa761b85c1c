// Sessions of the example application: the same trace is the same session, whatever the machine
// does meanwhile; and what a real user did in a real window comes out again without one.
#include <gtest/gtest.h>
#include <unistd.h>

#include <cstdlib>
#include <fstream>
#include <nlohmann/json.hpp>
#include <optional>

#include "program.h"
#include "support/eventually.h"

namespace brimol::test {
namespace {

namespace fs = std::filesystem;

constexpr int kQuietRounds = 2;
constexpr int kNotAllPassed = 4;  // the exit code of a factory test that was left early

class SessionReplay : public testing::Test {
 protected:
  SessionReplay() { fs::create_directories(folder); }
  ~SessionReplay() override {
    if (!HasFailure()) fs::remove_all(folder);
  }

  /// Plays a trace without a window, in `variables` too; its results stand in the folder.
  int play(const std::string& trace, Variables variables = {}) const {
    variables.insert({{"BRIMOL_TRACE", trace}, {"BRIMOL_DISPLAY", "headless"}});
    fs::remove(results);
    return Program(folder, variables, {"--results", results}).waitForEnd();
  }
  /// The session's lines, without what real time says in them.
  static std::string session(const fs::path& kept) {
    std::ifstream in(kept / "session.jsonl");
    std::string lines;
    for (std::string line; std::getline(in, line);) {
      nlohmann::ordered_json object = nlohmann::ordered_json::parse(line);
      if (object["kind"] == "start") continue;
      object.erase("paint_us");
      lines += object.dump() + '\n';
    }
    return lines;
  }
  std::string writeTrace(const std::string& lines) const {
    std::ofstream(folder / "written.trace") << "brimol-trace 1\n" << lines;
    return folder / "written.trace";
  }

  const fs::path folder =
      fs::path(testing::TempDir()) / ("session_replay." + std::to_string(::getpid()));
  const std::string results = folder / "results.json";
  const std::string report = folder / "report";
};

TEST_F(SessionReplay, IsTheSameTenMinutesEveryTime) {
  std::string first;
  std::string firstResults;
  for (int round = 0; round < kQuietRounds + 1; ++round) {
    std::optional<BusyCore> busy;
    if (round >= kQuietRounds - 1) busy.emplace();
    ASSERT_EQ(play(TRACES "ten_minutes.trace",
                   {{"BRIMOL_REPORT_DIR", report}, {"BRIMOL_REPORT_PICTURES", "none"}}),
              kNotAllPassed)
        << readAll(folder / "stderr");
    const std::string lines = session(report);
    if (round == 0) first = lines;
    if (round == 0) firstResults = readAll(results);
    EXPECT_NE(lines.find("\"kind\":\"log\""), std::string::npos);
    EXPECT_TRUE(lines == first) << "session " << round << " differs";
    EXPECT_EQ(readAll(results), firstResults);
  }
  EXPECT_NE(firstResults.find("2026-01-01T00:"), std::string::npos) << firstResults;
}

TEST_F(SessionReplay, WritesNoPictureThroughALink) {
  fs::create_directories(report);
  fs::create_symlink(folder, report + "/link");
  EXPECT_EQ(play(writeTrace("shot link/x.png\n"), {{"BRIMOL_REPORT_DIR", report}}), 1);
  EXPECT_NE(readAll(folder / "stderr").find("is outside of the folder"), std::string::npos);
  EXPECT_FALSE(fs::exists(folder / "x.png"));

  std::ofstream(folder / "kept") << "kept";
  for (const char* const name : {"failed.png", "failed.items.txt"}) {
    fs::remove(fs::path(report) / name);
    fs::create_symlink(folder / "kept", fs::path(report) / name);
  }
  EXPECT_EQ(
      play(writeTrace("expect text \"Nowhere\" within 10\n"), {{"BRIMOL_REPORT_DIR", report}}), 1);
  EXPECT_EQ(readAll(folder / "kept"), "kept");
  EXPECT_NE(readAll(fs::path(report) / "failed.items.txt"), "kept");
}

TEST_F(SessionReplay, RecordsNothingWhereNoScreenOpens) {
  std::ofstream(folder / "kept") << "kept";
  for (const char* const name : {"kept", "new"}) {
    const Variables variables = {{"BRIMOL_RECORD", name},
                                 {"BRIMOL_DISPLAY", "browser"},
                                 {"BRIMOL_LISTEN", "192.0.2.1:0"}};  // no machine's address
    EXPECT_EQ(Program(folder, variables, {}).waitForEnd(), 1);
    EXPECT_NE(readAll(folder / "stderr").find("cannot listen"), std::string::npos);
  }
  EXPECT_EQ(readAll(folder / "kept"), "kept");
  for (const char* const name : {"kept.part", "new", "new.part"}) {
    EXPECT_FALSE(fs::exists(folder / name)) << name;
  }
}

TEST_F(SessionReplay, PaintsTheSamePictures) {
  const fs::path other = folder / "other";
  const std::string trace =
      writeTrace("screen 720x1280\ndensity 312.5\ninclude " TRACES "minute.trace\n");
  const std::pair<std::string, std::string> root = {"BRIMOL_TRACE_ROOT", TRACES};
  ASSERT_EQ(play(trace, {{"BRIMOL_REPORT_DIR", report}, root}), kNotAllPassed)
      << readAll(folder / "stderr");
  const BusyCore busy;
  ASSERT_EQ(play(trace, {{"BRIMOL_REPORT_DIR", other}, root}), kNotAllPassed);
  int pictures = 0;
  for (const auto& entry : fs::directory_iterator(report)) {
    if (entry.path().extension() != ".png") continue;
    ++pictures;
    EXPECT_TRUE(readAll(entry.path()) == readAll(other / entry.path().filename())) << entry.path();
  }
  EXPECT_GT(pictures, 20);
}

void act(const std::string& actions) {
  EXPECT_EQ(std::system(("xdotool " + actions).c_str()), 0) << actions;
}

bool comesToHold(const fs::path& file, const std::string& text) {
  return eventually([&] { return readAll(file).find(text) != std::string::npos; });
}

/// Where a point of a window of 720 x 1280 is that stands at the middle of the desktop.
std::string at(int x, int y) {
  return "mousemove " + std::to_string(40 + x) + ' ' + std::to_string(60 + y) + ' ';
}

/// Fails the test of touches by mouse, and looks at the screen before each act.
void failTheTouchTest(const fs::path& trace, const fs::path& results) {
  act(at(360, 840) + "click 1");
  EXPECT_TRUE(comesToHold(trace, "\"Touch and drag"));
  act(at(160, 600) + "mousedown 1");
  EXPECT_TRUE(comesToHold(trace, " long 0 "));
  act("mouseup 1");
  EXPECT_TRUE(comesToHold(trace, "\"FAIL\""));
  EXPECT_TRUE(eventually([&] {  // it takes no press at first
    act(at(600, 1156) + "click 1 sleep 0.3");
    return readAll(results).find("\"verdict\"") != std::string::npos;
  }));
}

std::size_t timesIn(const fs::path& file, const std::string& text) {
  const std::string all = readAll(file);
  std::size_t times = 0;
  for (auto at = all.find(text); at != std::string::npos; at = all.find(text, at + 1)) ++times;
  return times;
}

/// Acts, and looks at nothing but whether the application got it, `count` records of a kind, or
/// has ended.
void actBlindly(const fs::path& trace, const std::string& actions, const std::string& record,
                std::size_t count) {
  const std::size_t before = timesIn(trace, record);
  act(actions);
  const auto isTaken = [&] {
    return timesIn(trace, record) >= before + count || timesIn(trace, " end\n") > 0;
  };
  EXPECT_TRUE(eventually(isTaken)) << actions;
}

void useTheMenu(const fs::path& trace) {
  actBlindly(trace, at(500, 400) + "click 1 click 1", " up 0 ", 2);
  actBlindly(trace, at(124, 1156) + "click 1", " up 0 ", 1);
  std::string drag = at(300, 900) + "mousedown 1 ";
  for (int y = 890; y > 600; y -= 20) drag += at(300, y);
  actBlindly(trace, drag + "mouseup 1", " up 0 ", 1);
  actBlindly(trace, "key Down Return", " keyup ", 2);
  actBlindly(trace, "key Up Left Escape Escape", " keyup ", 4);
}

TEST_F(SessionReplay, PlaysWhatAUserDidInAWindow) {
  const std::string trace = folder / "user.trace";
  {
    Program program(
        folder,
        {{"BRIMOL_RECORD", trace}, {"BRIMOL_DISPLAY", "window"}, {"BRIMOL_DEVICE", "hd-4.7"}},
        {"--results", results});
    ASSERT_TRUE(comesToHold(trace, " frame "));
    act("search --sync --onlyvisible --name brimol");
    failTheTouchTest(trace, results);
    useTheMenu(trace);
    // A user who takes time: no frame shows from when on a question takes its answer. Three steps
    // back lead from a page to the question whether to leave, and from any other screen to a page
    // or out.
    while (program.isRunning()) {
      act("key Escape sleep 1 key Escape sleep 1 key Escape sleep 1 key Return sleep 1");
    }
    ASSERT_EQ(program.waitForEnd(), kNotAllPassed) << readAll(folder / "stderr");
  }
  const std::string recorded = readAll(results);
  const std::string text = readAll(trace);
  EXPECT_NE(recorded.find("\"verdict\""), std::string::npos) << recorded;
  EXPECT_NE(text.find("\nscreen 720x1280\ndensity 312.5\n"), std::string::npos);
  EXPECT_NE(text.find(" long 0 "), std::string::npos);
  EXPECT_NE(text.find(" end\n"), std::string::npos);
  for (int round = 0; round < 5 * kQuietRounds; ++round) {
    ASSERT_EQ(play(trace), kNotAllPassed) << readAll(folder / "stderr");
    EXPECT_EQ(readAll(results), recorded);
  }
}

TEST_F(SessionReplay, ARecordingOfAKilledSessionIsPlayedUpToThere) {
  const std::string trace = folder / "killed.trace";
  {
    Program program(folder, {{"BRIMOL_RECORD", trace}, {"BRIMOL_DISPLAY", "headless"}}, {});
    ASSERT_TRUE(comesToHold(trace, " frame "));
    program.kill();
  }
  EXPECT_EQ(play(trace), kNotAllPassed) << readAll(folder / "stderr");
  EXPECT_NE(readAll(folder / "stderr").find("the recording has no end"), std::string::npos);
}

TEST_F(SessionReplay, EndsWithTheReasonOfAFailure) {
  EXPECT_EQ(play(writeTrace("wait 5\nexpect text \"Nowhere\" within 10\n"),
                 {{"BRIMOL_REPORT_DIR", report}}),
            1);
  const std::string errors = readAll(folder / "stderr");
  EXPECT_NE(errors.find("written.trace:3: expect text \"Nowhere\" within 10: not shown"),
            std::string::npos)
      << errors;
  EXPECT_NE(errors.find("Factory test"), std::string::npos) << errors;
  EXPECT_NE(readAll(fs::path(report) / "failed.items.txt"), "");
  EXPECT_TRUE(fs::exists(fs::path(report) / "failed.png"));
  EXPECT_NE(errors.find("Kept as " + report + "/failed.png\n"), std::string::npos) << errors;
  EXPECT_NE(session(report).find("\"exit\":1,\"reason\":\"failed\""), std::string::npos);

  EXPECT_EQ(play(writeTrace("dance\n"), {{"BRIMOL_REPORT_DIR", report}}), 2);
  EXPECT_NE(session(report).find("written.trace\",\"line\":2"), std::string::npos);
  EXPECT_EQ(readAll(folder / "stderr"), writeTrace("") + ":2: unknown step 'dance'\n");
  EXPECT_EQ(play(folder / "gone.trace"), 2);
  EXPECT_EQ(play(writeTrace("screen 10x10\n"), {{"BRIMOL_SCREEN", "20x20"}}), 2);
  EXPECT_EQ(play(writeTrace("key back\nwait 800\nkey select\nwait 5000\n")), 1);
  EXPECT_NE(readAll(folder / "stderr").find("ended before this step"), std::string::npos);
}

}  // namespace
}  // namespace brimol::test
