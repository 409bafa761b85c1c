/// Input records as text, so that tests compare and print them.
#pragma once

#include <brimol/input.h>

#include <string>
#include <vector>

#include "input/input_service.h"

namespace brimol::pc {

/// For example "down 0 at 10,20", "motion 1 at 30,20 by 20,0", "key down 273". A state byte that
/// does not fit the type is added.
std::string textOf(const Event& record);

/// Takes every record that waits.
std::vector<std::string> takeTexts(InputService& service);

}  // namespace brimol::pc
