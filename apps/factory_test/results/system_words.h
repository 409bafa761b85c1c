/// What the system says is wrong.
#pragma once

#include <string>

namespace factory_test {

/// An errno in words: English, whatever the environment's language is. Those that operators may
/// meet are in the catalogues, see trError().
std::string systemWords(int number);

}  // namespace factory_test
