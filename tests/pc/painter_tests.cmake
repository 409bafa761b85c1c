# Scene, recording and painting.
add_library(pc_painting STATIC painting.cpp)
target_link_libraries(pc_painting PRIVATE mw_flags PUBLIC brimol_pc_painter GTest::gtest)

add_executable(paint_sample paint_sample.cpp)
target_link_libraries(paint_sample PRIVATE mw_flags pc_painting)

add_executable(
  pc_painter_test
  lru_cache_test.cpp
  painter_test.cpp
  picture_cache_test.cpp
  recorder_test.cpp
  same_picture_test.cpp
  scene_test.cpp
  text_painter_test.cpp)
target_compile_definitions(pc_painter_test PRIVATE "PAINT_SAMPLE=\"$<TARGET_FILE:paint_sample>\"")
target_link_libraries(pc_painter_test PRIVATE mw_flags pc_painting GTest::gmock GTest::gtest_main)
add_dependencies(pc_painter_test paint_sample)
gtest_discover_tests(pc_painter_test NO_PRETTY_VALUES PROPERTIES TIMEOUT 100)
