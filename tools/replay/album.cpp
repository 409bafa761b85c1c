#include "album.h"

#include <algorithm>
#include <nlohmann/json.hpp>

#include "input/inside.h"
#include "picture.h"

namespace brimol::replay {

namespace fs = std::filesystem;

namespace {

// Nothing where it is larger than what is left.
std::string kept(const std::string& png, std::size_t& left) {
  if (png.size() > left) return {};
  left -= png.size();
  return base64(png);
}

}  // namespace

Album::Album(fs::path page, Bounds bounds) : folder(std::move(page)), left(bounds) {}

std::optional<std::size_t> Album::addFile(const fs::path& file) {
  const auto [entry, isNew] = files.try_emplace(file);
  if (!isNew) return entry->second;
  std::error_code failure;
  const fs::path link = fs::proximate(file, folder.empty() ? "." : folder, failure);
  entry->second = add(bytesOf(file), failure ? std::string() : link.generic_string());
  return entry->second;
}

std::optional<std::size_t> Album::addPng(const std::string& png) { return add(png, {}); }

std::optional<std::size_t> Album::add(const std::string& png, const std::string& link) {
  const auto [entry, isNew] = known.try_emplace({png.size(), hashOf(png)}, pictures.size());
  if (!isNew) return entry->second;
  const Surface picture = decodePng(png);
  if (!picture) {
    known.erase(entry);
    return {};
  }
  Picture added{cairo_image_surface_get_width(picture.get()),
                cairo_image_surface_get_height(picture.get()),
                {},
                kept(png, left.fullBytes),
                link};
  if (left.thumbBytes > 0) {
    added.thumb =
        kept(encodePng(fitted(picture, left.thumbWidth, 2 * left.thumbWidth)), left.thumbBytes);
  }
  pictures.push_back(std::move(added));
  return pictures.size() - 1;
}

nlohmann::json Album::json() const {
  nlohmann::json list = nlohmann::json::array();
  for (const Picture& picture : pictures) {
    nlohmann::json entry = {{"width", picture.width}, {"height", picture.height}};
    for (const auto& [name, value] :
         {std::pair{"thumb", &picture.thumb}, std::pair{"full", &picture.full},
          std::pair{"file", &picture.file}}) {
      if (!value->empty()) entry[name] = *value;
    }
    list.push_back(std::move(entry));
  }
  return list;
}

std::size_t Album::withoutFull() const {
  return static_cast<std::size_t>(
      std::ranges::count_if(pictures, [](const Picture& one) { return one.full.empty(); }));
}

std::optional<fs::path> fileOf(const fs::path& folder, const std::string& name) {
  const fs::path inside = fs::path(name).lexically_normal();
  const bool isOutside = name.empty() || name.find('\0') != std::string::npos ||
                         inside.is_absolute() || *inside.begin() == "..";
  if (isOutside || !isInside(folder, folder / inside)) return {};
  return folder / inside;
}

}  // namespace brimol::replay
