/// Names that nobody else has.
#pragma once

#include <string>

namespace factory_test {

/// A new random UUID, version 4, as 36 characters.
std::string newUuid();

}  // namespace factory_test
