#include "bundle.h"

#include <archive.h>
#include <archive_entry.h>

#include <algorithm>
#include <array>
#include <fstream>
#include <memory>
#include <nlohmann/json.hpp>

#include "picture.h"
#include "run_directory.h"
#include "trace_files.h"

namespace brimol::replay {

namespace fs = std::filesystem;

namespace {

using nlohmann::json;

constexpr auto kRecordName = "bundle.json";
constexpr int kFormat = 1;
constexpr int64_t kMostBytes = int64_t{4} << 30;  // unpacked

struct WriterDeleter {
  void operator()(archive* writer) const { archive_write_free(writer); }
};
struct ReaderDeleter {
  void operator()(archive* reader) const { archive_read_free(reader); }
};
struct EntryDeleter {
  void operator()(archive_entry* entry) const { archive_entry_free(entry); }
};
using Writer = std::unique_ptr<archive, WriterDeleter>;
using Reader = std::unique_ptr<archive, ReaderDeleter>;
using Entry = std::unique_ptr<archive_entry, EntryDeleter>;

std::string reasonOf(archive* source) {
  const char* const reason = archive_error_string(source);
  return reason != nullptr ? reason : "unknown failure";
}

// Files have no times and owners, so that equal runs give equal archives.
bool addFile(const Writer& writer, const fs::path& name, const std::string& bytes) {
  constexpr mode_t kMode = 0644;
  const Entry entry(archive_entry_new());
  archive_entry_set_pathname(entry.get(), name.generic_string().c_str());
  archive_entry_set_size(entry.get(), static_cast<la_int64_t>(bytes.size()));
  archive_entry_set_filetype(entry.get(), AE_IFREG);
  archive_entry_set_perm(entry.get(), kMode);
  archive_entry_set_mtime(entry.get(), 0, 0);
  return archive_write_header(writer.get(), entry.get()) == ARCHIVE_OK &&
         archive_write_data(writer.get(), bytes.data(), bytes.size()) ==
             static_cast<la_ssize_t>(bytes.size());
}

// The files below a folder, by their names from there. What an earlier bundle left is none of it.
std::vector<fs::path> filesBelow(const fs::path& folder) {
  std::vector<fs::path> files;
  std::error_code failure;
  for (fs::recursive_directory_iterator entry(folder, failure), end; !failure && entry != end;
       entry.increment(failure)) {
    if (entry.depth() == 0 && entry->path().filename() == kUnpackedName) {
      entry.disable_recursion_pending();
    } else if (entry->is_regular_file()) {
      files.push_back(entry->path().lexically_relative(folder));
    }
  }
  std::ranges::sort(files);
  return files;
}

bool addAll(const Writer& writer, const RunRecord& record, const TraceFiles& trace,
            const fs::path& run, const fs::path& bundle) {
  RunRecord packed = record;
  packed.trace = ("trace" / trace.files.front()).generic_string();
  if (!addFile(writer, kRecordName, jsonOf(packed))) return false;
  for (const fs::path& file : trace.files) {
    if (!addFile(writer, "trace" / file, bytesOf(trace.root / file))) return false;
  }
  std::error_code failure;
  for (const fs::path& file : filesBelow(run)) {
    if (fs::equivalent(run / file, bundle, failure)) continue;  // it stands in the run's folder
    if (!addFile(writer, "run" / file, bytesOf(run / file))) return false;
  }
  return true;
}

// Regular files alone, below the folder.
bool isFit(archive_entry* entry) {
  const char* const name = archive_entry_pathname(entry);
  if (name == nullptr || archive_entry_filetype(entry) != AE_IFREG) return false;
  if (archive_entry_hardlink(entry) != nullptr) return false;
  const fs::path path(name);
  return !path.empty() && path.is_relative() && std::ranges::find(path, "..") == path.end();
}

// False: it cannot be written.
bool copyData(archive* reader, const fs::path& file, int64_t& left) {
  std::error_code failure;
  fs::create_directories(file.parent_path(), failure);
  std::ofstream stream(file, std::ios::binary);
  std::array<char, 1 << 16> bytes{};
  for (;;) {
    const la_ssize_t count = archive_read_data(reader, bytes.data(), bytes.size());
    if (count == 0) return stream.flush().good();
    left -= count;
    if (count < 0 || left < 0 || !stream.write(bytes.data(), count)) return false;
  }
}

bool unpack(const Reader& reader, const fs::path& folder, std::string& error) {
  archive_entry* entry = nullptr;
  int64_t left = kMostBytes;
  for (;;) {
    const int result = archive_read_next_header(reader.get(), &entry);
    if (result == ARCHIVE_EOF) return true;
    if (result != ARCHIVE_OK) {
      error = "is no bundle, or is damaged: " + reasonOf(reader.get());
      return false;
    }
    if (!isFit(entry)) {
      const char* const name = archive_entry_pathname(entry);
      error =
          "holds what no bundle does: " + std::string(name != nullptr ? name : "a nameless file");
      return false;
    }
    if (!copyData(reader.get(), folder / archive_entry_pathname(entry), left)) {
      error = "cannot be unpacked to " + folder.native();
      return false;
    }
  }
}

}  // namespace

std::string jsonOf(const RunRecord& record) {
  const json object = {{"format", kFormat},
                       {"version", record.version},
                       {"trace", record.trace},
                       {"command", record.command},
                       {"environment", record.environment},
                       {"verdict", record.verdict}};
  return object.dump(2, ' ', false, json::error_handler_t::replace) + "\n";
}

std::optional<RunRecord> parseRecord(const std::string& text) {
  try {
    const json object = json::parse(text);
    if (object.at("format") != kFormat) return {};
    return RunRecord{object.at("version"), object.at("trace"), object.at("command"),
                     object.at("environment"), object.at("verdict")};
  } catch (const json::exception&) {
    return {};
  }
}

bool writeBundle(const fs::path& bundle, const RunRecord& record, const fs::path& trace,
                 const fs::path& run, std::string& error) {
  const auto files = traceFiles(trace, error);
  if (!files) return false;
  const Writer writer(archive_write_new());
  archive_write_set_format_pax_restricted(writer.get());
  archive_write_add_filter_gzip(writer.get());
  archive_write_set_filter_option(writer.get(), "gzip", "timestamp", nullptr);
  if (archive_write_open_filename(writer.get(), bundle.c_str()) == ARCHIVE_OK &&
      addAll(writer, record, *files, run, bundle) &&
      archive_write_close(writer.get()) == ARCHIVE_OK) {
    return true;
  }
  error = bundle.native() + ": cannot be written: " + reasonOf(writer.get());
  return false;
}

std::optional<UnpackedBundle> unpackBundle(const fs::path& bundle, const fs::path& folder,
                                           std::string& error) {
  constexpr std::size_t kBlockBytes = std::size_t{1} << 16;
  const Reader reader(archive_read_new());
  archive_read_support_filter_gzip(reader.get());
  archive_read_support_format_tar(reader.get());
  if (archive_read_open_filename(reader.get(), bundle.c_str(), kBlockBytes) != ARCHIVE_OK) {
    error = bundle.native() + ": cannot be read: " + reasonOf(reader.get());
    return {};
  }
  if (!unpack(reader, folder, error)) {
    error = bundle.native() + ": " + error;
    return {};
  }
  auto record = parseRecord(bytesOf(folder / kRecordName));
  const bool isInside = record && !record->command.empty() && record->trace.starts_with("trace/") &&
                        record->trace.find("..") == std::string::npos;
  if (!isInside) {
    error = bundle.native() + ": has no valid " + kRecordName;
    return {};
  }
  record->trace = (folder / record->trace).native();
  return UnpackedBundle{std::move(*record), folder / "run"};
}

}  // namespace brimol::replay
