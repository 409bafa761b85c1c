#include "bundle.h"

#include <archive.h>
#include <archive_entry.h>
#include <gmock/gmock.h>

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
        "brimol-trace 1\ninclude ../common.trace # shared\n+5 include b.trace\n");
  write("traces/common.trace", "brimol-trace 1\ninclude deep/a.trace\n");
  write("traces/deep/b.trace", "brimol-trace 1\n");
  write("traces/other.trace", "not included");
  write("run/session.jsonl", "{}\n");
  write("run/bundle/old", "of an earlier one");
  const std::string bytes("\0\xff\n", 3);
  write("run/shots/x.png", bytes);
  const fs::path file = folder / "run" / "b.tar.gz";
  ASSERT_TRUE(writeBundle(file, kRecord, folder / "traces/deep/a.trace", folder / "run", error))
      << error;
  const auto unpacked = unpackBundle(file, folder / "new", error);
  ASSERT_TRUE(unpacked) << error;
  RunRecord expected = kRecord;
  expected.trace = folder / "new/trace/deep/a.trace";
  EXPECT_EQ(unpacked->record, expected);
  EXPECT_EQ(bytesOf(unpacked->run / "shots/x.png"), bytes);
  EXPECT_FALSE(fs::exists(unpacked->run / "bundle"));
  EXPECT_FALSE(fs::exists(unpacked->run / "b.tar.gz"));
  EXPECT_FALSE(fs::exists(folder / "new/trace/other.trace"));
  EXPECT_EQ(traceFiles(expected.trace, error)->files.size(), 3) << error;
}

TEST_F(Bundle, RefusesWhatItCannotUse) {
  const std::string valid = jsonOf(kRecord);
  struct Odd {
    fs::path file;
    const char* says;
  };
  const auto refuses = [&](const fs::path& file, const char* says) {
    EXPECT_FALSE(unpackBundle(file, folder / "new", error)) << says;
    EXPECT_THAT(error, HasSubstr(file.native() + ": ")) << says;
    EXPECT_THAT(error, HasSubstr(says));
  };
  refuses(folder / "none", "cannot be read");
  refuses(write("text", "no archive at all"), "");
  refuses(archiveWith("bundle.json", AE_IFREG, "{}"), "no valid bundle.json");
  refuses(archiveWith("bundle.json", AE_IFREG, valid), "no valid");  // its trace is elsewhere
  refuses(archiveWith("../outside", AE_IFREG, "x"), "holds what no bundle does: ../outside");
  refuses(archiveWith("/tmp/outside", AE_IFREG, "x"), "holds what no bundle does");
  refuses(archiveWith("run/link", AE_IFLNK, ""), "holds what no bundle does: run/link");
  EXPECT_FALSE(fs::exists(folder / "outside"));
  const fs::path whole = archiveWith("bundle.json", AE_IFREG, std::string(100'000, 'x'));
  fs::resize_file(whole, fs::file_size(whole) / 2);
  refuses(whole, "");
}

TEST_F(Bundle, IsNotMadeOfWhatIsMissing) {
  write("a.trace", "brimol-trace 1\ninclude none.trace\n");
  EXPECT_FALSE(writeBundle(folder / "b", kRecord, folder / "a.trace", folder, error));
  EXPECT_THAT(error, HasSubstr("none.trace: cannot be read"));
  write("a.trace", "brimol-trace 1\n");
  EXPECT_FALSE(writeBundle(folder / "no/b", kRecord, folder / "a.trace", folder, error));
  EXPECT_THAT(error, HasSubstr("cannot be written"));
}

TEST(IncludedBy, ReadsTheNameAlone) {
  EXPECT_EQ(includedBy("include a b.trace"), "a b.trace");
  EXPECT_EQ(includedBy("  1500\tinclude  x.trace   # why"), "x.trace");
  EXPECT_EQ(includedBy("+20 include \"x y.trace\""), "x y.trace");
  EXPECT_EQ(includedBy("# include x"), std::nullopt);
  EXPECT_EQ(includedBy("include"), std::nullopt);
  EXPECT_EQ(includedBy("expect text \"include x\""), std::nullopt);
}

}  // namespace
}  // namespace brimol::replay
