/// Pictures as PNG files.
#pragma once

#include <cairo.h>

#include <string>

namespace brimol::pc {

/// Writes `picture` as the file `path`, in place of a file of that name. The file appears whole or
/// not at all. Returns an empty text, or one line that says what went wrong. Any thread.
std::string writePng(cairo_surface_t* picture, const std::string& path);

}  // namespace brimol::pc
