#!/usr/bin/env bash
# Checks the formatting of every source and runs clang-tidy over all of them. Any finding fails.
set -euo pipefail
cd "$(dirname "$0")/.."

mapfile -t sources < <(git ls-files '*.h' '*.cpp' '*.c')
mapfile -t units < <(git ls-files '*.cpp')

echo "== Checking the format of ${#sources[@]} files"
clang-format --dry-run --Werror "${sources[@]}"

echo "== Running clang-tidy over ${#units[@]} files"
cmake --preset debug >/dev/null
scripts/tidy.py build/debug "${units[@]}"
