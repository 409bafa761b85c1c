/// What a program inherits from whoever starts it.
#pragma once

namespace brimol::process {

/// The first act of a program that opens files and waits for others. Standard streams that are
/// closed lead to /dev/null from here on: the next files would get their numbers, and messages with
/// them. SIGCHLD is no longer ignored, which would hide how a process ended.
void settleInherited();

/// Whether nobody wants to hear of the signal: nohup and shells start programs so.
bool isIgnored(int signal);

}  // namespace brimol::process
