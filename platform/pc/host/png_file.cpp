#include "host/png_file.h"

#include <cerrno>
#include <system_error>

#include "host/whole_file.h"

namespace brimol::pc {

std::string writePng(cairo_surface_t* picture, const std::string& path) {
  return writeWhole(path, [picture](const std::string& unfinished) -> std::string {
    errno = 0;
    const cairo_status_t status = cairo_surface_write_to_png(picture, unfinished.c_str());
    if (status == CAIRO_STATUS_SUCCESS) return {};
    return errno != 0 ? std::generic_category().message(errno) : cairo_status_to_string(status);
  });
}

}  // namespace brimol::pc
