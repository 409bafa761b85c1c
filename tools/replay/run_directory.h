/// The folder that a run leaves its files in.
#pragma once

#include <filesystem>
#include <optional>
#include <string>
#include <vector>

namespace brimol::replay {

constexpr auto kSessionName = "session.jsonl";
constexpr auto kOutputName = "output.txt";
constexpr auto kReportName = "report.html";
constexpr auto kRecordFileName = "run.json";
constexpr auto kUnpackedName = "bundle";  // a folder

/// Makes the folder if it is missing, and removes the files of an earlier run from it: of one that
/// left its record there. An empty name: makes a new one in the working directory, named after
/// `title`. Its absolute path; nothing, with one line in `error`, if it holds other things than a
/// run, if one of the `needed` files would be removed, or if it cannot be made.
std::optional<std::filesystem::path> prepareRunDirectory(
    const std::filesystem::path& wanted, const std::string& title,
    const std::vector<std::filesystem::path>& needed, std::string& error);

}  // namespace brimol::replay
