/// The one platform of the process that the C calls work on.
#pragma once

#include <memory>
#include <string>

#include "host/platform.h"

namespace brimol::pc {

/// Opens it as the environment asks, with its input. Returns an empty text, also where it is open
/// already, or one line that says why it cannot be opened. Any thread.
std::string openPlatform();

/// Closes it and its input: whoever waits for either goes on. None is open: nothing. Any thread.
void closePlatform();

/// The open platform, null where none is. Any thread. After closePlatform() a pointer that was kept
/// is to a closed platform.
std::shared_ptr<Platform> openedPlatform();

}  // namespace brimol::pc
