/// The gallery on the screen.
#pragma once

namespace gallery {

/// Shows the families, and of each its examples and their code, until the user leaves. The window
/// is open and runs.
void browse();

}  // namespace gallery
