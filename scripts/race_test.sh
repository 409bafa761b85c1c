#!/usr/bin/env bash
# A test of the tests: without the lock of DialogSelect::show the thread sanitizer has to report a race.
set -euo pipefail
cd "$(dirname "$0")/.."

copy=build/race/source
echo "== Building a copy without a lock in build/race"
mkdir -p "$copy"
git ls-files -z CMakeLists.txt CHANGELOG.md cmake include packaging scripts src testkit tests |
  xargs -0 cp --parents --update --target-directory="$copy"
sed -i '/^int DialogSelect::show(unsigned int)/,/^}/{/lock_guard/d}' "$copy/src/dialogs/dialog_select.cpp"
if cmp --quiet {"$copy"/,}src/dialogs/dialog_select.cpp; then
  echo "race_test.sh: DialogSelect::show has no lock that could be taken out" >&2
  exit 1
fi
cmake -S "$copy" -B build/race/build -G Ninja -DCMAKE_C_COMPILER=clang -DCMAKE_CXX_COMPILER=clang++ \
  -DCMAKE_BUILD_TYPE=RelWithDebInfo "-DCMAKE_CXX_FLAGS_RELWITHDEBINFO=-O1 -g1" -DBRIMOL_BATCHES=ON \
  -DBRIMOL_PC_PLATFORM=OFF -DBRIMOL_INSTALL=OFF -DBRIMOL_SANITIZE=thread >/dev/null
cmake --build build/race/build --target stress_tests

echo "== Testing that the race is found"
report=build/race/report.txt
if TSAN_OPTIONS="suppressions=$PWD/cmake/tsan.supp" build/race/build/tests/stress/stress_tests \
  --gtest_filter='*.MenuWidgetsAreDrawnOfferedEventsAndSetAtOnce' >"$report" 2>&1; then
  echo "race_test.sh: the thread sanitizer did not see it" >&2
  exit 1
fi
grep -q 'WARNING: ThreadSanitizer: data race' "$report"
grep -q 'DialogSelect::' "$report"
