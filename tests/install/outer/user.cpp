// Compiles only with the library's headers and the standard that they need.
#include <MW/MW.h>

static_assert(__cplusplus > 201703L);

void drawAll() { MW::Window::show(); }
