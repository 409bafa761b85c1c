/// Small files that are read and replaced as a whole.
#pragma once

#include <filesystem>
#include <optional>
#include <string>
#include <string_view>

namespace factory_test {

/// The first bytes of a regular file, `most` of them; empty for any other.
std::string readHead(const std::filesystem::path& file, std::size_t most);

/// What a regular file of at most `mostMiB` MiB holds. Nothing for any other, which is never waited
/// for; `error` then says why in one line that begins with the file's name.
std::optional<std::string> readFile(const std::filesystem::path& file, std::string& error,
                                    std::size_t mostMiB = 1);

/// Where a file is, or would be, by whatever symbolic links and dots it is named.
std::filesystem::path placeOfFile(const std::filesystem::path& file);

/// Whatever they are called: by what they are if both are there, else by where they would be.
bool isSameFile(const std::filesystem::path& one, const std::filesystem::path& other);

/// Whether `file` is what replaceFile() or a FileLock makes beside `kept`: FILE.tmp or FILE.lock.
bool isBeside(const std::filesystem::path& file, const std::filesystem::path& kept);

/// Puts `bytes` in the place of what the file holds, if there is one, on the disk too: at every
/// moment the old or the new bytes stand there whole. A symbolic link is followed, also one to a
/// file that is not there yet. The file keeps its mode. False: it is as it was, and `error` says
/// why as above. One program at a time may write a file; what a killed one left in FILE.tmp, the
/// next one removes.
bool replaceFile(const std::filesystem::path& file, std::string_view bytes, std::string& error);

}  // namespace factory_test
