/// Display items as lines of text, and what tells frames apart.
#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "scene/scene.h"

namespace brimol::pc {

/// What the item draws, in one line; items that draw the same have the same. docs/traces.md
/// describes it.
std::string textOfItem(const SKIA_Item& item);

std::vector<std::string> textOfFrame(const Frame& frame);

/// The 64-bit FNV-1a hash of the lines, each with a line end.
uint64_t hashOf(const std::vector<std::string>& lines);

/// Sixteen hexadecimal digits.
std::string hashText(uint64_t hash);

}  // namespace brimol::pc
