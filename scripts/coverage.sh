#!/usr/bin/env bash
# How much of the library its own tests reach: lines and branches of src/ and include/MW/, by file,
# and in build/coverage/report.html line by line. Branches that only an exception takes do not count.
set -euo pipefail
cd "$(dirname "$0")/.."

readonly tests=(core_tests allocation_tests widget_tests text_tests dialog_tests list_tests
  descriptor_tests stress_tests)
if command -v ccache >/dev/null; then
  export CMAKE_C_COMPILER_LAUNCHER=ccache CMAKE_CXX_COMPILER_LAUNCHER=ccache
fi
cmake --preset coverage >/dev/null
cmake --build build/coverage --target "${tests[@]}" -- "$@"
find build/coverage -name '*.gcda' -delete
for test in "${tests[@]}"; do
  program=$(find build/coverage/tests -type f -name "$test" -perm -u+x)
  "$program" --gtest_brief=1
done
gcovr --root . --filter src/ --filter include/MW/ --exclude-throw-branches \
  --exclude-unreachable-branches --gcov-ignore-parse-errors --print-summary \
  --html-details build/coverage/report.html build/coverage
