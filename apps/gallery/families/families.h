/// The families, each in a file of its own.
#pragma once

#include "example.h"

namespace gallery {

Family buttons();
Family slides();
Family pictures();
Family screens();
Family timed();
Family texts();
Family lists();
Family dialogs();
Family prompts();
Family descriptors();

/// The source of a family as it was built, by the name of its file without ".cpp".
std::string_view sourceOf(std::string_view family);

}  // namespace gallery
