/// Sessions and folders for the tests of brimol-replay.
#pragma once

#include <gtest/gtest.h>
#include <unistd.h>

#include <filesystem>
#include <fstream>
#include <string>
#include <string_view>

#include "picture.h"
#include "session.h"

namespace brimol::replay {

/// A folder of the test's own.
class InFolder : public testing::Test {
 protected:
  InFolder() { std::filesystem::create_directories(folder); }
  ~InFolder() override { std::filesystem::remove_all(folder); }

  std::filesystem::path write(const std::string& name, std::string_view bytes) const {
    std::filesystem::create_directories((folder / name).parent_path());
    std::ofstream(folder / name, std::ios::binary) << bytes;
    return folder / name;
  }
  /// A picture of one colour, with one pixel of another.
  std::string writePicture(const std::string& name, uint32_t colour, int pixel = -1) const {
    constexpr int kSide = 10;
    const Surface picture(cairo_image_surface_create(CAIRO_FORMAT_RGB24, kSide, kSide));
    auto* const pixels = reinterpret_cast<uint32_t*>(cairo_image_surface_get_data(picture.get()));
    for (int i = 0; i < kSide * kSide; ++i) pixels[i] = i == pixel ? ~colour : colour;
    cairo_surface_mark_dirty(picture.get());
    write(name, encodePng(picture));
    return name;
  }

  const std::filesystem::path folder =
      std::filesystem::path(testing::TempDir()) / ("replay_test." + std::to_string(::getpid()));
  std::string error;
};

inline Session sessionOf(std::string_view text) {
  SessionReader reader;
  reader.add(text);
  reader.finish();
  return reader.session();
}

}  // namespace brimol::replay
