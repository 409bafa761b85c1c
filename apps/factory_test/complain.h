/// What the program says when something goes wrong.
#pragma once

#include <algorithm>
#include <cstdio>
#include <string>

namespace factory_test {

/// One line on stderr, behind the program's name. Control characters, which names of files may
/// hold, become question marks.
inline void complain(std::string why) {
  constexpr unsigned char kFirstPrintable = 0x20;
  std::ranges::replace_if(
      why, [](unsigned char letter) { return letter < kFirstPrintable; }, '?');
  std::fprintf(stderr, "factory_test: %s\n", why.c_str());
}

}  // namespace factory_test
