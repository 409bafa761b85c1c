// Every page of the example application in every language: whether its words have room.
#include <MW/window.h>
#include <brimol3_widget_test/platform.h>
#include <brimol3_widget_test/screen.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <optional>
#include <string>
#include <vector>

#include "factory_test.h"
#include "language/language.h"
#include "pages/table.h"
#include "verdict_bar.h"

namespace factory_test {
namespace {

using brimol::test::Check;
using brimol::test::Loop;
using brimol::test::Moment;
using brimol::test::platform;
using brimol::test::Profile;
using brimol::test::Screen;

const std::vector<Profile> kProfiles = {{"wvga-4.0", {480, 800}, 233},
                                        {"hd-4.7", {720, 1280}, 313},
                                        {"wqhd-5.5", {1440, 2560}, 534},
                                        {"landscape", {2560, 1440}, 534},
                                        {"large", {4000, 3000}, 534}};

// What these pages show first has letters of the classes' own size.
const std::vector<std::string> kFixedLetters = {"prompts",   "list_choice", "six_choice",
                                                "free_form", "shell",       "result_list"};

// What is not the same in every language.
bool isOfWords(Check check) {
  return check == Check::Cut || check == Check::Overlap || check == Check::OffScreen ||
         check == Check::AtEdge;
}

/// The program on a screen, in the hands of someone who looks at everything.
class Visit {
 public:
  explicit Visit(const Profile& profile)
      : screen({profile.size.width, profile.size.height},
               Loop{[this] {
                      if (program) program->update(GetTicks());
                    },
                    [this] {
                      if (program) program->draw();
                    }},
               profile.dpi) {
    for (const char* const name : {"battery", "charger", "brightness", "host", "address", "load"}) {
      platform().figures[name] = "";
    }
    program.emplace(*book, context, task);
  }

  std::vector<Moment> wholeWay() {
    for (std::size_t i = 0; i < testEntries().size(); ++i) {
      program->open(i, GetTicks());
      screen.settle();
      if (std::ranges::count(kFixedLetters, testEntries()[i].id) == 0) look();
      leavePage(testEntries()[i].id);
    }
    passUnseen();
    press(kKeyBack);  // the question before the end
    press(kKeyBack);
    program->askForUnits();
    press(MW::kKeySelect);  // the question for one without a number
    return seen;
  }

 private:
  void look() { seen.push_back({screen.frame()}); }
  void press(unsigned int code) {
    screen.advance(PressGuard::kDeafMs);
    screen.key(code);
    screen.settle();
    look();
  }
  bool isMenu() const { return screen.shows(tr("Factory test")); }

  void leavePage(const std::string& page) {
    constexpr int kMostKeys = 2;
    for (int i = 0; i < kMostKeys && !isMenu(); ++i) press(kKeyBack);
    if (!isMenu()) {  // where every key is under test
      screen.advance(PressGuard::kDeafMs);
      screen.tap(tr("Leave"));
      screen.settle();
      look();
    }
    EXPECT_TRUE(isMenu()) << page;
  }

  // A PASS before all was tested is asked for again.
  void passUnseen() {
    program->open(placeOf("warnings"), GetTicks());
    screen.settle();
    for (const unsigned int code :
         std::vector<unsigned int>{kKeyBack, MW::kKeyRight, MW::kKeySelect, kKeyBack, kKeyBack}) {
      press(code);
    }
    EXPECT_TRUE(isMenu());
  }

  std::vector<Moment> seen;
  std::string error;
  std::optional<ResultBook> book = ResultBook::open(
      {}, {.unit = "SN0123456789", .operatorName = "Operator", .planName = "Line (rehearsal)"},
      error);
  SessionLog log{SessionLog::Echo::None};
  Task task = *chooseTask({}, error);
  Context context = {*book, log, {}, "true", task.plan};
  Screen screen;
  std::optional<FactoryTest> program;
};

class Words : public testing::TestWithParam<std::string> {};

TEST_P(Words, HaveRoomOnEveryPage) {
  chooseLanguage(GetParam());
  for (const Profile& profile : kProfiles) {
    Visit visit(profile);
    for (const auto& finding : brimol::test::lint(visit.wholeWay(), profile)) {
      if (isOfWords(finding.check)) ADD_FAILURE() << textOf(finding, profile);
    }
  }
}

INSTANTIATE_TEST_SUITE_P(Languages, Words, testing::Values("xx", "de", "ko", "ar"),
                         [](const auto& language) { return language.param; });

}  // namespace
}  // namespace factory_test
