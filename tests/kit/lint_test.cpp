// The layout lint: a faulty and a good frame for each check, scrolling, keys, accepted findings.
#include <brimol3_widget_test/lint.h>
#include <gtest/gtest.h>
#include <unistd.h>

#include <filesystem>
#include <fstream>

namespace brimol::test {
namespace {

const Profile kPhone = {"phone", {500, 1000}, 254};  // ten pixels are a millimetre
constexpr uint32_t kWhite = 0xFFFFFFFF;
constexpr uint32_t kBlack = 0xFF000000;

SKIA_Item textbox(const char* text, SKIA_Rect rect, int size = 30, uint32_t color = kWhite) {
  return {SKIA_TEXTBOX, rect, {}, textRecord(text, color, SKIA_ALIGN_CENTRE, size)};
}
SKIA_Item button(const char* text, SKIA_Rect rect, uint32_t color = kWhite) {
  SKIA_Item item = textbox(text, rect, 30, color);
  item.kind = SKIA_BUTTONBOX;
  return item;
}

// Each as "check item|".
std::string found(const std::vector<Moment>& moments) {
  std::string all;
  for (const Finding& each : lint(moments, kPhone)) {
    all += nameOf(each.check) + std::string(" ") + each.item + "|";
  }
  return all;
}
std::string found(const Frame& frame) { return found({Moment{frame}}); }

TEST(Lint, FindsWhatIsHardToRead) {
  EXPECT_EQ(found({textbox("Good", {100, 100, 200, 100, kBlack})}), "");
  EXPECT_EQ(found({textbox("A long text", {100, 100, 60, 100, kBlack})}), "cut A long text|");
  EXPECT_EQ(found({textbox("Two\nlines", {100, 100, 200, 20, kBlack})}), "cut Two\nlines|");
  EXPECT_EQ(found({textbox("Small", {100, 100, 200, 100, kBlack}, 14)}), "small-text Small|");
  EXPECT_EQ(found({textbox("Pale", {100, 100, 200, 100, 0xFFB0B0B0})}), "contrast Pale|");
  EXPECT_EQ(found({textbox("Low", {100, 960, 200, 80, kBlack}, 60)}), "off-screen Low|");
  EXPECT_EQ(found({{SKIA_LABEL, {0, 100, 200, 50, 0}, {}, textRecord("H", kWhite, 1, 30)}}),
            "at-edge H|");
}

TEST(Lint, FindsWhatOverlaps) {
  const SKIA_Item under = textbox("Under", {100, 100, 200, 100, kBlack});
  const SKIA_Item label = {
      SKIA_LABEL, {110, 105, 200, 100, 0}, {}, textRecord("Over", kWhite, SKIA_ALIGN_CENTRE, 30)};
  EXPECT_EQ(found({under, label}), "overlap Under|");
  const SKIA_Item box = {SKIA_BOX, {215, 100, 50, 100, kBlack}, {}, {}};
  EXPECT_EQ(found({under, box}), "overlap Under|");
  const SKIA_Item veil = {SKIA_BOX, {0, 0, 500, 1000, 0x80000000}, {}, {}};
  EXPECT_EQ(found({under, label, veil}), "") << "what lies below a dialog";
}

TEST(Lint, FindsTargetsThatFingersMiss) {
  EXPECT_EQ(found({button("Go", {100, 100, 70, 70, kBlack})}), "");
  EXPECT_EQ(found({button("Go", {100, 100, 200, 60, kBlack})}), "small-target Go|");
  const Frame row = {textbox("Row", {100, 100, 300, 50, kBlack})};
  EXPECT_EQ(found({{row, Moment::Deed::Tap, 120, 120}, {row}}), "small-target Row|")
      << "what was tapped";
}

TEST(Lint, ForgivesWhatIsScrolled) {
  const Moment low = {{textbox("Row", {100, 970, 300, 70, kBlack}, 60)}};
  const Moment high = {{textbox("Row", {100, 500, 300, 70, kBlack}, 60)}};
  EXPECT_EQ(found({low}), "off-screen Row|");
  EXPECT_EQ(found({low, high}), "");
}

TEST(Lint, KnowsWhatKeysReach) {
  const SKIA_Item title = textbox("Title", {100, 10, 200, 60, kBlack});
  const Frame page = {title, button("A", {100, 100, 80, 80, kBlack}),
                      button("B", {200, 100, 80, 80, kBlack})};
  Frame marked = page;
  marked[1] = button("A", {100, 100, 80, 80, kBlack}, 0xFF87CEFA);
  const Frame next = {textbox("Next", {100, 10, 200, 60, kBlack})};
  const Moment key = {page, Moment::Deed::Key};
  EXPECT_EQ(found({{page}, {next}}), "") << "no key was tried";
  EXPECT_EQ(found({key, {marked}}), "no-key B|");
  EXPECT_EQ(found({{page, Moment::Deed::Tap, 210, 110}, {next}, {page, Moment::Deed::Key}, {next}}),
            "no-key A|")
      << "a key does what the tap on B did";
}

TEST(Lint, AcceptsWhatIsListed) {
  const std::filesystem::path file =
      testing::TempDir() + "findings." + std::to_string(::getpid()) + ".accepted";
  const auto judged = [&](const std::string& lines) {
    std::ofstream(file) << lines << std::flush;
    const Frame small = {textbox("Small", {100, 100, 200, 100, kBlack}, 14)};
    std::string all;
    for (const std::string& line :
         AcceptedFindings(file).judge(lint({Moment{small}}, kPhone), kPhone)) {
      all += line + "\n";
    }
    return all;
  };
  EXPECT_EQ(judged(""),
            "phone: small-text: \"Small\" on \"Small\": 1.4 mm high, at least 1.5 mm wanted\n");
  EXPECT_EQ(judged("# why\n\nsmall-text * \"Sm*\" \"*\" fixed\n"), "");
  EXPECT_NE(judged("small-text other \"Sm*\" \"*\" fixed\n"), "") << "of another phone";
  EXPECT_EQ(judged("small-text * \"Small\" \"*\" fixed\ncut phone,x \"Small\" \"*\" gone\n"),
            file.native() + ":2: accepted, but not found on phone\n");
  EXPECT_THROW(judged("tiny * \"a\" \"b\" c\n"), std::runtime_error);
  EXPECT_THROW(judged("cut * \"a\" \"b\"\n"), std::runtime_error) << "without a reason";
}

}  // namespace
}  // namespace brimol::test
