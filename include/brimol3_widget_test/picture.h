/// Pictures of frames, painted as the PC platform paints them.
#pragma once

#include <brimol3_widget_test/records.h>

#include <cstdint>
#include <filesystem>
#include <vector>

namespace brimol::test {

/// In pixels.
struct ScreenSize {
  int width;   ///< across
  int height;  ///< down
  friend bool operator==(const ScreenSize&, const ScreenSize&) = default;
};

/// Pixels by rows, 0x00RRGGBB.
struct Picture {
  ScreenSize size = {0, 0};           ///< in pixels
  std::vector<uint32_t> pixels = {};  ///< `width` times `height`

  /// Throws std::out_of_range for a place outside the picture.
  uint32_t at(int x, int y) const;
  friend bool operator==(const Picture&, const Picture&) = default;
};

/// The items on a black ground, in full light. A name of a picture file is looked for from the
/// working directory. Any thread.
Picture paint(const Frame& frame, ScreenSize size);

/// Without a size where there is no such PNG file.
Picture readPicture(const std::filesystem::path& file);
/// As PNG, in a folder that exists. Whether it could be written.
bool writePicture(const Picture& picture, const std::filesystem::path& file);

}  // namespace brimol::test
