// The gallery is whole, and its page among the documents is the one that its examples give.
#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <regex>
#include <set>
#include <string>
#include <vector>

#include "document.h"
#include "example.h"

namespace gallery {

namespace {

namespace fs = std::filesystem;
using Groups = std::vector<std::string>;

std::string readText(const fs::path& file) {
  std::ifstream in(file);
  return {std::istreambuf_iterator<char>(in), {}};
}

std::vector<Groups> allMatches(const std::string& text, const char* pattern) {
  const std::regex wanted(pattern);
  std::vector<Groups> found;
  for (std::sregex_iterator next(text.begin(), text.end(), wanted), end; next != end; ++next) {
    found.emplace_back(next->begin(), next->end());
  }
  return found;
}

bool names(const std::string& code, const std::string& word) {
  return std::regex_search(code, std::regex("\\b" + word + "\\b"));
}

std::string shownCode() {
  std::string code;
  for (const Family& family : families()) {
    if (family.shared != nullptr) code += functionIn(family.source, family.shared);
    for (const Example& example : family.examples) code += codeOf(family, example);
  }
  return code;
}

// Classes derived from others, but for those whose comment says that they are not used by
// themselves.
Groups widgetClasses() {
  Groups classes;
  for (const auto& header : fs::directory_iterator(PUBLIC_HEADERS)) {
    if (!header.is_regular_file()) continue;
    // Each comment becomes one line.
    const std::string text = std::regex_replace(readText(header), std::regex("\n */// ?"), " ");
    for (const Groups& found : allMatches(text, "(.*)\nclass MW_API (\\w+) : public")) {
      if (!names(found.at(1), "not used by itself")) classes.push_back(found.at(2));
    }
  }
  return classes;
}

TEST(Gallery, ShowsEveryClass) {
  const std::string code = shownCode();
  const Groups classes = widgetClasses();
  EXPECT_EQ(std::ranges::count(classes, "Button"), 1) << "no class was found";
  for (const std::string& name : classes) {
    EXPECT_TRUE(names(code, "MW::" + name)) << "no example of " << name;
  }
}

TEST(Gallery, ShowsEveryPrompt) {
  const std::string header = readText(PUBLIC_HEADERS "/dialog.h");
  const std::size_t from = header.find("enum Kind {");
  const auto kinds =
      allMatches(header.substr(from, header.find("};", from) - from), "\n *(k\\w+) = \\d");
  const std::string code = shownCode();
  EXPECT_FALSE(kinds.empty()) << "no kind was found";
  for (const Groups& kind : kinds) {
    EXPECT_TRUE(names(code, "MW::Dialog::" + kind.at(1))) << "no example of " << kind.at(1);
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
