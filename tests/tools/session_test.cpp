#include "session.h"

#include "runs.h"

namespace brimol::replay {
namespace {

constexpr std::string_view kWhole =
    R"({"kind":"start","time":0,"program":"app","version":"1","screen":{"width":480,"height":800},"environment":{"BRIMOL_SCREEN":"480x800"}})"
    "\n"
    R"({"kind":"frame","time":10,"number":1,"hash":"ab","items":2,"texts":[{"text":"One"},{"text":"Two"}],"picture":"1.png","paint_us":2500})"
    "\n"
    R"({"kind":"step","time":20,"file":"a.trace","line":3,"text":"tap \"One\""})"
    "\n"
    R"({"kind":"event","time":20,"file":"a.trace","line":3,"input":"down","finger":1,"x":5,"y":7})"
    "\n"
    R"({"kind":"event","time":25,"input":"keydown","code":323})"
    "\n"
    R"({"kind":"log","time":30,"priority":6,"tag":"t","message":"bad"})"
    "\n"
    R"({"kind":"expectation","time":40,"file":"a.trace","line":4,"text":"expect text \"X\"","passed":false,"why":"none"})"
    "\n"
    R"({"kind":"end","time":50,"exit":1,"reason":"failed"})"
    "\n";

TEST(SessionReader, ReadsWhatHappenedInItsOrder) {
  const Session session = sessionOf(kWhole);
  ASSERT_TRUE(session.start && session.end);
  EXPECT_EQ(session.start->height, 800);
  EXPECT_EQ(session.start->environment.at("BRIMOL_SCREEN"), "480x800");
  EXPECT_EQ(session.end->reason, "failed");
  ASSERT_EQ(session.frames.size(), 1);
  EXPECT_EQ(session.frames[0].texts, (std::vector<std::string>{"One", "Two"}));
  EXPECT_EQ(session.frames[0].paintMs, 2.5);
  ASSERT_EQ(session.happenings.size(), 5);
  EXPECT_EQ(session.happenings[0].frames, 1);
  EXPECT_EQ(session.happenings[1].text, "down: finger 1 at 5, 7");
  EXPECT_EQ(session.happenings[1].touch, (Touch{5, 7}));
  EXPECT_EQ(session.happenings[2].text, "keydown 323");
  EXPECT_EQ(session.happenings[3].weight, Happening::Weight::Failure);
  EXPECT_EQ(session.happenings[4].place.text(), "a.trace:4");
  EXPECT_FALSE(session.happenings[4].passed);
  EXPECT_EQ(session.lastTime, 50);
}

TEST(SessionReader, TakesItsBytesInAnyPieces) {
  for (std::size_t size = 1; size < 50; ++size) {
    SessionReader reader;
    for (std::size_t at = 0; at < kWhole.size(); at += size) reader.add(kWhole.substr(at, size));
    EXPECT_EQ(reader.session().happenings.size(), 5) << size;
    EXPECT_EQ(reader.session().damaged, 0) << size;
  }
}

// Cut at any byte, as a crash leaves it: at most the last line is lost.
TEST(SessionReader, LosesNoMoreThanTheLineThatWasCut) {
  for (std::size_t length = 0; length <= kWhole.size(); ++length) {
    const std::string_view text = kWhole.substr(0, length);
    const Session session = sessionOf(text);
    const auto whole = std::count(text.begin(), text.end(), '\n');
    EXPECT_GE(session.lines - session.damaged, whole) << length;
    EXPECT_LE(session.damaged, 1) << length;
  }
}

struct OddLine {
  const char* name;
  std::string_view line;
  int damaged, unknown;
};
class OddLines : public testing::TestWithParam<OddLine> {};

TEST_P(OddLines, AreCountedAndLeftOut) {
  const std::string text = std::string(GetParam().line) + "\n" + std::string(kWhole);
  const Session session = sessionOf(text);
  EXPECT_EQ(session.damaged, GetParam().damaged);
  EXPECT_EQ(session.firstDamaged, GetParam().damaged);  // the first line, if any
  EXPECT_EQ(session.unknown, GetParam().unknown);
  EXPECT_EQ(session.frames.back().items, 2);
  EXPECT_TRUE(session.end);
}

const std::string kDeep = std::string(100'000, '[');
INSTANTIATE_TEST_SUITE_P(
    SessionReader, OddLines,
    testing::Values(OddLine{"Empty", "", 1, 0}, OddLine{"Garbage", "\xff\x01 {", 1, 0},
                    OddLine{"AList", "[1]", 1, 0}, OddLine{"NoKind", R"({"time":1})", 1, 0},
                    OddLine{"KindOfAnotherType", R"({"kind":7})", 1, 0},
                    OddLine{"Deep", kDeep, 1, 0},
                    OddLine{"UnknownKind", R"({"kind":"dance","time":1})", 0, 1},
                    OddLine{"MembersOfOtherTypes",
                            R"({"kind":"frame","time":"x","number":[],"texts":7,"items":-1e300})",
                            0, 0},
                    OddLine{"StartWithoutAnything", R"({"kind":"start","screen":4})", 0, 0}),
    [](const auto& given) { return given.param.name; });

}  // namespace
}  // namespace brimol::replay
