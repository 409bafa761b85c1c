#!/usr/bin/env bash
# Builds and tests everything: scripts/test.sh, or only the suites named: scripts/test.sh asan tidy
#
#   release  the unit, thread and end-to-end tests, optimised
#   asan     the same under the address and undefined-behaviour sanitizers
#   tsan     the same under the thread sanitizer
#   fuzz     the fuzzers, a few seconds each
#   phone    the library alone, without the PC platform
#   tidy     formatting and clang-tidy, everywhere
set -euo pipefail
cd "$(dirname "$0")/.."

if command -v ccache >/dev/null; then
  export CMAKE_C_COMPILER_LAUNCHER=ccache CMAKE_CXX_COMPILER_LAUNCHER=ccache
fi

build() {
  echo "== Building $1 in build/$1"
  cmake --preset "$1" >/dev/null
  cmake --build --preset "$1"
}

run_suite() {
  case $1 in
    release | asan | tsan | fuzz)
      build "$1"
      echo "== Testing $1"
      ctest --preset "$1" --parallel "$(nproc)"
      ;;
    phone) build phone ;;
    tidy) scripts/tidy.sh ;;
    *)
      echo "test.sh: unknown suite '$1': release, asan, tsan, fuzz, phone or tidy" >&2
      exit 2
      ;;
  esac
}

suites=("$@")
((${#suites[@]} > 0)) || suites=(phone tidy asan tsan fuzz release)
scripts/install_packages.sh
for suite in "${suites[@]}"; do run_suite "$suite"; done
echo "== Passed: ${suites[*]}"
