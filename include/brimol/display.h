/* What the platform tells about its display. */
#pragma once

#ifdef __cplusplus
extern "C" {
#endif
#pragma GCC visibility push(default)

/* Stores the display's density in dots per inch, or 0 where it is unknown: millimetres then become
 * 0 pixels. The toolkit gives two valid pointers. It asks on the thread that calls
 * Window::getMura, until both figures are known. */
void getDpi(float* xdpi, float* ydpi);

#pragma GCC visibility pop
#ifdef __cplusplus
}
#endif
