/// The application's picture files.
#pragma once

#include <string>

namespace factory_test {

/// Where a picture lies: beside the program, where the build puts it, or else where the program is
/// installed with it, in ../share/factory_test.
std::string picturePath(const char* name);

}  // namespace factory_test
