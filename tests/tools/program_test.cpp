// The whole program, with an application that does what it is told.
#include <gmock/gmock.h>
#include <sys/wait.h>

#include <algorithm>
#include <csignal>
#include <cstdlib>
#include <random>
#include <thread>

#include "paths.h"
#include "runs.h"
#include "support/eventually.h"

namespace brimol::replay {
namespace {

using testing::HasSubstr;
namespace fs = std::filesystem;

class Program : public InFolder {
 protected:
  // Its exit code; what it says is in `said`. The word APP stands for the application.
  int replay(const std::string& arguments, const std::string& before = "") {
    std::string words = arguments;
    if (const auto place = words.find("APP"); place != std::string::npos) {
      words.replace(place, 3, kFakeApplication);
    }
    const std::string command = "cd " + folder.native() + " && " + before + " " + kReplayProgram +
                                " " + words + " >said.txt 2>&1";
    const int status = std::system(command.c_str());
    said = bytesOf(folder / "said.txt");
    return WIFEXITED(status) ? WEXITSTATUS(status) : -1;
  }
  // The process whose number the application wrote: one that was killed takes a moment to go.
  bool comesToItsEnd(const fs::path& output) const {
    const std::string process = "/proc/" + std::to_string(std::stoi(bytesOf(folder / output)));
    return test::eventually([&] {
      const std::string state = bytesOf(process + "/stat");
      return state.empty() || state.find(") Z ") != std::string::npos;
    });
  }

