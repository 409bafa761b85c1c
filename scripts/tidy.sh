#!/usr/bin/env bash
# Checks the formatting of every source and runs clang-tidy over what is shipped, or with --all over
# the tests and benchmarks too, which takes much longer. Any finding fails.
set -euo pipefail
cd "$(dirname "$0")/.."

mapfile -t sources < <(git ls-files '*.h' '*.cpp' '*.c')
units_of=('src/*.cpp' 'platform/*.cpp' 'apps/*.cpp' 'tools/*.cpp')
[[ ${1:-} != --all ]] || units_of=('*.cpp')
mapfile -t units < <(git ls-files "${units_of[@]}")

echo "== Checking the format of ${#sources[@]} files"
clang-format --dry-run --Werror "${sources[@]}"

echo "== Running clang-tidy over ${#units[@]} files"
cmake --preset debug >/dev/null
printf '%s\0' "${units[@]}" |
  xargs -0 -n 1 -P "$(nproc)" clang-tidy -p build/debug --quiet --warnings-as-errors='*' 2>/dev/null
