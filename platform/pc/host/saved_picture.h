/// Pictures that the user saves.
#pragma once

#include <cairo.h>

#include <ctime>
#include <filesystem>
#include <string>

namespace brimol::pc {

/// Writes `picture` into `folder` as brimol-YYYYMMDD-HHMMSS.png, after the local time `now`, or
/// with -2, -3 and so on behind the time where there is such a file: none is ever replaced. Returns
/// one line for the user that says where it is, or what went wrong.
std::string savePicture(cairo_surface_t* picture, const std::filesystem::path& folder,
                        std::time_t now);

}  // namespace brimol::pc
