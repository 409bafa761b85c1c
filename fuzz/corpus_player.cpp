// The main function of a fuzzer that is built without libFuzzer: plays files, and those of folders,
// once each. For debuggers, for sanitizers of GCC, and for scripts/coverage.sh.
#include <cstddef>
#include <cstdint>
#include <cstdio>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <span>
#include <vector>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size);
extern "C" [[gnu::weak]] int LLVMFuzzerInitialize(int* count, char*** words);

namespace {

namespace fs = std::filesystem;

/// False if it cannot be read.
bool play(const fs::path& file) {
  std::ifstream stream(file, std::ios::binary);
  const std::vector<char> read{std::istreambuf_iterator<char>(stream), {}};
  if (!stream) {
    std::fprintf(stderr, "cannot read '%s'\n", file.c_str());
    return false;
  }
  const std::vector<std::uint8_t> bytes(read.begin(), read.end());
  LLVMFuzzerTestOneInput(bytes.data(), bytes.size());
  return true;
}

bool playAll(const fs::path& place) {
  if (!fs::is_directory(place)) return play(place);
  bool areRead = true;
  for (const auto& entry : fs::directory_iterator(place)) areRead = play(entry.path()) && areRead;
  return areRead;
}

}  // namespace

int main(int count, char** words) {
  if (count < 2) {
    std::fprintf(stderr, "which files or folders of them?\n");
    return 2;
  }
  if (LLVMFuzzerInitialize != nullptr) LLVMFuzzerInitialize(&count, &words);
  bool areRead = true;
  for (const char* place : std::span(words, static_cast<std::size_t>(count)).subspan(1)) {
    areRead = playAll(place) && areRead;
  }
  return areRead ? 0 : 1;
}
