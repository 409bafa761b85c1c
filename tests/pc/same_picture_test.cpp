#include <gtest/gtest.h>

#include <array>
#include <cstdio>
#include <fstream>
#include <memory>
#include <string>

namespace {

struct PipeCloser {
  void operator()(std::FILE* pipe) const { pclose(pipe); }
};

// What the sample program prints in the given surroundings.
std::string sampleWith(const std::string& surroundings) {
  const std::string command = "env " + surroundings + " " + PAINT_SAMPLE + " 2>&1";
  const std::unique_ptr<std::FILE, PipeCloser> pipe(popen(command.c_str(), "r"));
  std::string output;
  std::array<char, 256> line = {};
  while (std::fgets(line.data(), line.size(), pipe.get()) != nullptr) output += line.data();
  return output;
}

std::string ownFontSettings() {
  std::string path = testing::TempDir() + "/fonts.conf";
  std::ofstream(path) << "<fontconfig><dir>/usr/share/fonts</dir><match target=\"font\">"
                         "<edit name=\"antialias\" mode=\"assign\"><bool>false</bool></edit>"
                         "<edit name=\"embolden\" mode=\"assign\"><bool>true</bool></edit>"
                         "</match></fontconfig>";
  return path;
}

TEST(SamePictureTest, InAnySurroundings) {
  const std::string expected = sampleWith("LC_ALL=C");
  ASSERT_EQ(expected.size(), 17U) << expected;
  for (const std::string& surroundings :
       {std::string("LANG=ja_JP.UTF-8 LC_ALL=ja_JP.UTF-8"), std::string("LC_ALL=C.UTF-8"),
        std::string("PANGO_LANGUAGE=ja:ur:tr:mr:sr"),
        std::string("LANGUAGE=ko:ur LANG=ko_KR.UTF-8"),
        std::string("FC_LANG=ja GDK_DPI_SCALE=2 GDK_SCALE=2"),
        "FONTCONFIG_FILE=" + ownFontSettings(), std::string("FONTCONFIG_FILE=/nowhere/fonts.conf"),
        std::string("FONTCONFIG_PATH=/nowhere FONTCONFIG_SYSROOT=/nowhere"),
        std::string("HOME=/nowhere XDG_CACHE_HOME=/nowhere XDG_CONFIG_HOME=/nowhere")}) {
    EXPECT_EQ(sampleWith(surroundings), expected) << surroundings;
  }
}

}  // namespace
