/// How many letters have room.
#pragma once

#include <cstddef>
#include <string_view>

namespace factory_test {

/// The bytes of which a row of `width` pixels surely holds any that follow each other in a line of
/// the text, at most `most`. Letters are taken for as wide as their kind is in common fonts.
std::size_t bytesThatFit(std::string_view text, int size, int width, std::size_t most);

}  // namespace factory_test
