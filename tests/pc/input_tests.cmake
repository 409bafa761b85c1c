# Settings, properties, clock and input.
add_executable(
  pc_input_test
  input_queue_test.cpp
  input_service_test.cpp
  input_translator_test.cpp
  keymap_test.cpp
  long_press_test.cpp
  properties_test.cpp
  record_text.cpp
  settings_test.cpp)
target_link_libraries(pc_input_test PRIVATE mw_flags brimol_pc_input GTest::gmock GTest::gtest_main)
gtest_discover_tests(pc_input_test NO_PRETTY_VALUES PROPERTIES TIMEOUT 100)
