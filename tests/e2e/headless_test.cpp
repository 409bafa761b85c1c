// What the application refuses before its menu opens.
#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

#include <array>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <string>
#include <vector>

#include "application.h"
#include "options.h"

namespace factory_test {
namespace {

/// A folder of the test's own.
class HeadlessApplication : public testing::Test {
 protected:
  HeadlessApplication() { std::filesystem::create_directory(folder); }
  ~HeadlessApplication() override { std::filesystem::remove_all(folder); }

  const std::filesystem::path folder =
      std::filesystem::path(testing::TempDir()) / ("headless_test." + std::to_string(getpid()));
  const std::string results = folder / "results.json";
};

TEST_F(HeadlessApplication, RefusesWhatItCannotUse) {
  std::ofstream(results) << "no JSON";
  EXPECT_EQ(runApplication({.headless = true, .results = results}), ExitCode::Trouble);
  EXPECT_EQ(std::filesystem::file_size(results), 7) << "a damaged file stays as it is";
  EXPECT_EQ(runApplication({.headless = true, .shot = folder / "none" / "shot.png"}),
            ExitCode::Trouble);
  EXPECT_EQ(runApplication({.headless = true, .log = folder / "none"}), ExitCode::Trouble);
  const std::filesystem::path pipe = folder / "pipe";
  const std::filesystem::path huge = folder / "huge";
  ASSERT_EQ(mkfifo(pipe.c_str(), 0600), 0);
  std::ofstream(huge) << 'a';
  std::filesystem::resize_file(huge, 17 << 20);
  for (const std::filesystem::path& log : {folder, pipe, huge, std::filesystem::path("/dev/zero")})
    EXPECT_EQ(runApplication({.headless = true, .log = log}), ExitCode::Trouble) << log;

  struct WrongLine {
    std::vector<const char*> arguments;
    const char* word;
  };
  for (const auto& [arguments, word] : std::vector<WrongLine>{
           {{"--frobnicate"}, "--frobnicate"},
           {{"--shot"}, "--shot needs"},
           {{"--results", ""}, "--results needs"},
           {{"--device", "wvga"}, "wvga-4.0"},
           {{"--test", "colour"}, "colours"},
           {{"file"}, "'file'"},
           {{"--results", "a", "--junit", "a"}, "same file"},
           {{"--results=a", "--junit", "./a"}, "same file"},
           {{"--results=a", "--database", "a"}, "same file"},
           {{"--results", "a-wal", "--database", "a"}, "--results names the database"},
           {{"--junit=a.lock", "--database", "./a"}, "--junit names the database"},
           {{"--junit=a.lock", "--results", "./a"}, "--junit names a file that --results makes"},
           {{"--log=a.tmp", "--junit", "./a"}, "--log names a file that --junit makes"},
           {{"--monkey", "1", "--results", "a"}, "--monkey judges nothing"},
           {{"--shot", "a.png", "--database", "b"}, "--shot keeps nothing"},
           {{"--new-run"}, "--new-run needs --database"},
           {{"--line", "postgresql://a/b"}, "--line needs --database"},
           {{"--line", "a", "--database", "b"}, "--line needs an address"},
           {{"--line", "postgresql://a/%zz", "--database", "b"}, "is no address"},
           {{"--junit", results.c_str()}, "something else than a report"},
           {{"--serial", "A 1"}, "without spaces"},
           {{"--headless=yes"}, "takes no value"}}) {
    std::string error;
    EXPECT_FALSE(parseOptions(arguments, error)) << word;
    EXPECT_NE(error.find(word), std::string::npos) << error;
    auto asking = arguments;
    asking.insert(asking.begin(), "--help");
    EXPECT_TRUE(parseOptions(asking, error)) << word;
  }
}

TEST_F(HeadlessApplication, KeepsNoMonkeysVerdictsAmongOthers) {
  setenv("BRIMOL_MONKEY", "1:300", 1);
  std::string error;
  const std::string database = folder / "d.db";
  EXPECT_FALSE(parseOptions(std::array{"--stay", "--database", database.c_str()}, error));
  EXPECT_TRUE(error.starts_with("BRIMOL_MONKEY judges nothing")) << error;
  const std::array keeping = {"--stay", "--results", results.c_str()};
  EXPECT_TRUE(parseOptions(keeping, error)) << "a new file";
  std::ofstream(results) << "{}";
  EXPECT_FALSE(parseOptions(keeping, error));
  unsetenv("BRIMOL_MONKEY");
  EXPECT_TRUE(parseOptions(keeping, error)) << error;
}

}  // namespace
}  // namespace factory_test
