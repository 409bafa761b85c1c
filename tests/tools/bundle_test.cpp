#include "bundle.h"

#include <archive.h>
#include <archive_entry.h>
#include <gmock/gmock.h>
#include <sys/stat.h>

#include "runs.h"
#include "trace_files.h"

namespace brimol::replay {
namespace {

using testing::HasSubstr;
namespace fs = std::filesystem;

const RunRecord kRecord = {
    "1.0", "/somewhere/a.trace", {"app", "--flag", ""}, {{"BRIMOL_SCREEN", "480x800"}}, "passed"};

class Bundle : public InFolder {
 protected:
  // An archive with one file.
  fs::path archiveWith(const char* name, int type, const std::string& bytes) const {
    fs::path file = folder / "odd.tar.gz";
    archive* const writer = archive_write_new();
    archive_write_set_format_pax_restricted(writer);
    archive_write_add_filter_gzip(writer);
    archive_write_open_filename(writer, file.c_str());
    archive_entry* const entry = archive_entry_new();
    archive_entry_set_pathname(entry, name);
    archive_entry_set_filetype(entry, static_cast<unsigned>(type));
    archive_entry_set_perm(entry, 0644);
    if (type == AE_IFLNK) archive_entry_set_symlink(entry, "/etc/passwd");
    archive_entry_set_size(entry, static_cast<la_int64_t>(bytes.size()));
    archive_write_header(writer, entry);
    archive_write_data(writer, bytes.data(), bytes.size());
    archive_entry_free(entry);
    archive_write_free(writer);
    return file;
  }
};

TEST_F(Bundle, BringsEverythingBack) {
  write("traces/deep/a.trace",
        "brimol-trace 1\ninclude ../common.trace #\ninclude \"b\\x20\\\"c.trace\"\n");
  write("traces/common.trace", "brimol-trace 1\n# include none.trace\n");
  write("traces/deep/b \"c.trace", "brimol-trace 1\n");
  write("traces/other.trace", "not included");
  write("run/session.jsonl", "{}\n");
  write("run/bundle/old", "of an earlier one");
  const std::string bytes("\0\xff\n", 3);
  write("run/shots/x.png", bytes);
  const fs::path file = folder / "run" / "b.tar.gz";
  const TraceFiles packed = traceFiles(folder / "traces/deep/a.trace", folder / "traces");
  ASSERT_TRUE(writeBundle(file, kRecord, packed, folder / "run", error)) << error;
  const auto unpacked = unpackBundle(file, folder / "new", error);
  ASSERT_TRUE(unpacked) << error;
  RunRecord expected = kRecord;
  expected.trace = folder / "new/trace/deep/a.trace";
  EXPECT_EQ(unpacked->record, expected);
  EXPECT_EQ(bytesOf(unpacked->run / "shots/x.png"), bytes);
  EXPECT_FALSE(fs::exists(unpacked->run / "bundle"));
  EXPECT_FALSE(fs::exists(unpacked->run / "b.tar.gz"));
  EXPECT_FALSE(fs::exists(folder / "new/trace/other.trace"));
  EXPECT_EQ(traceFiles(expected.trace, folder / "new").files.size(), 3);
  EXPECT_FALSE(unpackBundle(file, folder / "new", error)) << "over what is there";
}

TEST_F(Bundle, RefusesWhatItCannotUse) {
  const std::string valid = jsonOf(kRecord);
  const auto refuses = [&](const fs::path& file, const char* says) {
    EXPECT_FALSE(unpackBundle(file, folder / "new", error)) << says;
    EXPECT_THAT(error, HasSubstr(file.native() + ": ")) << says;
    EXPECT_THAT(error, HasSubstr(says));
    EXPECT_FALSE(fs::exists(folder / "new")) << says;
  };
  refuses(folder / "none", "cannot be read");
  refuses(write("text", "no archive at all"), "");
  refuses(archiveWith("bundle.json", AE_IFREG, "{}"), "no valid bundle.json");
  refuses(archiveWith("bundle.json", AE_IFREG, valid), "no valid");  // its trace is elsewhere
  refuses(archiveWith("mine.txt", AE_IFREG, "x"), "holds what no bundle does: mine.txt");
  refuses(archiveWith("../outside", AE_IFREG, "x"), "holds what no bundle does: ../outside");
  refuses(archiveWith("/tmp/outside", AE_IFREG, "x"), "holds what no bundle does");
  refuses(archiveWith("run/link", AE_IFLNK, ""), "holds what no bundle does: run/link");
  EXPECT_FALSE(fs::exists(folder / "outside"));
  const fs::path whole = archiveWith("bundle.json", AE_IFREG, std::string(100'000, 'x'));
  fs::resize_file(whole, fs::file_size(whole) / 2);
  refuses(whole, "");
}

TEST_F(Bundle, HoldsNothingThatThePlatformWouldNotPlay) {
  const auto refuses = [&](const char* include, const char* says) {
    const fs::path trace = write("t/a.trace", std::string("brimol-trace 1\n") + include + "\n");
    EXPECT_FALSE(writeBundle(folder / "b", kRecord, traceFiles(trace, {}), folder / "run", error));
    EXPECT_THAT(error, HasSubstr(says));
  };
  write("secret.trace", "brimol-trace 1\n");
  fs::create_directory(folder / "t");
  ASSERT_EQ(::mkfifo((folder / "t/pipe").c_str(), 0600), 0);
  fs::create_symlink("../secret.trace", folder / "t/link");
  refuses("include none.trace", "a.trace:2: ");
  refuses("include pipe", "pipe' cannot be read");
  refuses("include ../secret.trace", "secret.trace' cannot be read");
  refuses("include link", "link' cannot be read");
  refuses("+5 include a.trace", "a.trace:2: ");
  EXPECT_FALSE(fs::exists(folder / "b"));
  const TraceFiles fit = traceFiles(folder / "secret.trace", {});
  EXPECT_FALSE(writeBundle(folder / "no/b", kRecord, fit, folder / "t", error));
  EXPECT_THAT(error, HasSubstr("cannot be written"));
}

}  // namespace
}  // namespace brimol::replay
