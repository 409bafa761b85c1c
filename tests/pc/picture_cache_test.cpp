#include "painter/picture_cache.h"

#include <gtest/gtest.h>
#include <sys/stat.h>

#include <array>
#include <fstream>

#include "painting.h"

namespace brimol::pc {
namespace {

using Area = cairo_rectangle_int_t;

constexpr SKIA_Rect kRect = {10, 10, 30, 20, 0};

Picture shown(int32_t kind, const std::string& file, int32_t size = 0) {
  return painted({textItem(kind, kRect, textOf(file, size))});
}

std::string fileOf(const std::string& name, const std::string& bytes) {
  std::string path = testing::TempDir() + "/" + name;
  std::ofstream(path, std::ios::binary) << bytes;
  return path;
}

// A PNG file's first bytes for a picture of this size.
std::string headerOf(uint32_t width, uint32_t height) {
  std::string bytes("\x89PNG\r\n\x1A\n\0\0\0\rIHDR", 16);
  for (const uint32_t side : {width, height}) {
    for (const int shift : {24, 16, 8, 0}) bytes += static_cast<char>(side >> shift & 0xFF);
  }
  return bytes + std::string("\x08\x02\0\0\0", 5);
}

TEST(PictureTest, FillsItsRectangle) {
  const std::string file = writePicture(".png", {3, 3}, 0xFF204060);
  EXPECT_EQ(shown(SKIA_IMAGE, file), painted({boxItem({10, 10, 30, 20, 0xFF204060})}));
}

TEST(PictureTest, ALabelWithoutSizeIsAPicture) {
  const std::string file = writePicture(".png", {50, 50}, kRed);
  EXPECT_EQ(shown(SKIA_LABEL, file), shown(SKIA_IMAGE, file));
  EXPECT_NE(shown(SKIA_LABEL, file, 12), shown(SKIA_IMAGE, file));
  EXPECT_EQ(shown(SKIA_TEXTBOX, file), painted({boxItem({10, 10, 30, 20, 0})}));
  EXPECT_EQ(shown(SKIA_LABEL, ""), painted({}));
}

TEST(PictureTest, WhatIsNoPictureShowsAnOutlineWithADiagonal) {
  const std::string pipe = testing::TempDir() + "/picture.pipe";
  mkfifo(pipe.c_str(), 0600);
  const Picture missing = shown(SKIA_IMAGE, "/nowhere/none.png");
  EXPECT_EQ(missing.inked(), (Area{10, 10, 30, 20}));
  EXPECT_EQ(missing.at(10, 29), 0x808080U) << "the outline";
  EXPECT_EQ(missing.at(25, 20), 0x808080U) << "the diagonal";
  EXPECT_EQ(missing.at(35, 15), 0U) << "beside it";
  for (const std::string& file :
       {pipe, testing::TempDir(), std::string("/dev/zero"), fileOf("empty.png", ""),
        fileOf("text.png", "no picture at all, though long enough to be one"),
        fileOf("torn.png", headerOf(4, 4)), fileOf("bomb.png", headerOf(60000, 60000)),
        fileOf("none.png", headerOf(0, 4))}) {
    EXPECT_EQ(shown(SKIA_IMAGE, file), missing) << file;
  }
}

TEST(PictureTest, AFileThatAppearsIsShown) {
  PictureCache cache;
  const std::string name = testing::TempDir() + "/PictureTestLate.png";
  EXPECT_EQ(cache.scaled(name, {4, 4}), nullptr);
  std::rename(writePicture(".png", {3, 3}, kRed).c_str(), name.c_str());
  EXPECT_NE(cache.scaled(name, {4, 4}), nullptr);
  std::remove(name.c_str());
  EXPECT_NE(cache.scaled(name, {4, 4}), nullptr) << "from the cache";
  EXPECT_EQ(cache.scaled(name, {4, 5}), nullptr);
}

TEST(PictureTest, KeepsABoundedNumberOfBytes) {
  PictureCache cache;
  const std::string file = writePicture(".png", {2, 2}, kRed);
  for (int w = 1001; w < 1030; ++w) ASSERT_NE(cache.scaled(file, {w, 1000}), nullptr);
  EXPECT_LE(cache.bytes(), PictureCache::kMostBytes);
  EXPECT_GT(cache.bytes(), PictureCache::kMostBytes / 2);
  EXPECT_EQ(cache.scaled(file, {PictureCache::kMostSide + 1, 1}), nullptr);
  EXPECT_EQ(cache.scaled(file, {8000, 8000}), nullptr);
}

}  // namespace
}  // namespace brimol::pc
