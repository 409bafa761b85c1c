#include "properties.h"

#include <gtest/gtest.h>

#include <array>
#include <string>

namespace brimol::pc {
namespace {

constexpr char kGuard = '#';

struct Room {
  std::array<char, BRIMOL_PROPERTY_BYTES + 1> bytes;
  Room() { bytes.fill(kGuard); }
};

TEST(Properties, AreReadBackAndFallBack) {
  Room room;
  EXPECT_EQ(property_get("test.model", room.bytes.data(), "none"), 4);
  EXPECT_STREQ(room.bytes.data(), "none");
  EXPECT_EQ(property_set("test.model", "first"), 0);
  EXPECT_EQ(property_set("test.model", "again"), 0);
  EXPECT_EQ(property_get("test.model", room.bytes.data(), "none"), 5);
  EXPECT_STREQ(room.bytes.data(), "again");
  EXPECT_EQ(property_set("test.model", nullptr), 0);
  EXPECT_EQ(property_get("test.model", room.bytes.data(), nullptr), 0);
  EXPECT_STREQ(room.bytes.data(), "");
}

TEST(Properties, TakeValuesOfUpTo91Bytes) {
  Room room;
  const std::string longest(91, 'v');
  EXPECT_EQ(property_set("test.bound", longest.c_str()), 0);
  EXPECT_EQ(property_set("test.bound", std::string(92, 'w').c_str()), -1);
  EXPECT_EQ(property_get("test.bound", room.bytes.data(), ""), 91);
  EXPECT_EQ(std::string(room.bytes.data()), longest);
  EXPECT_EQ(room.bytes.back(), kGuard);
}

TEST(Properties, CutAFallbackThatIsTooLong) {
  Room room;
  EXPECT_EQ(property_get("test.notset", room.bytes.data(), std::string(500, 'v').c_str()), 91);
  EXPECT_EQ(std::string(room.bytes.data()), std::string(91, 'v'));
  EXPECT_EQ(room.bytes.back(), kGuard);
}

TEST(Properties, AnswerNullsAndEmptyKeys) {
  Room room;
  EXPECT_EQ(property_set(nullptr, "v"), -1);
  EXPECT_EQ(property_set("", "v"), -1);
  EXPECT_EQ(property_get(nullptr, room.bytes.data(), "d"), 1);
  EXPECT_STREQ(room.bytes.data(), "d");
  EXPECT_EQ(property_get("test.notset", nullptr, "abc"), 3);
}

}  // namespace
}  // namespace brimol::pc
