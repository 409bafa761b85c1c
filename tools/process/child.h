/// Processes that a program started and has not yet waited for.
#pragma once

#include <sys/types.h>

#include <optional>

namespace brimol::process {

/// It is not waited for here, so that its number stays its own. Also where the system does not
/// tell.
bool hasEnded(pid_t process);

/// Ends it, with the group that it may lead, and waits for it: what waitpid() says of its end. None
/// where the system does not tell, or where it is another user's, who may not be killed: that one
/// can go on and is not waited for.
std::optional<int> finish(pid_t process);

}  // namespace brimol::process
