#include "remote/web_answers.h"

#include <unistd.h>

#include <algorithm>
#include <array>

#include "page_parts.h"

namespace brimol::pc {
namespace {

constexpr const char* kScript = "text/javascript";
constexpr std::string_view kNoVncPath = "/novnc/";
constexpr std::string_view kNoVncCore = "core/rfb.js";

struct PartRow {
  std::string_view path;
  const char* type;
  std::string_view text;
};
constexpr auto kParts = std::to_array<PartRow>({
    {"/", "text/html; charset=utf-8", kScreenHtml},
    {"/screen.css", "text/css", kScreenCss},
    {"/screen.js", kScript, kScreenJs},
    {"/fingers.js", kScript, kFingersJs},
});

// Names of letters, figures, - and _, with one dot before the ending, in folders of such names.
bool isScript(std::string_view path) {
  const auto isPlain = [](char c) {
    return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || (c >= '0' && c <= '9') || c == '-' ||
           c == '_' || c == '/';
  };
  constexpr std::string_view kEnding = ".js";
  if (!path.ends_with(kEnding)) return false;
  path.remove_suffix(kEnding.size());
  return (path.starts_with("core/") || path.starts_with("vendor/")) &&
         std::ranges::all_of(path, isPlain);
}

std::string noVncFile(std::string_view path) {
  return std::string(kNoVncFolder) + '/' + std::string(path);
}

}  // namespace

std::optional<WebAnswer> webAnswer(std::string_view path) {
  const auto* const part = std::ranges::find(kParts, path, &PartRow::path);
  if (part != kParts.end()) return WebAnswer{part->type, part->text, {}};
  if (!path.starts_with(kNoVncPath)) return std::nullopt;
  path.remove_prefix(kNoVncPath.size());
  if (!isScript(path)) return std::nullopt;
  return WebAnswer{kScript, {}, noVncFile(path)};
}

bool hasNoVnc() { return access(noVncFile(kNoVncCore).c_str(), R_OK) == 0; }

}  // namespace brimol::pc
