// The gallery is whole, and its page among the documents is the one that its examples give.
#include <gtest/gtest.h>

#include <algorithm>
#include <cctype>
#include <filesystem>
#include <fstream>
#include <set>
#include <string>
#include <vector>

#include "document.h"
#include "example.h"

namespace gallery {

namespace {

namespace fs = std::filesystem;
using Words = std::vector<std::string>;

std::string readText(const fs::path& file) {
  std::ifstream in(file);
  return {std::istreambuf_iterator<char>(in), {}};
}

bool isName(char byte) { return std::isalnum(static_cast<unsigned char>(byte)) != 0; }

// Whether the word stands there, and not as the beginning of another one.
bool names(const std::string& code, const std::string& word) {
  for (std::size_t at = code.find(word); at != std::string::npos; at = code.find(word, at + 1)) {
    const std::size_t behind = at + word.size();
    if (behind == code.size() || !isName(code[behind])) return true;
  }
  return false;
}

std::string shownCode() {
  std::string code;
  for (const Family& family : families()) {
    if (family.shared != nullptr) code += functionIn(family.source, family.shared);
    for (const Example& example : family.examples) code += codeOf(family, example);
  }
  return code;
}

// The derived classes of a header, but for those whose comment says that they are not used by
// themselves.
void addWidgetClasses(std::istream& header, Words& classes) {
  const std::string beginning = "class MW_API ";
  std::string comment;
  for (std::string line; std::getline(header, line);) {
    const std::size_t bases = line.find(" : public");
    if (line.starts_with("///")) {
      comment += line.substr(3);
    } else if (line.starts_with(beginning) && bases != std::string::npos &&
               comment.find("not used by itself") == std::string::npos) {
      classes.push_back(line.substr(beginning.size(), bases - beginning.size()));
    }
    if (!line.starts_with("///")) comment.clear();
  }
}

Words widgetClasses() {
  Words classes;
  for (const auto& header : fs::directory_iterator(PUBLIC_HEADERS)) {
    std::ifstream in(header.path());
    if (header.is_regular_file()) addWidgetClasses(in, classes);
  }
  return classes;
}

Words promptKinds() {
  std::ifstream header(PUBLIC_HEADERS "/dialog.h");
  std::string line;
  while (std::getline(header, line) && line != "  enum Kind {") continue;
  Words kinds;
  while (std::getline(header, line) && line != "  };") {
    const std::size_t from = line.find_first_not_of(' ');
    if (line.compare(from, 1, "k") == 0) {
      kinds.push_back(line.substr(from, line.find(' ', from) - from));
    }
  }
  return kinds;
}

TEST(Gallery, ShowsEveryClass) {
  const std::string code = shownCode();
  const Words classes = widgetClasses();
  EXPECT_EQ(std::ranges::count(classes, "Button"), 1) << "no class was found";
  for (const std::string& name : classes) {
    EXPECT_TRUE(names(code, "MW::" + name)) << "no example of " << name;
  }
}

TEST(Gallery, ShowsEveryPrompt) {
  const std::string code = shownCode();
  const Words kinds = promptKinds();
  EXPECT_EQ(std::ranges::count(kinds, "kRetryTest"), 1) << "no kind was found";
  for (const std::string& kind : kinds) {
    EXPECT_TRUE(names(code, "MW::Dialog::" + kind)) << "no example of " << kind;
  }
}

TEST(Gallery, HasANameAndCodeForEachExample) {
  std::set<std::string> used;
  for (const Family& family : families()) {
    for (const Example& example : family.examples) {
      EXPECT_TRUE(used.insert(example.name).second) << example.name << " is there twice";
      EXPECT_TRUE(names(codeOf(family, example), "loop")) << "no code of " << example.name;
    }
  }
}

TEST(Gallery, PageIsAsTheExamplesGiveIt) {
  EXPECT_TRUE(readText(GALLERY_PAGE) == document())
      << "the examples have changed: run scripts/renew_goldens.sh";
}

}  // namespace

}  // namespace gallery
