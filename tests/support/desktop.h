/// The X desktop as another program sees it.
#pragma once

#include <cstdint>
#include <memory>
#include <vector>

namespace brimol::test {

class Desktop {
 public:
  struct Place {
    unsigned long window = 0;  // 0: there is none
    int x = 0;
    int y = 0;
    int width = 0;
    int height = 0;
  };

  Desktop();
  ~Desktop();
  Desktop(const Desktop&) = delete;
  Desktop& operator=(const Desktop&) = delete;

  /// The only window that is shown.
  Place findWindow() const;
  /// What stands there, 0x00RRGGBB.
  std::uint32_t colourAt(int left, int top) const { return row(left, top, 1).front(); }
  std::vector<std::uint32_t> row(int left, int top, int width) const;
  /// As the window manager does for the user.
  void askToClose(unsigned long window) const;

 private:
  struct Server;  // Xlib's types stay in the source, as its header has macros of such names as None
  std::unique_ptr<Server> server;
};

}  // namespace brimol::test
