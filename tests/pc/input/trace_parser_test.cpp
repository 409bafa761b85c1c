#include "input/trace_parser.h"

#include <fcntl.h>
#include <gtest/gtest.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <csignal>
#include <filesystem>
#include <fstream>
#include <map>
#include <random>

#include "input/event_records.h"
#include "input/line_file.h"
#include "input/trace_recorder.h"
#include "input/trace_steps.h"
#include "scene/item_text.h"
#include "scene/quoted_text.h"

namespace brimol::pc {
namespace {

using Files = std::map<std::string, std::string>;

ParsedTrace parse(const Files& files) {
  return parseTrace("t/main.trace", [&](const std::string& path) -> std::optional<std::string> {
    const auto found = files.find(path);
    return found == files.end() ? std::nullopt : std::optional(found->second);
  });
}
ParsedTrace parse(const std::string& text) { return parse(Files{{"t/main.trace", text}}); }
ParsedTrace parseLines(const std::string& lines) { return parse("brimol-trace 1\n" + lines); }

TEST(QuotedText, ComesBackAsItWas) {
  std::string every;
  for (int byte = 0; byte < 256; ++byte) every += static_cast<char>(byte);
  const std::string written = inQuotes(every);
  EXPECT_EQ(written.find('\n'), std::string::npos);
  EXPECT_EQ(unescaped(std::string_view(written).substr(1, written.size() - 2)), every);
  EXPECT_EQ(unescaped("a\\"), std::nullopt);
  EXPECT_EQ(unescaped("\\x4"), std::nullopt);
  EXPECT_EQ(unescaped("\\x4g"), std::nullopt);
  EXPECT_EQ(unescaped("\\q"), std::nullopt);
}

TEST(TextPattern, MatchesWholeTextsAndStars) {
  const auto fits = [](std::vector<std::string> pieces, const char* text) {
    return TextPattern(std::move(pieces)).matches(text);
  };
  EXPECT_TRUE(fits({"PASS"}, "  PASS "));
  EXPECT_FALSE(fits({"PASS"}, "PASSED"));
  EXPECT_TRUE(fits({"Press: ", ""}, "Press: 10"));
  EXPECT_TRUE(fits({"", "b", "b", ""}, "abcbd"));
  EXPECT_FALSE(fits({"", "b", "b", ""}, "abcd"));
  EXPECT_FALSE(fits({"ab", "ba"}, "aba")) << "no byte counts twice";
}

struct WrongLine {
  const char* line;
  const char* why;
};
class TraceParser : public testing::TestWithParam<WrongLine> {};

TEST_P(TraceParser, RefusesALineWithItsNumber) {
  const auto [line, why] = GetParam();
  const std::string error = parseLines(std::string("# first\n\n") + line + "\nwait 1\n").error;
  EXPECT_EQ(error.rfind("t/main.trace:4: ", 0), 0) << error;
  EXPECT_NE(error.find(why), std::string::npos) << error;
}

INSTANTIATE_TEST_SUITE_P(
    Lines, TraceParser,
    testing::Values(
        WrongLine{"dance", "unknown step 'dance'"},
        WrongLine{"tap", "a text in quotes or a position is missing"},
        WrongLine{"tap 10", "a number of pixels, 0 to 65535 is missing"},
        WrongLine{"tap 10 -1", "'-1' is not a position"}, WrongLine{"tap 10 101%", "0% to 100%"},
        WrongLine{"tap nan% 5", "0% to 100%"}, WrongLine{"tap \"PASS", "closing quote"},
        WrongLine{"tap \"PASS\"x", "another word touches"}, WrongLine{"tap \"a\\qb\"", "escape"},
        WrongLine{"tap \"\"", "empty text"}, WrongLine{"tap 1 2 finger 10", "a finger, 0 to 9"},
        WrongLine{"tap 1 2 3", "'3' is too much"}, WrongLine{"drag 1 2 3 4", "'3' is not 'to'"},
        WrongLine{"key sideways", "the name of a key"},
        WrongLine{"expect pixel 1 2 #12345", "a colour"},
        WrongLine{"expect txet \"a\"", "'txet' is not 'text'"},
        WrongLine{"wait until", "'text' is missing"}, WrongLine{"wait -5", "'-5' is not"},
        WrongLine{"+x tap 1 2", "'x' is not a time"},
        WrongLine{"99999999999999 tap 1 2", "a time, 0 to"},
        WrongLine{"shot /tmp/a.png", "does not lie below"},
        WrongLine{"shot a/../../b.png", "does not lie below"},
        WrongLine{"shot \"Makefile\"", "ends in .png"},
        WrongLine{"world time yesterday", "is not a time as"},
        WrongLine{"world time 2026-02-30T10:00:00Z", "is not a time as"},
        WrongLine{"world figure load \"1\"", "the figure's name in quotes"},
        WrongLine{"down 0 1 70000", "a position"},
        WrongLine{"frame 0123456789abcdef 1", "needs its time"},
        WrongLine{"5 frame 0123 1", "a hash of 16 digits"},
        WrongLine{"| 0 box", "an item without a frame"},
        WrongLine{"screen 720", "a side in pixels"}, WrongLine{"screen 0x5", "without pixels"},
        WrongLine{"screen x9xx9x", "a side in pixels"}, WrongLine{"density 0", "no number of dots"},
        WrongLine{"density 1x", "no number of dots"}, WrongLine{"clock step 0", "stands still"},
        WrongLine{"clock step 1001", "0 to 1000"}, WrongLine{"wait\x1B[2J", "'wait?[2J'"},
        WrongLine{"include gone.trace", "'t/gone.trace' cannot be read"},
        WrongLine{"include main.trace", "includes itself"}));

TEST(TraceParserTest, ReadsStepsWithTheirTimesAndOperands) {
  const ParsedTrace parsed = parseLines(
      "screen 720x1280\ndensity 312.5\nclock start 4294960000\nclock step 10\n"
      "1500 tap \"a*\\*\" for 700 finger 9 # a comment\n"
      "+20 move by -5 10% over 30\n"
      "key down\nkey down up\nkey volume-up for 5\n"
      "expect no text \"x\" in 0 0 50% 25.5% within 7\nwait until log \"y\"\nexpect pixel 1 2 "
      "#fF0080");
  ASSERT_EQ(parsed.error, "");
  const auto& steps = parsed.trace.steps;
  ASSERT_EQ(steps.size(), 8U);
  EXPECT_EQ(parsed.trace.clockStep, 10U);
  EXPECT_EQ(parsed.trace.screen, (Size{720, 1280}));
  EXPECT_EQ(parsed.trace.density, 312.5F);
  EXPECT_EQ(parsed.trace.clockStart, 4294960000U);
  const auto& tap = std::get<Touch>(steps[0].action);
  EXPECT_EQ(steps[0].time, 1500U);
  EXPECT_EQ(tap.duration, 700U);
  EXPECT_EQ(tap.finger, 9);
  EXPECT_TRUE(tap.place.text->matches("a bit*"));
  EXPECT_FALSE(tap.place.text->matches("a bit"));
  const auto& move = std::get<Touch>(steps[1].action);
  EXPECT_EQ(steps[1].timing, TraceStep::Timing::After);
  EXPECT_EQ(move.place.x.pixels(720), -5);
  EXPECT_EQ(move.place.y.pixels(1280), 128);
  EXPECT_EQ(std::get<KeyStroke>(steps[2].action).code, 274U);
  EXPECT_EQ(std::get<KeyStroke>(steps[3].action).kind, KeyStroke::Kind::Down);
  EXPECT_EQ(std::get<KeyStroke>(steps[3].action).code, 273U);
  EXPECT_EQ(std::get<KeyStroke>(steps[4].action).code, 115U);
  const auto& look = std::get<Look>(steps[5].action);
  EXPECT_EQ(look.subject, Look::Subject::NoText);
  EXPECT_EQ(look.area->h.pixels(1000), 255);
  EXPECT_EQ(look.within, 7U);
  EXPECT_EQ(std::get<Look>(steps[6].action).within, 10'000U);
  EXPECT_EQ(std::get<Look>(steps[7].action).colour, 0xFF0080U);
  EXPECT_EQ(parseLines("world random 1\nscreen 9x9\nwait 1\nscreen 9x9\n").error,
            "t/main.trace:5: this must stand before the first step");
}

// Each line has items to compare that it does not say.
TEST(TraceParserTest, RefusesFramesThatTakeTooLong) {
  std::string lines;
  for (int i = 0; i < 5'000; ++i) lines += "0 frame 0123456789abcdef 65536\n";
  EXPECT_NE(parseLines(lines).error.find("too many items"), std::string::npos);
  EXPECT_EQ(parseLines(lines.substr(0, lines.size() / 50)).error, "");
}

TEST(TraceParserTest, RefusesWhatTakesTooMuchMemory) {
  const auto parse = [](const char* lines, std::size_t mostSteps) {
    return parseTrace(
        "main", [&](auto&) { return std::string("brimol-trace 1\n") + lines; }, mostSteps);
  };
  const char* const three = "wait 1\n2 frame 0123456789abcdef 0\nwait 1\n";
  EXPECT_EQ(parse(three, 3).error, "");
  EXPECT_EQ(parse(three, 2).error, "main:4: more than 2 steps and frames");
  const ParsedTrace none = parseTrace("main", [](auto&) -> std::string { throw std::bad_alloc(); });
  EXPECT_EQ(none.error, "main: there is not enough memory for it");
}

TEST(TraceParserTest, IncludesFilesAndNamesTheirLines) {
  Files files = {{"t/main.trace", "brimol-trace 1\ninclude sub/part.trace\nwait 2\n"},
                 {"t/sub/part.trace", "brimol-trace 1\nwait 1\n"}};
  const ParsedTrace whole = parse(files);
  ASSERT_EQ(whole.error, "");
  ASSERT_EQ(whole.trace.steps.size(), 2U);
  EXPECT_EQ(whole.trace.steps[0].line.file->path, "t/sub/part.trace");
  EXPECT_EQ(whole.trace.steps[1].line.number, 3);
  files["t/sub/part.trace"] += "dance\n";
  EXPECT_EQ(parse(files).error, "t/sub/part.trace:3: unknown step 'dance'");
  files["t/sub/part.trace"] = "brimol-trace 1\ninclude ../sub/../main.trace\n";
  EXPECT_NE(parse(files).error, "") << "it ends, whatever the names";
  EXPECT_EQ(parse(Files{}).error, "t/main.trace:1: cannot be read");
}

class FilesOfATrace : public testing::Test {
 protected:
  FilesOfATrace() {
    std::filesystem::create_directories(folder / "t/sub");
    write("main.trace", "brimol-trace 1\nwait 1\n");
    write("t/sub/part.trace", "brimol-trace 1\nwait 1\n");
    std::filesystem::create_symlink(folder, folder / "t/link");
  }
  ~FilesOfATrace() override { std::filesystem::remove_all(folder); }

  void write(const std::string& name, const std::string& text) const {
    std::ofstream(folder / name) << text;
  }
  std::string errorOf(const std::string& lines, const std::string& root = {}) const {
    write("t/main.trace", "brimol-trace 1\n" + lines);
    return parseTrace(folder / "t/main.trace", root).error;
  }
  std::string included(const std::string& file) const {
    std::ifstream in(folder / file);
    return {std::istreambuf_iterator<char>(in), {}};
  }

  const std::filesystem::path folder = std::filesystem::path(testing::TempDir()) /
                                       ("files_of_a_trace." + std::to_string(::getpid()));
};

TEST_F(FilesOfATrace, StandInItsFolder) {
  const std::string absolute = folder / "main.trace";
  EXPECT_EQ(errorOf("include sub/part.trace\ninclude sub/../sub/part.trace"), "");
  for (const std::string& name :
       {std::string("../main.trace"), absolute, std::string("link/main.trace")}) {
    EXPECT_NE(errorOf("include " + name).find("cannot be read"), std::string::npos) << name;
    EXPECT_EQ(errorOf("include " + name, folder), "") << name;
  }
}

TEST_F(FilesOfATrace, AreNoPipesAndNoHugeOnes) {
  ASSERT_EQ(::mkfifo((folder / "t/pipe").c_str(), 0600), 0);
  EXPECT_NE(errorOf("include pipe").find("cannot be read"), std::string::npos) << "nobody writes";
  for (const char* const beginning : {"PNG\n", "brimol-trace 1\n"}) {
    write("t/huge", beginning);
    std::filesystem::resize_file(folder / "t/huge", std::uintmax_t{1} << 40);
    EXPECT_NE(errorOf("include huge").find("cannot be read"), std::string::npos);
  }
}

TEST_F(FilesOfATrace, KeepWhatTheyHeldWhereTheDiskIsFull) {
  std::filesystem::create_symlink(folder / "main.trace", folder / "recording");
  const std::string before = included("main.trace");
  (void)std::signal(SIGXFSZ, SIG_IGN);
  rlimit former = {};
  ::getrlimit(RLIMIT_FSIZE, &former);
  const rlimit none = {0, former.rlim_max};
  std::string error;
  {
    LineFile file(folder / "recording", error);
    ::setrlimit(RLIMIT_FSIZE, &none);
    file.write("brimol-trace 1 recording");
    ::setrlimit(RLIMIT_FSIZE, &former);
    file.write("it has ended");
  }
  EXPECT_EQ(error, "");
  EXPECT_EQ(included("recording"), before);
  EXPECT_FALSE(std::filesystem::exists(folder / "main.trace.part"));
  LineFile(folder / "recording", error).write("new");
  EXPECT_EQ(included("main.trace"), "new\n");
}

TEST_F(FilesOfATrace, AreNoStandardStreamsAndNoOtherPrograms) {
  const int errors = ::dup(STDERR_FILENO);
  ::close(STDERR_FILENO);
  std::string error;
  {
    const LineFile file(folder / "recording", error);
    ::dup2(errors, STDERR_FILENO);  // ends the file, were it there
    for (const auto& each : std::filesystem::directory_iterator("/proc/self/fd")) {
      std::error_code isGone;
      const auto open = std::filesystem::read_symlink(each, isGone);
      if (open.filename() != "recording.part") continue;
      EXPECT_EQ(::fcntl(std::stoi(each.path().filename()), F_GETFD), FD_CLOEXEC);
      error = "found";
    }
  }
  ::close(errors);
  EXPECT_EQ(error, "found");
  EXPECT_FALSE(std::filesystem::exists(folder / "recording.part"));
}

TEST(TraceParserTest, ReadsTimesOfDay) {
  for (const char* text : {"2026-11-22T10:00:00.007Z", "1970-01-01T00:00:00.000Z"}) {
    EXPECT_EQ(utcText(readUtc(text)), text);
  }
  EXPECT_EQ(utcText(readUtc("2024-02-29T23:59:59Z")), "2024-02-29T23:59:59.000Z");
}

SKIA_Item itemAt(int x, const char* text) {
  SKIA_Item item = {SKIA_TEXTBOX, {x, 2, 30, 40, 0xFF112233}, {}, {}};
  item.text.size = 12;
  item.text.string_len = static_cast<int32_t>(std::string(text).copy(item.text.text, 127));
  return item;
}

/// A recording of three frames and some input, as a session leaves it.
std::string recording() {
  const std::string path = testing::TempDir() + "recording." + std::to_string(::getpid());
  TraceRecorder recorder(path);
  EXPECT_EQ(recorder.open(), "");
  recorder.start(77, readUtc("2026-11-22T10:00:00Z"), 12345678901234567890U);
  recorder.screen({720, 1280});
  EXPECT_FALSE(std::filesystem::exists(path)) << "no screen is open";
  recorder.begin();
  recorder.frame(0, textOfFrame({itemAt(1, "one"), itemAt(2, "two \"quoted\"\n")}));
  recorder.input(5, pointerRecord(BRIMOL_POINTER_DOWN, 1, {10, 20}));
  Event motion = pointerRecord(BRIMOL_POINTER_MOTION, 1, {8, 20});
  motion.pointer.xrel = -2;
  recorder.input(6, motion);
  recorder.figure(7, "load", "0.25");
  recorder.frame(7, textOfFrame({itemAt(1, "one"), itemAt(3, "three"), itemAt(4, "")}));
  recorder.input(8, keyRecord(BRIMOL_KEY_UP, 158));
  recorder.frame(9, {});
  recorder.userCloses(10);
  recorder.end(11);
  std::ifstream in(path, std::ios::binary);
  std::string text{std::istreambuf_iterator<char>(in), {}};
  std::filesystem::remove(path);
  return text;
}

TEST(Recording, IsReadAsItWasWritten) {
  const ParsedTrace parsed = parse(recording());
  ASSERT_EQ(parsed.error, "");
  const Trace& trace = parsed.trace;
  EXPECT_TRUE(trace.isRecording);
  EXPECT_EQ(trace.cutAt, "");
  ASSERT_EQ(trace.frames.size(), 3U);
  EXPECT_EQ(trace.frames[1].time, 7U);
  EXPECT_EQ(itemsOf(trace, 1), textOfFrame({itemAt(1, "one"), itemAt(3, "three"), itemAt(4, "")}));
  ASSERT_EQ(trace.steps.size(), 8U);
  const Event& motion = std::get<RawRecord>(trace.steps[3].action).record;
  EXPECT_EQ(motion.pointer.xrel, -2);
  EXPECT_EQ(textOfRecord(motion), "motion 1 8 20 -2 0");
  EXPECT_EQ(std::get<WorldChange>(trace.steps[4].action).value, "0.25");
}

TEST(Recording, IsPlayedUpToWhereItWasCutOrRefusedWithItsLine) {
  const std::string whole = recording();
  const Trace trace = parse(whole).trace;
  for (std::size_t length = 0; length < whole.size(); ++length) {
    const ParsedTrace cut = parse(whole.substr(0, length));
    if (!cut.error.empty()) {
      EXPECT_EQ(cut.error.rfind("t/main.trace:1: ", 0), 0) << length << ' ' << cut.error;
      continue;
    }
    const auto isSameFrame = [](const RecordedFrame& one, const RecordedFrame& other) {
      return one.time == other.time && one.hash == other.hash && one.changes == other.changes;
    };
    const auto isSameStep = [](const TraceStep& one, const TraceStep& other) {
      return one.line.text == other.line.text;
    };
    ASSERT_LE(cut.trace.frames.size(), trace.frames.size());
    ASSERT_LE(cut.trace.steps.size(), trace.steps.size());
    EXPECT_TRUE(std::equal(cut.trace.frames.begin(), cut.trace.frames.end(), trace.frames.begin(),
                           isSameFrame))
        << length;
    EXPECT_TRUE(
        std::equal(cut.trace.steps.begin(), cut.trace.steps.end(), trace.steps.begin(), isSameStep))
        << length;
    EXPECT_NE(cut.trace.cutAt.empty(), cut.trace.isRecording) << length;
  }
}

TEST(Recording, IsRefusedWhereItWasDamaged) {
  std::string damaged = recording();
  damaged.replace(damaged.find("\"three\""), 7, "\"threw\"");
  const std::string error = parse(damaged).error;
  EXPECT_NE(error.find("does not have the items that its hash says"), std::string::npos) << error;
}

// The text with a few bytes changed, lost, repeated or put in.
std::string mutated(std::string text, std::mt19937& random) {
  const auto below = [&](std::size_t bound) { return random() % bound; };
  for (std::size_t changes = 1 + below(4); changes > 0 && !text.empty(); --changes) {
    const std::size_t place = below(text.size());
    switch (below(4)) {
      case 0: text[place] = static_cast<char>(random()); break;
      case 1: text.erase(place, 1 + below(12)); break;
      case 2: text.insert(place, text.substr(below(text.size()), 1 + below(30))); break;
      default: text.insert(place, 1, "\"\\|#%-*\n 9"[below(10)]); break;
    }
  }
  return text;
}

// Whatever stands in a trace, the answer is steps, or a line and what is wrong with it.
TEST(TraceParserTest, HasAClearAnswerToEveryMutation) {
  const std::string script =
      "brimol-trace 1\nscreen 720x1280\n100 tap \"PA*SS\" for 50 finger 1\nkey volume-up\n"
      "+5 drag 1% 2 to \"x\" over 20\nexpect no text \"\\x41\" in 1 2 3 4 within 9\n"
      "world time 2026-11-22T10:00:00.000Z\nexpect pixel 1 2 #a0B1c2\ntype \"ab c\"\n"
      "wait until log \"z\"\n";
  const std::string recorded = recording();
  std::mt19937 random(7);
  int refused = 0;
  for (int round = 0; round < 10'000; ++round) {
    const std::string error = parse(mutated(round % 2 == 0 ? script : recorded, random)).error;
    if (error.empty()) continue;
    ++refused;
    const std::size_t colon = error.find(": ");
    ASSERT_NE(colon, std::string::npos) << error;
    ASSERT_EQ(error.rfind("t/main.trace:", 0), 0) << error;
    ASSERT_GT(error.size(), colon + 2) << error;
  }
  EXPECT_GT(refused, 1000) << "and some do go wrong";
}

}  // namespace
}  // namespace brimol::pc
