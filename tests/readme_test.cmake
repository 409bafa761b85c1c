# The program that the README shows is the one that is built: cmake -DROOT=<project> -P readme_test.cmake

file(READ "${ROOT}/README.md" readme)
file(READ "${ROOT}/apps/first_screen/main.cpp" program)
string(FIND "${readme}" "```cpp\n${program}```" place)
if(place EQUAL -1)
  message(FATAL_ERROR "README.md does not show apps/first_screen/main.cpp as it is")
endif()
