# android_platform: the phone's thread, pointer and log classes as Debian packages them
# (android-libutils-dev, android-liblog-dev).

find_path(ANDROID_INCLUDE_DIR utils/Thread.h PATH_SUFFIXES android REQUIRED)
find_library(ANDROID_UTILS_LIBRARY utils PATH_SUFFIXES android REQUIRED)
find_library(ANDROID_LOG_LIBRARY log PATH_SUFFIXES android REQUIRED)
get_filename_component(ANDROID_LIBRARY_DIR "${ANDROID_UTILS_LIBRARY}" DIRECTORY)

add_library(android_platform INTERFACE)
target_include_directories(android_platform SYSTEM INTERFACE "${ANDROID_INCLUDE_DIR}")
target_link_libraries(android_platform INTERFACE "${ANDROID_UTILS_LIBRARY}" "${ANDROID_LOG_LIBRARY}")
# The libraries stand outside the loader's own path, and so do those that they need in turn.
target_link_options(
  android_platform INTERFACE "LINKER:--disable-new-dtags,-rpath,${ANDROID_LIBRARY_DIR}"
                             "LINKER:-rpath-link,${ANDROID_LIBRARY_DIR}")
