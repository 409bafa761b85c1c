#!/usr/bin/env bash
# Fuzzes. `scripts/fuzz.sh --help` says how.
set -euo pipefail
cd "$(dirname "$0")/.."

readonly most_files=24 most_bytes=400
mapfile -t known < <(ls fuzz/corpus)

usage() {
  cat <<END
Usage: scripts/fuzz.sh [TARGET [SECONDS]]
       scripts/fuzz.sh --keep [TARGET]

Without a target each in turn, without a time for a minute each. What was learnt is kept in build/fuzz/learnt/TARGET,
what was found beside it as TARGET-crash-... or the like: rerun the target's program with that file alone.

  --keep   makes of what was learnt the small corpus that is committed
  --help   this text

Targets: ${known[*]}
END
}

fail_usage() {
  echo "fuzz.sh: $1 (try --help)" >&2
  exit 2
}

keep=no
case ${1:-} in
  --help) usage; exit ;;
  --keep)
    keep=yes
    shift
    ;;
esac
target=${1:-} seconds=${2:-60} targets=("${known[@]}")
if [[ -n $target ]]; then
  [[ " ${known[*]} " == *" $target "* ]] || fail_usage "unknown target or option '$target'"
  targets=("$target")
fi
[[ $seconds =~ ^[1-9][0-9]{0,8}$ ]] || fail_usage "'$seconds' is no number of seconds"
(($# <= 2)) || fail_usage "a target and a time at most"
[[ $keep == no || $# -le 1 ]] || fail_usage "--keep takes no time"

if command -v ccache >/dev/null; then
  export CMAKE_C_COMPILER_LAUNCHER=ccache CMAKE_CXX_COMPILER_LAUNCHER=ccache
fi
cmake --preset fuzz >/dev/null
cmake --build --preset fuzz
export LSAN_OPTIONS="suppressions=$PWD/cmake/lsan.supp:print_suppressions=0"
export UBSAN_OPTIONS=print_stacktrace=1

# Of the files that together reach all that small files reach some, from the smallest to the largest; what has a name
# of its own was put there by hand and stays.
keep_corpus() {
  local merged=build/fuzz/merged/$1
  rm -rf "$merged"
  mkdir -p "$merged"
  "build/fuzz/fuzz/fuzz_$1" -merge=1 -use_value_profile=0 -max_len=$most_bytes "$merged" \
    "build/fuzz/learnt/$1" "fuzz/corpus/$1" 2>/dev/null
  find "fuzz/corpus/$1" -type f -regextype egrep -regex '.*/[0-9a-f]{40}' -delete
  local files
  mapfile -t files < <(find "$merged" -type f -printf '%s %p\n' | sort -n | cut -d' ' -f2-)
  local i all=${#files[@]}
  local some=$((all < most_files ? all : most_files))
  for ((i = 0; i < some; ++i)); do cp "${files[i * all / some]}" "fuzz/corpus/$1/"; done
}

for name in "${targets[@]}"; do
  mkdir -p "build/fuzz/learnt/$name"
  if [[ $keep == yes ]]; then
    keep_corpus "$name"
    continue
  fi
  echo "== $name for $seconds seconds"
  "build/fuzz/fuzz/fuzz_$name" -max_total_time="$seconds" -max_len=4000 -timeout=10 \
    -rss_limit_mb=1500 -print_final_stats=1 -artifact_prefix="build/fuzz/learnt/$name-" \
    "build/fuzz/learnt/$name" "fuzz/corpus/$name" 2>&1 | grep --line-buffered -v ' NEW \|REDUCE\|RELOAD'
done
