#include "host/properties.h"

#include <gtest/gtest.h>

#include <array>
#include <string>

namespace brimol::pc {
namespace {

TEST(Properties, AreReadBackWithinTheirBound) {
  std::array<char, BRIMOL_PROPERTY_BYTES + 1> room = {};
  room.back() = '#';
  const auto read = [&room](const char* key, const char* fallback) {
    const int length = property_get(key, room.data(), fallback);
    EXPECT_EQ(length, property_get(key, nullptr, fallback)) << "the length alone";
    return std::string(room.data());
  };
  const std::string longest(91, 'v');
  EXPECT_EQ(read("test.model", (longest + "v").c_str()), longest);
  EXPECT_EQ(read(nullptr, nullptr), "");
  EXPECT_EQ(property_set("test.model", "first"), 0);
  EXPECT_EQ(property_set("test.model", longest.c_str()), 0);
  EXPECT_EQ(property_set("test.model", (longest + "w").c_str()), -1);
  EXPECT_EQ(read("test.model", "none"), longest);
  EXPECT_EQ(property_set("test.model", nullptr), 0);
  EXPECT_EQ(read("test.model", "none"), "none");
  EXPECT_EQ(property_set(nullptr, "v"), -1);
  EXPECT_EQ(room.back(), '#');
}

}  // namespace
}  // namespace brimol::pc
