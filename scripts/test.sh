#!/usr/bin/env bash
# Builds and tests; any finding fails. `scripts/test.sh --help` says what it can be asked for.
set -euo pipefail
cd "$(dirname "$0")/.."

usage() {
  cat <<'END'
Usage: scripts/test.sh [--quick | --all | SUITE...] [--repeat N]

Without an argument: phone, tidy, asan, tsan, fuzz, race, i386 and release.

  --quick     the unit tests in release, and tidy for what changed since main
  --all       every suite
  --repeat N  after building, all tests of the suites N times, each time in another order, beside a busy core
  --help      this text

Suites:
  release     unit, thread and end-to-end tests, optimised
  asan        the same under the address, leak and undefined behaviour sanitizers, by GCC
  asan-clang  the same, by Clang
  tsan        the same under the thread sanitizer
  fuzz        the fuzzers, a few seconds each
  race        whether the thread sanitizer finds a lock that is taken out
  phone       the library alone, without the PC platform
  i386        the library and its unit tests for 32-bit x86
  arm64       the same for 64-bit Arm, under emulation
  armhf       the same for 32-bit Arm, under emulation
  tidy        formatting and clang-tidy, everywhere
END
}

fail_usage() {
  echo "test.sh: $1 (try --help)" >&2
  exit 2
}

export LC_ALL=C.UTF-8 # the factory test's texts are English in its traces

if command -v ccache >/dev/null; then
  export CMAKE_C_COMPILER_LAUNCHER=ccache CMAKE_CXX_COMPILER_LAUNCHER=ccache
fi

build() {
  echo "== Building $1 in build/$1"
  cmake --preset "$1" >/dev/null
  cmake --build --preset "$@"
}

run_tests() {
  echo "== Testing $1"
  if ((repeat == 1)); then
    ctest --preset "$@" --parallel "$(nproc)"
    return
  fi
  (while :; do :; done) &
  trap "kill $!" EXIT
  local round
  for ((round = 1; round <= repeat; ++round)); do
    echo "== Round $round of $repeat"
    ctest --preset "$@" --parallel "$(nproc)" --schedule-random
  done
  kill $!
  trap - EXIT
}

run_suite() {
  case $1 in
    unit)
      build release --target unit_tests
      run_tests release --label-regex unit
      ;;
    release | asan | asan-clang | tsan | fuzz)
      build "$1"
      run_tests "$1"
      ;;
    i386 | arm64 | armhf)
      scripts/foreign_root.sh "$1"
      build "$1"
      run_tests "$1"
      ;;
    race) scripts/race_test.sh ;;
    phone) build phone ;;
    tidy) scripts/tidy.sh ;;
    tidy-changed) scripts/tidy.sh --changed ;;
  esac
}

suites=()
repeat=1
while (($# > 0)); do
  case $1 in
    --help) usage; exit ;;
    --quick) suites+=(unit tidy-changed) ;;
    --all) suites+=(phone tidy asan asan-clang tsan fuzz race i386 arm64 armhf release) ;;
    --repeat)
      [[ ${2:-} =~ ^[1-9][0-9]{0,5}$ ]] || fail_usage "--repeat needs a number of times"
      repeat=$2
      shift
      ;;
    release | asan | asan-clang | tsan | fuzz | race | phone | i386 | arm64 | armhf | tidy) suites+=("$1") ;;
    *) fail_usage "unknown suite or option '$1'" ;;
  esac
  shift
done
((${#suites[@]} > 0)) || suites=(phone tidy asan tsan fuzz race i386 release)

scripts/install_packages.sh
for suite in "${suites[@]}"; do
  begin=$SECONDS
  run_suite "$suite"
  echo "== Passed: $suite in $((SECONDS - begin)) s"
done
echo "== Passed: ${suites[*]} in $SECONDS s"
