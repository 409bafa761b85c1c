// Prints the sum of a picture with texts of many scripts. A program of its own, since what is
// painted first settles much for the rest of a process.
#include <clocale>
#include <iostream>

#include "pc/support/painting.h"

int main() {
  using namespace brimol::pc;
  std::setlocale(LC_ALL, "");
  const SKIA_Text text = textOf("fi İ i 骨直令 한 عربي ہے שלום हिन्दी ไทย Ж", 30);
  std::size_t sum = 0;
  for (const uint32_t pixel :
       painted({textItem(SKIA_LABEL, {0, 0, 440, 100, 0}, text)}, {440, 100}).pixels) {
    sum = sum * 31 + pixel;
  }
  std::cout << sum << '\n';
}
