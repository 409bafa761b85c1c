/// What the program says when something goes wrong.
#pragma once

#include <cstdio>
#include <string>

namespace factory_test {

/// One line on stderr, behind the program's name.
inline void complain(const std::string& why) {
  std::fprintf(stderr, "factory_test: %s\n", why.c_str());
}

}  // namespace factory_test
