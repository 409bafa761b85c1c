/// The program's main loop.
#pragma once

#include <functional>

namespace gallery {

/// Draws a frame whenever one is due, until `isOver` says so or the user ends the program.
void runMainLoop(const std::function<bool()>& isOver, const std::function<void()>& draw);

/// Whether the user has closed the window or interrupted the program.
bool isEnded();

}  // namespace gallery
