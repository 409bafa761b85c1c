#include "run_directory.h"

#include <initializer_list>

#include "album.h"
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

// What the program itself and the session's file name, and nothing else.
void removeEarlierRun(const fs::path& folder) {
  std::error_code ignored;
  const auto removeNamed = [&](const std::string& name) {
    const auto file = fileOf(folder, name);
    if (file && fs::is_regular_file(fs::symlink_status(*file, ignored))) fs::remove(*file, ignored);
  };
  const Session session = readSession(folder / kSessionName);
  for (const Frame& frame : session.frames) removeNamed(frame.picture);
  for (const Happening& happening : session.happenings) removeNamed(happening.picture);
  for (const char* const name : {kOutputName, kReportName, kRecordFileName, "failed.png",
                                 "failed.items.txt", kSessionName}) {
    removeNamed(name);
  }
  fs::remove_all(folder / kUnpackedName, ignored);
}

}  // namespace

std::optional<fs::path> prepareRunDirectory(const fs::path& wanted, const std::string& title,
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
  if (!fs::is_empty(wanted, failure) && !fs::exists(wanted / kSessionName, failure)) {
    error = wanted.native() + ": holds other things than an earlier run";
    return {};
  }
  removeEarlierRun(wanted);
  return fs::absolute(wanted);
}

}  // namespace brimol::replay
