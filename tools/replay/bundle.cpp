#include "bundle.h"

#include <archive.h>
#include <archive_entry.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <fstream>
#include <memory>
#include <nlohmann/json.hpp>

#include "files.h"
#include "picture.h"
#include "run_directory.h"

namespace brimol::replay {

namespace fs = std::filesystem;

namespace {

using nlohmann::json;

constexpr auto kRecordName = "bundle.json";
constexpr auto kTraceName = "trace";  // folders
constexpr auto kRunName = "run";
constexpr int kFormat = 1;
constexpr std::size_t kBlockBytes = std::size_t{1} << 16;
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
bool addHeader(const Writer& writer, const fs::path& name, uintmax_t size) {
  constexpr mode_t kMode = 0644;
  const Entry entry(archive_entry_new());
  archive_entry_set_pathname(entry.get(), name.generic_string().c_str());
  archive_entry_set_size(entry.get(), static_cast<la_int64_t>(size));
  archive_entry_set_filetype(entry.get(), AE_IFREG);
  archive_entry_set_perm(entry.get(), kMode);
  archive_entry_set_mtime(entry.get(), 0, 0);
  return archive_write_header(writer.get(), entry.get()) == ARCHIVE_OK;
}

bool addBytes(const Writer& writer, std::string_view bytes) {
  return archive_write_data(writer.get(), bytes.data(), bytes.size()) ==
         static_cast<la_ssize_t>(bytes.size());
}

bool addFile(const Writer& writer, const fs::path& name, const fs::path& file) {
  std::error_code failure;
  uintmax_t left = fs::file_size(file, failure);
  std::ifstream stream(file, std::ios::binary);
  if (failure || !stream) {
    archive_set_error(writer.get(), EIO, "%s cannot be read", file.c_str());
    return false;
  }
  if (!addHeader(writer, name, left)) return false;
  std::array<char, kBlockBytes> bytes{};
  while (left > 0) {
    stream.read(bytes.data(), static_cast<std::streamsize>(std::min(left, kBlockBytes)));
    const auto count = static_cast<std::size_t>(stream.gcount());
    if (count == 0 || !addBytes(writer, {bytes.data(), count})) return false;
    left -= count;
  }
  return true;
}

// The files of a run, by their names from its folder. What was unpacked is none of it, nor is an
// earlier bundle that the new one replaces.
std::vector<fs::path> filesToPack(const fs::path& folder, const fs::path& bundle) {
  std::vector<fs::path> files;
  std::error_code failure;
  std::error_code ignored;
  for (fs::recursive_directory_iterator entry(folder, failure), end; !failure && entry != end;
       entry.increment(failure)) {
    if (entry.depth() == 0 && entry->path().filename() == kUnpackedName) {
      entry.disable_recursion_pending();
    } else if (entry->is_regular_file() && !fs::equivalent(entry->path(), bundle, ignored)) {
      files.push_back(entry->path().lexically_relative(folder));
    }
  }
  std::ranges::sort(files);
  return files;
}

/// What goes into a bundle.
struct Contents {
  const TraceFiles& trace;
  const fs::path& run;
  const std::vector<fs::path> files;  // of the run, below its folder
};

bool addAll(const Writer& writer, RunRecord record, const Contents& contents) {
  const fs::path folder = contents.trace.folder();
  const auto packedName = [&folder](const fs::path& file) {
    return kTraceName / file.lexically_relative(folder);
  };
  record.trace = packedName(contents.trace.files.front()).generic_string();
  const std::string text = jsonOf(record);
  return addHeader(writer, kRecordName, text.size()) && addBytes(writer, text) &&
         std::ranges::all_of(
             contents.trace.files,
             [&](const fs::path& file) { return addFile(writer, packedName(file), file); }) &&
         std::ranges::all_of(contents.files, [&](const fs::path& file) {
           return addFile(writer, kRunName / file, contents.run / file);
         });
}

// The library leaks its compressor where a write fails, so that the stream alone knows of it.
la_ssize_t writeSome(archive*, void* stream, const void* bytes, std::size_t count) {
  static_cast<std::ofstream*>(stream)->write(static_cast<const char*>(bytes),
                                             static_cast<std::streamsize>(count));
  return static_cast<la_ssize_t>(count);
}

// False, with `reason` where the file is not to blame, if it cannot be written.
bool writeArchive(const fs::path& file, const RunRecord& record, const Contents& contents,
                  std::string& reason) {
  std::ofstream stream(file, std::ios::binary);
  const Writer writer(archive_write_new());
  archive_write_set_format_pax_restricted(writer.get());
  archive_write_add_filter_gzip(writer.get());
  archive_write_set_filter_option(writer.get(), "gzip", "timestamp", nullptr);
  archive_write_set_bytes_in_last_block(writer.get(), 1);  // nothing behind the compressed bytes
  const bool isWhole =
      archive_write_open(writer.get(), &stream, nullptr, writeSome, nullptr) == ARCHIVE_OK &&
      addAll(writer, record, contents) && archive_write_close(writer.get()) == ARCHIVE_OK;
  if (!isWhole) reason = ": " + reasonOf(writer.get());
  stream.close();
  return isWhole && stream.good();
}

// What a bundle holds: regular files alone, below the folder.
bool isFit(archive_entry* entry) {
  const char* const name = archive_entry_pathname(entry);
  if (name == nullptr || archive_entry_filetype(entry) != AE_IFREG) return false;
  if (archive_entry_hardlink(entry) != nullptr) return false;
  const fs::path path(name);
  if (path.empty() || std::ranges::find(path, "..") != path.end()) return false;
  return path == kRecordName || *path.begin() == kTraceName || *path.begin() == kRunName;
}

// False: it cannot be written.
bool copyData(archive* reader, const fs::path& file, int64_t& left) {
  std::error_code failure;
  fs::create_directories(file.parent_path(), failure);
  std::ofstream stream(file, std::ios::binary);
  std::array<char, kBlockBytes> bytes{};
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

// The packed run's record, its trace named below the folder.
std::optional<RunRecord> unpackInto(const fs::path& folder, const fs::path& bundle,
                                    std::string& error) {
  const Reader reader(archive_read_new());
  archive_read_support_filter_gzip(reader.get());
  archive_read_support_format_tar(reader.get());
  if (archive_read_open_filename(reader.get(), bundle.c_str(), kBlockBytes) != ARCHIVE_OK) {
    error = "cannot be read: " + reasonOf(reader.get());
    return {};
  }
  if (!unpack(reader, folder, error)) return {};
  auto record = parseRecord(bytesOf(folder / kRecordName));
  const bool isInside = record && !record->command.empty() && record->trace.starts_with("trace/") &&
                        record->trace.find("..") == std::string::npos;
  if (!isInside) {
    error = std::string("has no valid ") + kRecordName;
    return {};
  }
  record->trace = (folder / record->trace).native();
  return record;
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

bool writeBundle(const fs::path& bundle, const RunRecord& record, const TraceFiles& trace,
                 const fs::path& run, std::string& error) {
  if (!trace.error.empty()) {
    error = bundle.native() + ": the trace cannot be packed: " + trace.error;
    return false;
  }
  const Contents contents{trace, run, filesToPack(run, bundle)};
  std::string reason;
  const auto write = [&](const fs::path& target) {
    return writeArchive(target, record, contents, reason);
  };
  if (writeWhole(bundle, write)) return true;
  error = bundle.native() + ": cannot be written" + reason;
  return false;
}

std::optional<UnpackedBundle> unpackBundle(const fs::path& bundle, const fs::path& folder,
                                           std::string& error) {
  std::error_code failure;
  if (!fs::create_directory(folder, failure)) {
    error = folder.native() + ": is there already, or cannot be made";
    return {};
  }
  auto record = unpackInto(folder, bundle, error);
  if (record) return UnpackedBundle{std::move(*record), folder / kRunName};
  error = bundle.native() + ": " + error;
  fs::remove_all(folder, failure);
  return {};
}

std::vector<fs::path> unpackedFiles(const fs::path& folder) {
  std::error_code failure;
  const bool isFolder = fs::is_directory(fs::symlink_status(folder, failure));
  if (!isFolder || !parseRecord(bytesOf(folder / kRecordName))) return {};
  return {folder / kTraceName, folder / kRunName, folder / kRecordName};
}

}  // namespace brimol::replay
