/// What a process holds of memory, whatever it happens to do at the moment.
#pragma once

#include <array>
#include <cstddef>

namespace brimol::pc {

/// Takes looks at the resident size and says the least of the latest 25: what is only held for a
/// while, such as a long text that is shown, does not count. In KiB; 0 where the system does not
/// tell.
class MemoryWatch {
 public:
  void look();
  long least() const;

 private:
  std::array<long, 25> looks = {};
  std::size_t count = 0;
};

}  // namespace brimol::pc
