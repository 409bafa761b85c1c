# android_platform: the phone's thread, pointer and log classes as Debian packages them
# (android-libutils-dev, android-liblog-dev).

find_path(BRIMOL_ANDROID_INCLUDE_DIR utils/Thread.h PATH_SUFFIXES android REQUIRED)
find_library(BRIMOL_ANDROID_UTILS_LIBRARY utils PATH_SUFFIXES android REQUIRED)
find_library(BRIMOL_ANDROID_LOG_LIBRARY log PATH_SUFFIXES android REQUIRED)
get_filename_component(BRIMOL_ANDROID_LIBRARY_DIR "${BRIMOL_ANDROID_UTILS_LIBRARY}" DIRECTORY)

add_library(android_platform INTERFACE)
target_include_directories(android_platform SYSTEM INTERFACE "${BRIMOL_ANDROID_INCLUDE_DIR}")
target_link_libraries(android_platform INTERFACE "${BRIMOL_ANDROID_UTILS_LIBRARY}"
                                                 "${BRIMOL_ANDROID_LOG_LIBRARY}")
# The libraries stand outside the loader's own path, and so do those that they need in turn.
target_link_options(
  android_platform INTERFACE "LINKER:--disable-new-dtags,-rpath,${BRIMOL_ANDROID_LIBRARY_DIR}"
                             "LINKER:-rpath-link,${BRIMOL_ANDROID_LIBRARY_DIR}")
