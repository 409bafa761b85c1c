/// Reading small files that may hold anything, and what is said about files.
#pragma once

#include <cstddef>
#include <filesystem>
#include <optional>
#include <string>
#include <string_view>

namespace factory_test {

/// What a file holds, or why it could not be read; no reason either: there is no such file.
struct FileText {
  std::optional<std::string> text = {};
  std::string reason = {};
};

/// Reads a regular file of at most `limit` bytes. Anything else (a directory, a pipe, a device, a
/// longer file) is a failure, and is never waited for.
FileText readFile(const std::filesystem::path& file, std::size_t limit);

/// "FILE: reason" in one line: control characters in the name become '?'.
std::string fileError(const std::filesystem::path& file, std::string_view reason);

/// The system's words for an error number.
std::string systemReason(int errorNumber);

/// The name of a hidden file in the same directory: ".NAME" and `suffix`.
std::filesystem::path hiddenSibling(const std::filesystem::path& file, std::string_view suffix);

}  // namespace factory_test
