/// The pictures of a report, each stored once.
#pragma once

#include <filesystem>
#include <map>
#include <nlohmann/json_fwd.hpp>
#include <optional>
#include <string>
#include <utility>
#include <vector>

namespace brimol::replay {

/// Takes what is shown first first: pictures in full and thumbnails are kept up to a bound each,
/// and what comes later is a thumbnail alone, or a link.
class Album {
 public:
  struct Bounds {
    std::size_t fullBytes = std::size_t{12} << 20;
    std::size_t thumbBytes = std::size_t{8} << 20;
    int thumbWidth = 216;  // at most, and twice as high
  };

  /// Links lead from `page`, the folder that the report is written to.
  Album(std::filesystem::path page, Bounds bounds);

  /// The picture's place in json(). Nothing for what is no PNG file.
  std::optional<std::size_t> addFile(const std::filesystem::path& file);
  std::optional<std::size_t> addPng(const std::string& png);

  /// A list of `width`, `height`, `thumb` and `full` (base64, if kept), `file` (a link, if there is
  /// one).
  nlohmann::json json() const;
  std::size_t withoutFull() const;

 private:
  struct Picture {
    int width, height;
    std::string thumb, full, file;
  };
  std::optional<std::size_t> add(const std::string& png, const std::string& link);

  std::filesystem::path folder;
  Bounds left;
  std::vector<Picture> pictures;
  std::map<std::pair<std::size_t, uint64_t>, std::size_t> known;  // by length and hash
  std::map<std::filesystem::path, std::optional<std::size_t>> files;
};

/// Where a file that a session names stands, if it is in the session's folder, with links followed.
std::optional<std::filesystem::path> fileOf(const std::filesystem::path& folder,
                                            const std::string& name);

}  // namespace brimol::replay
