# brimol_pc_painter: the scene, its recording and its painting. It needs no thread; what takes the
# recorded frames (frame_sink.h) is supplied by the program that records.

pkg_check_modules(PANGO REQUIRED IMPORTED_TARGET pangocairo pangoft2)
pkg_check_modules(FONTCONFIG REQUIRED IMPORTED_TARGET fontconfig)

add_library(brimol_pc_painter STATIC)
target_sources(
  brimol_pc_painter
  PRIVATE painter.cpp
          painter/canvas.cpp
          painter/fonts.cpp
          painter/item.cpp
          painter/item_painter.cpp
          painter/picture_cache.cpp
          painter/png_reader.cpp
          painter/polygon.cpp
          painter/shapes.cpp
          painter/text_painter.cpp
          recorder.cpp
          scene.cpp
          scene_calls.cpp)
target_include_directories(brimol_pc_painter PUBLIC . "${PROJECT_SOURCE_DIR}/include")
target_link_libraries(
  brimol_pc_painter
  PRIVATE mw_flags
  PUBLIC PkgConfig::CAIRO PkgConfig::PANGO PkgConfig::FONTCONFIG)
