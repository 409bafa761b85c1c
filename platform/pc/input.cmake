# brimol_pc_input: settings, properties, clock and input of the PC platform. It opens nothing and
# has no thread of its own.
add_library(brimol_pc_input STATIC)
target_sources(
  brimol_pc_input
  PRIVATE "${CMAKE_CURRENT_LIST_DIR}/properties.cpp"
          "${CMAKE_CURRENT_LIST_DIR}/settings.cpp"
          "${CMAKE_CURRENT_LIST_DIR}/input/clock.cpp"
          "${CMAKE_CURRENT_LIST_DIR}/input/event_records.cpp"
          "${CMAKE_CURRENT_LIST_DIR}/input/input_calls.cpp"
          "${CMAKE_CURRENT_LIST_DIR}/input/input_queue.cpp"
          "${CMAKE_CURRENT_LIST_DIR}/input/input_service.cpp"
          "${CMAKE_CURRENT_LIST_DIR}/input/input_translator.cpp"
          "${CMAKE_CURRENT_LIST_DIR}/input/keymap.cpp"
          "${CMAKE_CURRENT_LIST_DIR}/input/long_press.cpp"
          "${CMAKE_CURRENT_LIST_DIR}/input/pointers.cpp")
target_include_directories(brimol_pc_input PUBLIC "${CMAKE_CURRENT_LIST_DIR}"
                                                  "${PROJECT_SOURCE_DIR}/include")
target_link_libraries(
  brimol_pc_input
  PUBLIC PkgConfig::CAIRO PkgConfig::SDL2
  PRIVATE mw_flags)
