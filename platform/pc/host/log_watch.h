/// The phone's log, heard by the platform beside the application's own logger.
#pragma once

namespace brimol::pc {

/// One line of the log, on the thread that logs it.
using LogWatcher = void (*)(int priority, const char* tag, const char* message);

/// From here on `watcher` hears every line, and then the logger that the application has set, or
/// the log's own. False: the program was linked so that the application's logger cannot be told
/// apart, and nothing changes.
bool watchLog(LogWatcher watcher);

}  // namespace brimol::pc
