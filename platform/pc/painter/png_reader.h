/// PNG files from outside, none of them trusted.
#pragma once

#include <string>

#include "scene/cairo_handles.h"
#include "scene/geometry.h"

namespace brimol::pc {

/// The picture in the file `name`. Null where it is no regular file, no PNG file, or a picture for
/// whose size `isWanted` says no; a picture that is not wanted is never unpacked. Any thread.
CairoSurface readPng(const std::string& name, bool (*isWanted)(Size size));

}  // namespace brimol::pc
