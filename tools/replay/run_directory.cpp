#include "run_directory.h"

#include <algorithm>
#include <initializer_list>

#include "album.h"
#include "bundle.h"
#include "input/inside.h"
#include "picture.h"
#include "session.h"

namespace brimol::replay {

namespace fs = std::filesystem;

namespace {

// The first name that is free.
fs::path makeNew(const std::string& title) {
  constexpr int kMost = 100'000;
  const std::string name = "replay-" + title;
  std::error_code failure;
  for (int number = 1; number < kMost && !failure; ++number) {
    fs::path folder = number == 1 ? name : name + "-" + std::to_string(number);
    if (fs::create_directory(folder, failure)) return folder;
  }
  return {};
}

// What an earlier run wrote; nothing where no record of one is there. The record comes last, so
// that a folder that was not emptied to the end is still one with an earlier run.
std::vector<fs::path> filesOfRun(const fs::path& folder) {
  if (!parseRecord(bytesOf(folder / kRecordFileName))) return {};
  std::vector<fs::path> files = unpackedFiles(folder / kUnpackedName);
  const auto add = [&](const std::string& name) {
    std::error_code failure;
    const auto file = fileOf(folder, name);
    if (file && fs::is_regular_file(fs::symlink_status(*file, failure))) files.push_back(*file);
  };
  const auto addPicture = [&](const std::string& name) {
    if (fs::path(name).extension() == ".png") add(name);
  };
  const Session session = readSession(folder / kSessionName);
  for (const Frame& frame : session.frames) addPicture(frame.picture);
  for (const Happening& happening : session.happenings) addPicture(happening.picture);
  for (const char* const name : {kOutputName, kReportName, "failed.png", "failed.items.txt",
                                 kSessionName, kRecordFileName}) {
    add(name);
  }
  return files;
}

// The one of `needed` that is among the files, or below one of them.
std::optional<fs::path> findNeeded(const std::vector<fs::path>& files, const fs::path& folder,
                                   const std::vector<fs::path>& needed) {
  for (const fs::path& one : needed) {
    const auto holds = [&one](const fs::path& file) { return isInside(file, one); };
    if (isInside(folder, one) && std::ranges::any_of(files, holds)) return one;
  }
  return {};
}

void removeRun(const std::vector<fs::path>& files, const fs::path& folder) {
  const bool hasUnpacked = !unpackedFiles(folder / kUnpackedName).empty();
  std::error_code ignored;
  for (const fs::path& file : files) fs::remove_all(file, ignored);
  if (hasUnpacked) fs::remove(folder / kUnpackedName, ignored);  // if nothing else is in it
}

}  // namespace

std::optional<fs::path> prepareRunDirectory(const fs::path& wanted, const std::string& title,
                                            const std::vector<fs::path>& needed,
                                            std::string& error) {
  if (wanted.empty()) {
    const fs::path made = makeNew(title);
    if (!made.empty()) return fs::absolute(made);
    error = "cannot make a folder for the run here; --dir names another";
    return {};
  }
  std::error_code failure;
  fs::create_directories(wanted, failure);
  if (!fs::is_directory(wanted, failure)) {
    error = wanted.native() + ": cannot make this folder";
    return {};
  }
  const std::vector<fs::path> earlier = filesOfRun(wanted);
  if (!fs::is_empty(wanted, failure) && earlier.empty()) {
    error = wanted.native() + ": holds other things than an earlier run";
    return {};
  }
  if (const auto lost = findNeeded(earlier, wanted, needed)) {
    error = lost->native() + ": would be removed with the earlier run in " + wanted.native();
    return {};
  }
  removeRun(earlier, wanted);
  return fs::absolute(wanted);
}

}  // namespace brimol::replay
