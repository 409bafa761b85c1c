/// The gallery as a document.
#pragma once

#include <string>

namespace gallery {

/// docs/gallery.md: every example with its picture, which the golden tests keep, and its code.
std::string document();

}  // namespace gallery
