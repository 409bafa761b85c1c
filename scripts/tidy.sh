#!/usr/bin/env bash
# Checks the formatting of every source and runs clang-tidy over all of them. Any finding fails.
# With --changed only over those that differ from main, and those whose own header does.
set -euo pipefail
cd "$(dirname "$0")/.."

[[ $# == 0 || ($# == 1 && $1 == --changed) ]] || { echo "tidy.sh: nothing, or --changed" >&2; exit 2; }

list() {
  git ls-files --cached --others --exclude-standard "$@"
}
if [[ ${1:-} == --changed ]]; then
  main=$(git merge-base HEAD origin/main 2>/dev/null || git merge-base HEAD main 2>/dev/null || echo HEAD)
  mapfile -t changed < <(git diff --name-only --diff-filter=d "$main"; git ls-files --others --exclude-standard)
  list() {
    local paths=() file
    for file in "${changed[@]}"; do
      [[ $file == *.h ]] && paths+=("$file" ":(glob)**/$(basename "${file%.h}").cpp") || paths+=("$file")
    done
    ((${#paths[@]} == 0)) && return
    comm -12 <(git ls-files --cached --others --exclude-standard "${paths[@]}" | sort -u) \
      <(git ls-files --cached --others --exclude-standard "$@" | sort -u)
  }
fi
mapfile -t sources < <(list '*.h' '*.cpp' '*.c')
mapfile -t units < <(list '*.cpp' '*.c')

echo "== Checking the format of ${#sources[@]} files"
((${#sources[@]} == 0)) || clang-format --dry-run --Werror "${sources[@]}"

echo "== Running clang-tidy over ${#units[@]} files"
((${#units[@]} > 0)) || exit 0
cmake --preset debug >/dev/null
scripts/tidy.py build/debug "${units[@]}"
