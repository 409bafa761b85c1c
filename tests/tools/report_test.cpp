#include "report.h"

#include <gmock/gmock.h>

#include <nlohmann/json.hpp>

#include "album.h"
#include "report_data.h"
#include "runs.h"

namespace brimol::replay {
namespace {

using nlohmann::json;
using testing::HasSubstr;
using testing::Not;

constexpr auto kHostile =
    "</script><script>alert(1)</script><!-- <b>&amp;\"'\\ \xe2\x80\xa8 {{session}}";

Happening happeningOf(Happening::Kind kind, const char* text) {
  Happening happening;
  happening.kind = kind;
  happening.text = text;
  if (kind == Happening::Kind::Error) happening.weight = Happening::Weight::Failure;
  return happening;
}

class Report : public InFolder {
 protected:
  json data() const { return reportData({run, end, judgement, {}}); }

  PlayedRun run{folder, {}};
  RunEnd end{RunEnd::Kind::Exited};
  Judgement judgement{Verdict::Passed, "Fine."};
};

TEST_F(Report, LetsNoTextOutOfItsData) {
  judgement = {Verdict::Failed, kHostile, kHostile, {kHostile, 1}};
  run.session.happenings.push_back(happeningOf(Happening::Kind::Log, kHostile));
  run.session.frames.push_back({.hash = kHostile, .texts = {kHostile}, .picture = kHostile});
  const ReportInput input{
      run, end, judgement, {{kHostile, kHostile}}, std::string("\xff").append(kHostile)};
  const std::string page = reportPage(input);
  const auto begin = page.find("id=\"session\">") + std::string_view("id=\"session\">").size();
  const std::string inside = page.substr(begin, page.find("</script>", begin) - begin);
  EXPECT_THAT(inside, Not(HasSubstr("<")));
  const json data = json::parse(inside, nullptr, false);
  ASSERT_FALSE(data.is_discarded()) << "the element ended too early";
  EXPECT_EQ(data["headline"], kHostile);
  EXPECT_EQ(data["before"][0]["text"], kHostile);
  EXPECT_EQ(data["output"], std::string("\xef\xbf\xbd").append(kHostile));
}

TEST_F(Report, PutsWhatHappenedUnderTheFrameBeforeIt) {
  run.session = sessionOf(
      "{\"kind\":\"log\",\"message\":\"early\"}\n{\"kind\":\"frame\",\"number\":1}\n"
      "{\"kind\":\"event\",\"time\":5,\"input\":\"motion\",\"x\":1,\"y\":1}\n"
      "{\"kind\":\"event\",\"time\":6,\"input\":\"motion\",\"x\":2,\"y\":9}\n"
      "{\"kind\":\"frame\",\"number\":2}\n{\"kind\":\"expectation\",\"passed\":false}\n");
  const json shown = data();
  EXPECT_EQ(shown["before"].size(), 1);
  ASSERT_EQ(shown["frames"][0]["entries"].size(), 1) << "a movement is one line";
  EXPECT_EQ(shown["frames"][0]["entries"][0]["motions"], 2);
  EXPECT_EQ(shown["frames"][0]["entries"][0]["text"], "motion: finger 0 at 2, 9");
  EXPECT_EQ(shown["failures"][0]["frame"], 1);
  EXPECT_EQ(shown["times"]["failed"].size(), 1);
}

TEST_F(Report, StaysBounded) {
  for (int number = 0; number < 3 * static_cast<int>(kMostFrames); ++number) {
    run.session.frames.push_back({.number = number, .texts = {std::string(10'000, 'x')}});
  }
  run.session.happenings.resize(2 * kMostHappenings);
  run.session.happenings.back() = happeningOf(Happening::Kind::Error, "the last");
  const json shown = data();
  EXPECT_EQ(shown["frames"].size(), kMostFrames);
  EXPECT_EQ(shown["frames"].back()["number"], 3 * kMostFrames - 1);
  EXPECT_EQ(shown["before"].size(), kMostHappenings + 1);
  EXPECT_EQ(shown["before"].back()["text"], "the last") << "failures are never left out";
  EXPECT_EQ(shown["notes"].size(), 2);
  EXPECT_LT(shown.dump().size(), 6'000'000);
}

TEST_F(Report, SaysWhatItCouldNotRead) {
  run.session = sessionOf("{\"kind\":\"odd\"}\nbroken\n");
  EXPECT_EQ(data()["notes"].size(), 2);
}

TEST_F(Report, KeepsEachPictureOnceAndWithinItsBounds) {
  writePicture("one.png", 0x112233);
  writePicture("copy.png", 0x112233);
  writePicture("two.png", 0x445566);
  write("text.png", "no picture");
  const std::size_t room = bytesOf(folder / "one.png").size();
  Album album(folder, {room, room * 10, 216});
  EXPECT_EQ(album.addFile(folder / "one.png"), 0);
  EXPECT_EQ(album.addFile(folder / "copy.png"), 0);
  EXPECT_EQ(album.addFile(folder / "two.png"), 1);
  EXPECT_EQ(album.addFile(folder / "text.png"), std::nullopt);
  EXPECT_EQ(album.addFile(folder / "none.png"), std::nullopt);
  const json pictures = album.json();
  ASSERT_EQ(pictures.size(), 2);
  EXPECT_EQ(pictures[0]["full"], base64(bytesOf(folder / "one.png")));
  EXPECT_FALSE(pictures[1].contains("full")) << "there was no room";
  EXPECT_TRUE(pictures[1].contains("thumb"));
  EXPECT_EQ(pictures[1]["file"], "two.png");
  EXPECT_EQ(album.withoutFull(), 1);
}

TEST_F(Report, ReadsNoPictureOutsideTheRun) {
  EXPECT_EQ(fileOf(folder, "a/b.png"), folder / "a/b.png");
  std::filesystem::create_symlink("/etc", folder / "link");
  for (const char* const name : {"", "link/passwd", "/etc/passwd", "../x.png", "a/../../x.png"}) {
    EXPECT_EQ(fileOf(folder, name), std::nullopt) << name;
  }
}

}  // namespace
}  // namespace brimol::replay
