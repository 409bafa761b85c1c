#include "results/system_words.h"

#include <algorithm>
#include <array>
#include <cerrno>
#include <cstring>
#include <utility>

#include "language/language.h"

namespace factory_test {

namespace {

// Any other number has the C library's words.
constexpr auto kWords = std::to_array<std::pair<int, const char*>>({
    {ENOSPC, msg("the disk is full")},
    {EDQUOT, msg("the disk is full")},
    {EFBIG, msg("the file would be too large")},
    {EACCES, msg("this user has no right to")},
    {EPERM, msg("this user has no right to")},
    {EROFS, msg("the disk is read-only")},
    {ENOENT, msg("it or its folder is missing")},
    {ENOTDIR, msg("it or its folder is missing")},
    {EIO, msg("the disk does not work")},
});

}  // namespace

std::string systemWords(int number) {
  const auto* const own = std::ranges::find(kWords, number, &std::pair<int, const char*>::first);
  if (own != kWords.end()) return own->second;
  const char* const others = ::strerrordesc_np(number);
  return others == nullptr ? "error " + std::to_string(number) : others;
}

}  // namespace factory_test
