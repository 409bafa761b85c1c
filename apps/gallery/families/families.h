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

/// A source as it was built: that of a family, or place.h. `file` stands in the gallery's folder.
std::string_view sourceOf(std::string_view file);

}  // namespace gallery
