#include "compare.h"

#include "runs.h"

namespace brimol::replay {
namespace {

using Kind = FramePair::Kind;

// Frames by one letter each, a frame every 10 ms; a dot lets 10 ms pass.
Session framesOf(std::string_view letters) {
  Session session;
  int64_t time = 0;
  for (const char letter : letters) {
    if (letter != '.') session.frames.push_back({.time = time, .hash = std::string(1, letter)});
    time += 10;
  }
  return session;
}

// "a=a": the same; "~": at another time; "!": differs; "a-" and "-a": one side alone.
std::string wordOf(const FramePair& pair, const Session& here, const Session& there) {
  const std::string mine = pair.here == FramePair::kNone ? "" : here.frames[pair.here].hash;
  const std::string theirs = pair.there == FramePair::kNone ? "" : there.frames[pair.there].hash;
  switch (pair.kind) {
    case Kind::Same: return mine + "=" + theirs;
    case Kind::Moved: return mine + "~" + theirs;
    case Kind::Differs: return mine + "!" + theirs;
    default: return mine + "-" + theirs;
  }
}

struct Case {
  const char* name;
  const char* here;
  const char* there;
  const char* pairs;
};
class CompareFrames : public testing::TestWithParam<Case> {};

TEST_P(CompareFrames, PairsThoseThatCorrespond) {
  const PlayedRun here{"", framesOf(GetParam().here)};
  const PlayedRun there{"", framesOf(GetParam().there)};
  const Comparison comparison = compare(here, there, 0);
  std::string pairs;
  for (const FramePair& pair : comparison.pairs) {
    pairs += wordOf(pair, here.session, there.session) + " ";
  }
  EXPECT_EQ(pairs, GetParam().pairs);
}

INSTANTIATE_TEST_SUITE_P(
    All, CompareFrames,
    testing::Values(Case{"Same", "abc", "abc", "a=a b=b c=c "}, Case{"Nothing", "", "", ""},
                    Case{"OneDiffers", "abc", "axc", "a=a b!x c=c "},
                    Case{"LaterHere", "a.b", "ab", "a=a b~b "},
                    Case{"OneMoreHere", "abc", "ac", "a=a b- c~c "},
                    Case{"OneMoreThere", "ac", "abc", "a=a -b c~c "},
                    Case{"OtherMiddle", "abcde", "axyde", "a=a b!x c!y d=d e=e "},
                    Case{"ShiftedInTheMiddle", "axbcye", "abczze", "a=a x- b~b c~c y!z -z e=e "},
                    Case{"Repeated", "aba", "a", "a=a b- a- "},
                    Case{"AllHere", "ab", "", "a- b- "}),
    [](const auto& given) { return given.param.name; });

class ComparePictures : public InFolder {};

TEST_F(ComparePictures, FindsThePixelsThatDiffer) {
  const auto runOf = [](std::filesystem::path in, const char* hash, std::string picture) {
    PlayedRun run{std::move(in), {}};
    run.session.frames.push_back({.hash = hash, .picture = std::move(picture)});
    return run;
  };
  writePicture("one.png", 0x336699);
  writePicture("same.png", 0x336699);
  writePicture("other.png", 0x336699, 42);
  write("damaged.png", "no picture");
  const auto compared = [&](const PlayedRun& here, const PlayedRun& there) {
    return compare(here, there, 1).pairs.at(0);
  };
  const PlayedRun one = runOf(folder, "a", "one.png");
  EXPECT_EQ(compared(one, runOf(folder, "a", "same.png")).kind, Kind::Same);
  const FramePair other = compared(one, runOf(folder, "a", "other.png"));
  EXPECT_EQ(other.kind, Kind::Differs) << "though its items are the same";
  EXPECT_EQ(other.pixels, 1);
  EXPECT_TRUE(decodePng(other.picture));
  EXPECT_EQ(compared(one, runOf(folder, "b", "same.png")).pixels, 0);
  EXPECT_EQ(compared(one, runOf(folder, "b", "same.png")).kind, Kind::Differs);
  EXPECT_EQ(compared(one, runOf(folder, "a", "damaged.png")).kind, Kind::Same);
  EXPECT_EQ(compared(one, runOf(folder, "a", "missing.png")).kind, Kind::Same);
  const PlayedRun below = runOf(folder / "below", "a", "../other.png");
  std::filesystem::create_directories(below.folder);
  EXPECT_EQ(compared(one, below).kind, Kind::Same) << "it stands outside of its run";
}

TEST_F(ComparePictures, CountWhatOneOfThemLacks) {
  const Surface small(cairo_image_surface_create(CAIRO_FORMAT_RGB24, 3, 2));
  const Surface large(cairo_image_surface_create(CAIRO_FORMAT_RGB24, 2, 4));
  EXPECT_EQ(differenceOf(small, large).pixels, 3 * 2 + 2 * 4 - 2 * (2 * 2));
  EXPECT_EQ(differenceOf(small, small).pixels, 0);
}

TEST(Base64, PadsItsLastGroup) {
  EXPECT_EQ(base64(""), "");
  EXPECT_EQ(base64("M"), "TQ==");
  EXPECT_EQ(base64("Ma"), "TWE=");
  EXPECT_EQ(base64("Man"), "TWFu");
  EXPECT_EQ(base64(std::string("\xff\xfe\x00\x01", 4)), "//4AAQ==");
}

}  // namespace
}  // namespace brimol::replay
