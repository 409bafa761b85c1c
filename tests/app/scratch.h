/// A directory of a test's own.
#pragma once

#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <set>
#include <string>
#include <string_view>

namespace factory_test {

/// Empty when it is constructed, removed with all that is in it at the end.
class Scratch {
 public:
  Scratch() : name(testing::TempDir() + "/results.XXXXXX") { made = ::mkdtemp(name.data()); }
  ~Scratch() {
    std::error_code ignored;
    std::filesystem::remove_all(made, ignored);
  }
  Scratch(const Scratch&) = delete;
  Scratch& operator=(const Scratch&) = delete;
  Scratch(Scratch&&) = delete;
  Scratch& operator=(Scratch&&) = delete;

  std::filesystem::path at(const std::filesystem::path& relative) const { return made / relative; }

  void write(const std::filesystem::path& relative, std::string_view bytes) const {
    std::filesystem::create_directories(at(relative).parent_path());
    std::ofstream(at(relative), std::ios::binary) << bytes;
  }
  std::string read(const std::filesystem::path& relative) const {
    std::ifstream file(at(relative), std::ios::binary);
    return {std::istreambuf_iterator<char>(file), {}};
  }
  std::set<std::string> names() const {
    std::set<std::string> found;
    for (const auto& entry : std::filesystem::directory_iterator(made)) {
      found.insert(entry.path().filename());
    }
    return found;
  }

 private:
  std::string name;
  std::filesystem::path made;
};

}  // namespace factory_test
