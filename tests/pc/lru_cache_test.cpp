#include "painter/lru_cache.h"

#include <gtest/gtest.h>

#include <string>

namespace brimol::pc {
namespace {

TEST(LruCacheTest, ForgetsFirstWhatWasAskedForLeastRecently) {
  LruCache<int, std::string> cache(3);
  for (const int key : {1, 2, 3}) cache.put(key, std::to_string(key), 1);
  ASSERT_NE(cache.find(1), nullptr);
  cache.put(4, "4", 1);
  EXPECT_EQ(cache.find(2), nullptr);
  EXPECT_EQ(*cache.find(1), "1");
  EXPECT_EQ(cache.size(), 3U);
}

TEST(LruCacheTest, CountsCostsAndReplacesKeys) {
  LruCache<int, std::string> cache(10);
  cache.put(1, "small", 4);
  cache.put(1, "other", 6);
  EXPECT_EQ(cache.cost(), 6U);
  EXPECT_EQ(*cache.find(1), "other");
  EXPECT_EQ(cache.put(2, "too large", 11), "too large");
  EXPECT_EQ(cache.size(), 1U);
  cache.put(3, "fits", 10);
  EXPECT_EQ(cache.cost(), 10U);
  EXPECT_EQ(cache.find(2), nullptr);
}

}  // namespace
}  // namespace brimol::pc
