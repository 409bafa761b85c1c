#include "host/session_settings.h"

#include <gtest/gtest.h>

#include <map>

#include "host/world.h"

namespace brimol::pc {
namespace {

SessionSettings settingsWith(std::map<std::string, const char*> variables) {
  return readSessionSettings([&](const char* name) -> const char* { return variables[name]; });
}

TEST(SessionSettings, ChooseTheClockThatASessionNeeds) {
  EXPECT_EQ(settingsWith({}).clock, ClockChoice::Real);
  EXPECT_EQ(settingsWith({{"BRIMOL_TRACE", "a"}}).clock, ClockChoice::Simulated);
  EXPECT_EQ(settingsWith({{"BRIMOL_RECORD", "a"}}).clock, ClockChoice::Paced);
  EXPECT_EQ(settingsWith({{"BRIMOL_TRACE", "a"}, {"BRIMOL_CLOCK", "paced"}}).clock,
            ClockChoice::Paced);
  const SessionSettings started =
      settingsWith({{"BRIMOL_CLOCK", "simulated"}, {"BRIMOL_CLOCK_START", "4294967295"}});
  EXPECT_EQ(started.clockStart, 4294967295U);
  EXPECT_EQ(started.error, "");
}

TEST(SessionSettings, SayWhatIsWrong) {
  const auto errorWith = [](std::map<std::string, const char*> variables) {
    return settingsWith(std::move(variables)).error;
  };
  EXPECT_EQ(errorWith({{"BRIMOL_CLOCK", "fast"}}),
            "BRIMOL_CLOCK=fast: wanted real, simulated or paced");
  EXPECT_EQ(errorWith({{"BRIMOL_CLOCK_START", "4294967296"}}),
            "BRIMOL_CLOCK_START=4294967296: wanted milliseconds, 0 to 4294967295");
  EXPECT_EQ(errorWith({{"BRIMOL_CLOCK_STEP", "0"}}),
            "BRIMOL_CLOCK_STEP=0: wanted milliseconds, 1 to 1000");
  EXPECT_EQ(errorWith({{"BRIMOL_REPORT_PICTURES", "all"}}),
            "BRIMOL_REPORT_PICTURES=all: wanted changed or none");
  EXPECT_EQ(errorWith({{"BRIMOL_REPORT_ITEMS", "1"}}),
            "BRIMOL_REPORT_ITEMS=1: wanted changed or none");
  EXPECT_EQ(errorWith({{"BRIMOL_MONKEY", "1\n2"}}),
            "BRIMOL_MONKEY=1?2: wanted SEED, SEED:EVENTS or SEED:EVENTS:REST");
  EXPECT_NE(errorWith({{"BRIMOL_TRACE", "a"}, {"BRIMOL_CLOCK", "real"}}), "");
  EXPECT_NE(errorWith({{"BRIMOL_TRACE", "a"}, {"BRIMOL_RECORD", "b"}}), "");
}

TEST(World, IsTheSameForTheSameLines) {
  World one;
  World two;
  for (World* each : {&one, &two}) {
    each->change({WorldChange::Kind::Random, 42, {}, {}}, 0);
    each->change({WorldChange::Kind::Time, 5000, {}, {}}, 100);
    each->change({WorldChange::Kind::Figure, 0, "load", "0.5"}, 0);
  }
  EXPECT_EQ(one.utcMs(100), 5000U);
  EXPECT_EQ(one.utcMs(350), 5250U);
  const uint32_t first = one.random();
  EXPECT_EQ(two.random(), first);
  EXPECT_NE(one.random(), first);
  EXPECT_EQ(one.figure("load"), "0.5");
  EXPECT_EQ(one.figure("battery"), "") << "no line says it";
}

TEST(World, AnswersTheSameAtTheSameMoment) {
  World world;
  bool isNew = false;
  EXPECT_EQ(world.record("load", "1", 5, isNew), "1");
  EXPECT_TRUE(isNew);
  EXPECT_EQ(world.record("load", "2", 5, isNew), "1") << "what was recorded holds for the moment";
  EXPECT_FALSE(isNew);
  EXPECT_EQ(world.record("load", "2", 6, isNew), "2");
  EXPECT_TRUE(isNew);
  EXPECT_EQ(world.record("load", "2", 7, isNew), "2");
  EXPECT_FALSE(isNew);
}

}  // namespace
}  // namespace brimol::pc
