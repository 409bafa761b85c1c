/// Screens of phones to try an application on.
#pragma once

#include <brimol/device.h>

#include <span>
#include <string>

namespace brimol::pc {

/// All profiles, oldest first.
std::span<const BrimolDevice> devices();

/// Their names as an enumeration in one line: "a, b or c".
std::string namesOfDevices();

}  // namespace brimol::pc