  const fs::path trace = write("menu.trace", "brimol-trace 1\n");
  std::string said;
};

struct Ending {
  const char* name;
  const char* does;
  int code;
  const char* says;
};
class Endings : public Program, public testing::WithParamInterface<Ending> {};

TEST_P(Endings, GiveExitCodeMessageAndReport) {
  EXPECT_EQ(replay(std::string("--dir d --junit j.xml menu.trace -- APP ") + GetParam().does),
            GetParam().code);
  EXPECT_THAT(said, HasSubstr(GetParam().says));
  EXPECT_THAT(bytesOf(folder / "d/report.html"), HasSubstr(R"("verdict":)"));
  EXPECT_THAT(bytesOf(folder / "j.xml"), HasSubstr("</testsuites>"));
}

INSTANTIATE_TEST_SUITE_P(
    All, Endings,
    testing::Values(Ending{"Passed", "pass", 0, "passed: "},
                    Ending{"Failed", "fail", 1, "menu.trace:4: failed: An expectation failed"},
                    Ending{"Refused", "refuse", 2, "menu.trace:7: unknown step"},
                    Ending{"Crashed", "crash", 3, "menu.trace:5: crashed: "},
                    Ending{"ApplicationFailed", "exit 7", 1, "exit code 7"},
                    Ending{"WroteNothing", "silent", 1, "is it built on"},
                    Ending{"BadArgument", "nonsense", 2, "does not know 'nonsense'"}),
    [](const auto& given) { return given.param.name; });

TEST_F(Program, EndsAHungApplicationWithAllThatItStarted) {
  // Also where it leads a group of its own.
  EXPECT_EQ(replay("--dir d --timeout 15 menu.trace -- setsid APP hang"), 3);
  EXPECT_THAT(said, HasSubstr("menu.trace:3: hung"));
  EXPECT_TRUE(comesToItsEnd("d/output.txt"));
  EXPECT_EQ(replay("--dir d menu.trace -- APP leave-child"), 0);
  EXPECT_TRUE(comesToItsEnd("d/output.txt")) << "the application left a process behind";
}

TEST_F(Program, BearsIgnoredSignals) {
  for (const auto& [before, application, code] :
       {std::tuple("env --ignore-signal=CHLD", "APP exit 7", 1),
        std::tuple("env --ignore-signal=HUP", "sh -c 'kill -HUP $PPID; exec APP pass'", 0)}) {
    EXPECT_EQ(replay(std::string("--dir d menu.trace -- ") + application, before), code) << before;
  }
}

class Signals : public Program, public testing::WithParamInterface<int> {};

TEST_P(Signals, EndTheApplicationToo) {
  std::thread killer([this] {
    while (bytesOf(folder / "d/output.txt").empty()) ::usleep(10'000);
    // The shell became the program, whose number it wrote first.
    ::kill(std::stoi(bytesOf(folder / "pid.txt")), GetParam());
  });
  const std::string command = "cd " + folder.native() + " && echo $$ >pid.txt && exec " +
                              "env --default-signal=QUIT " + kReplayProgram +
                              " --dir d menu.trace -- " + kFakeApplication +
                              " hang >said.txt 2>&1 <&-";  // also without an input
  const int status = std::system(command.c_str());
  killer.join();
  EXPECT_TRUE(comesToItsEnd("d/output.txt"));
  const bool isWatched = GetParam() != SIGKILL;
  EXPECT_TRUE(isWatched ? WEXITSTATUS(status) == 130 : WIFSIGNALED(status)) << status;
  EXPECT_THAT(bytesOf(folder / (isWatched ? "d/report.html" : "d/run.json")),
              HasSubstr(isWatched ? "interrupted" : "unfinished"));
}

INSTANTIATE_TEST_SUITE_P(All, Signals, testing::Values(SIGTERM, SIGQUIT, SIGKILL));

TEST_F(Program, SaysWhatItCannotUse) {
  write("full/file", "of the user");
  write("session/session.jsonl", "{}");
  write("main.trace", "brimol-trace 1\ninclude menu.trace\n");
  for (const auto& [arguments, says] : std::vector<std::pair<std::string, std::string>>{
           {"none.trace -- APP pass", "none.trace: cannot be read"},
           {". -- APP pass", "is a folder"},
           {"menu.trace -- ./none", "cannot start ./none: No such file"},
           {"--dir full menu.trace -- APP pass", "holds other things"},
           {"--dir session menu.trace -- APP pass", "holds other things"},
           {"--report menu.trace ./menu.trace -- APP pass", "would be written over"},
           {"--junit menu.trace main.trace -- APP pass", "would be written over"},
           {"--lint --accepted full/file --report full/file menu.trace -- APP", "written over"},
           {"--dir menu.trace/d menu.trace -- APP pass", "cannot make this folder"},
           {"--against none menu.trace -- APP pass", "none: holds no run"},
           {"--junit no/j.xml menu.trace -- APP pass", "no/j.xml: cannot be written there"},
           {"--from-bundle menu.trace -- APP", "menu.trace: "},
           {"--speed 2 menu.trace -- APP pass", "does not take '2'"}}) {
    EXPECT_EQ(replay(arguments), 2) << arguments;
    EXPECT_THAT(said, HasSubstr(says));
  }
  EXPECT_TRUE(fs::exists(folder / "full/file"));
}

TEST_F(Program, TellsThePlatformWhatIsWanted) {
  ASSERT_EQ(::setenv("BRIMOL_RECORD", "elsewhere", 1), 0);
  EXPECT_EQ(replay("--dir d menu.trace -- APP pass"), 0);
  EXPECT_THAT(bytesOf(folder / "d/session.jsonl"), HasSubstr(R"("BRIMOL_CLOCK":"simulated")"));
  EXPECT_EQ(replay("--dir d --speed 1 --screen 480x800 menu.trace -- APP pass"), 0);
  const std::string session = bytesOf(folder / "d/session.jsonl");
  EXPECT_THAT(session, HasSubstr(R"("BRIMOL_CLOCK":"paced")"));
  EXPECT_THAT(session, HasSubstr(R"("BRIMOL_DISPLAY":"window")"));
  EXPECT_THAT(session, HasSubstr(R"("BRIMOL_SCREEN":"480x800")"));
  ::unsetenv("BRIMOL_RECORD");
}

TEST_F(Program, ReplacesAnEarlierRunAndNothingElse) {
  EXPECT_EQ(replay("--dir d menu.trace -- APP pass"), 0);
  write("d/notes.txt", "of the user");
  EXPECT_EQ(replay("--dir d menu.trace -- APP pass-otherwise"), 0);
  EXPECT_FALSE(fs::exists(folder / "d/frame-400.png")) << "of the earlier run";
  EXPECT_TRUE(fs::exists(folder / "d/frame-420.png"));
  EXPECT_EQ(replay("--dir d menu.trace -- APP silent"), 1);
  EXPECT_EQ(replay("--dir d menu.trace -- APP silent"), 1) << "there is no session";
  write("d/session.jsonl", R"({"kind":"shot","time":0,"picture":"notes.txt"})");
  write("d/bundle/mine.txt", "of the user");
  EXPECT_EQ(replay("--dir d menu.trace -- APP pass"), 0);
  EXPECT_TRUE(fs::exists(folder / "d/notes.txt"));
  EXPECT_TRUE(fs::exists(folder / "d/bundle/mine.txt"));
  EXPECT_EQ(replay("menu.trace -- APP pass"), 0);
  EXPECT_EQ(replay("menu.trace -- APP pass"), 0);
  EXPECT_TRUE(fs::exists(folder / "replay-menu/report.html"));
  EXPECT_TRUE(fs::exists(folder / "replay-menu-2/report.html"));
}

TEST_F(Program, ComparesWithAnEarlierRun) {
  EXPECT_EQ(replay("--dir first menu.trace -- APP pass"), 0);
  EXPECT_EQ(replay("--dir d --against first menu.trace -- APP pass"), 0) << said;
  EXPECT_EQ(replay("--dir d --against first menu.trace -- APP pass-otherwise"), 1);
  EXPECT_THAT(said, HasSubstr("1 frame differs"));
  EXPECT_EQ(replay("--dir first --against first menu.trace -- APP pass"), 2);
}

TEST_F(Program, KeepsWhatWasWrittenBeforeWhereTheDiskIsFull) {
  EXPECT_EQ(replay("--dir d --report r.html --bundle b.tgz menu.trace -- APP pass"), 0);
  std::string noise(1 << 16, '\0');
  std::ranges::generate(noise, std::minstd_rand());
  write("d/noise", noise);
  const std::string full = "trap '' XFSZ; ulimit -f 8;";  // no file grows beyond 4 KiB
  for (const auto& [file, options] : {std::pair("r.html", "--report r.html"),
                                      std::pair("b.tgz", "--report /dev/null --bundle b.tgz")}) {
    const std::string before = bytesOf(folder / file);
    EXPECT_EQ(replay(std::string("--dir d ") + options + " menu.trace -- APP pass", full), 2);
    EXPECT_THAT(said, HasSubstr(std::string(file) + ": cannot be written"));
    EXPECT_EQ(bytesOf(folder / file), before);
    EXPECT_FALSE(fs::exists(folder / (std::string(file) + ".tmp")));
  }
}

TEST_F(Program, ShowsTheEndOfWhatTheApplicationWrote) {
  EXPECT_EQ(replay(R"(menu.trace -- sh -c "yes x | tr -d '\n' | head -c 9000000; exit 1")"), 1);
  EXPECT_LT(said.size(), 70'000);
  EXPECT_LT(fs::file_size(folder / "replay-menu/report.html"), 500'000);
}

TEST_F(Program, RepeatsWhatItPacked) {
  EXPECT_EQ(replay("--bundle b.tgz menu.trace -- APP refuse"), 2);
  EXPECT_FALSE(fs::exists(folder / "b.tgz")) << "no run";
  EXPECT_EQ(replay("--bundle b.tgz --screen 480x800 menu.trace -- APP pass",
                   "BRIMOL_CLOCK_STEP=10 BRIMOL_MONKEY=1"),
            0)
      << said;
  fs::remove(trace);
  EXPECT_EQ(replay("--dir d --from-bundle b.tgz -- APP"), 2) << "arguments that nobody saw";
  EXPECT_THAT(said, HasSubstr("with the arguments pass: give"));
  EXPECT_EQ(replay("--dir d --packed-arguments --from-bundle b.tgz -- APP"), 0) << said;
  EXPECT_THAT(
      bytesOf(folder / "d/session.jsonl"),
      HasSubstr(
          R"("BRIMOL_CLOCK_STEP":"10","BRIMOL_DISPLAY":"headless","BRIMOL_SCREEN":"480x800")"));
  write("again.trace", "brimol-trace 1\n");
  for (const char* const arguments :
       {"d/bundle/trace/menu.trace", "--against d/bundle/run again.trace",
        "--lint --accepted d/run.json again.trace"}) {
    EXPECT_EQ(replay(std::string("--dir d ") + arguments + " -- APP pass"), 2);
    EXPECT_THAT(said, HasSubstr("would be removed with the earlier run in d"));
  }
  EXPECT_EQ(replay("--dir d --from-bundle b.tgz -- APP pass-otherwise"), 1);
  EXPECT_THAT(said, HasSubstr("1 frame differs"));
}

}  // namespace
}  // namespace brimol::replay
