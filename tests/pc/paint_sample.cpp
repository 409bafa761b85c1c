// Prints a checksum of a picture with texts of every script, for a test that runs it in different
// surroundings.
#include <clocale>
#include <cstdio>

#include "painting.h"

namespace {

constexpr uint64_t kOffset = 14695981039346656037U;  // 64-bit FNV-1a
constexpr uint64_t kPrime = 1099511628211U;

uint64_t checksumOf(const brimol::pc::Picture& picture) {
  uint64_t sum = kOffset;
  for (const uint32_t pixel : picture.pixels) sum = (sum ^ pixel) * kPrime;
  return sum;
}

}  // namespace

int main() {
  std::setlocale(LC_ALL, "");
  brimol::pc::Frame frame;
  int32_t y = 0;
  for (const char* const words :
       {"Latin fi İ i", "骨直 今令 한국어", "عربي اردو ہے", "שלום", "हिन्दी ไทย", "Ж б Ω"}) {
    frame.push_back(
        brimol::pc::textItem(SKIA_LABEL, {0, y, 600, 60, 0}, brimol::pc::textOf(words, 40)));
    y += 60;
  }
  std::printf("%016llx\n",
              static_cast<unsigned long long>(checksumOf(brimol::pc::painted(frame, {600, 360}))));
  return 0;
}
