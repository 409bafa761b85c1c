/// The application's picture files.
#pragma once

#include <string>

namespace factory_test {

/// Where a picture lies: beside the program. The build puts it there.
std::string picturePath(const char* name);

}  // namespace factory_test
