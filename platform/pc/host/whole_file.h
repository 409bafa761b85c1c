/// Files that appear whole or not at all.
#pragma once

#include <functional>
#include <string>

namespace brimol::pc {

/// Has `write` make a file of the name that it gets, which then becomes `path`, in place of a file
/// or a link of that name: what a link leads to stays as it is. `write` returns an empty text, or
/// what went wrong. Returns an empty text, or one line that says what went wrong. Any thread.
std::string writeWhole(const std::string& path,
                       const std::function<std::string(const std::string& unfinished)>& write);

}  // namespace brimol::pc
