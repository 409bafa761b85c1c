#!/usr/bin/env bash
# Lets monkeys use the whole example application. `scripts/monkey.sh --help` says how.
set -euo pipefail
cd "$(dirname "$0")/.."

usage() {
  cat <<'END'
Usage: scripts/monkey.sh [--preset NAME] [--events N] [--days N] SEED...

Each seed plays in a process of its own, in simulated time, on a screen of 480x800. The session's memory, threads and
open files are printed after each 250,000 events and each simulated day. A seed fails if the application crashes,
leaks (with a sanitizer's preset), does not close, shows the same for 20,000 events, or gives a verdict a wrong time.
From the first of those lines after a million events to the last, memory may not grow by more than 1 %, and no thread
and no open file may be left: with --days from the first day on. Fewer events than 1,500,000 are too few to tell how
memory grows, and are not judged by it.

The trace of a seed that fails stays in build/monkey/SEED.trace. Played, it brings back a crash, a hang, and that the
application does not close: scripts/shrink_trace.py makes it short, the latter two with --hangs and --exit 1. The rest
is judged only while the monkey plays; the same seed and options do the same again.

  --preset NAME   the build, `release` when not said
  --events N      so many events each, 2000000 when not said
  --days N        with rests in between, so that they take N days; the clock starts over in the middle
  --help          this text
END
}

fail_usage() {
  echo "monkey.sh: $1 (try --help)" >&2
  exit 2
}

readonly day=86400000 # ms
preset=release events=2000000 days=0 seeds=()
while (($# > 0)); do
  case $1 in
    --help) usage; exit ;;
    --preset | --events | --days)
      (($# > 1)) || fail_usage "$1 needs a value"
      declare "${1#--}=$2"
      shift
      ;;
    *) seeds+=("$1") ;;
  esac
  shift
done
((${#seeds[@]} > 0)) || fail_usage "which seeds?"
for number in "$events" "$days" "${seeds[@]}"; do
  [[ $number =~ ^(0|[1-9][0-9]{0,17})$ ]] || fail_usage "'$number' is not a number"
done
((events >= 100)) || fail_usage "--events needs 100 at least"

export LC_ALL=C.UTF-8 BRIMOL_DISPLAY=headless BRIMOL_SCREEN=480x800
export LSAN_OPTIONS="suppressions=$PWD/cmake/lsan.supp:print_suppressions=0"
export TSAN_OPTIONS="suppressions=$PWD/cmake/tsan.supp:halt_on_error=1"
rest=0
export BRIMOL_CLOCK_STEP=10 # a millisecond each would cost ten times as much
if ((days > 0)); then
  rest=$((days * day / (events / 100)))
  BRIMOL_CLOCK_STEP=50
  export BRIMOL_CLOCK_START=$(((2 ** 32 - days * day / 2) % 2 ** 32))
fi

if command -v ccache >/dev/null; then
  export CMAKE_C_COMPILER_LAUNCHER=ccache CMAKE_CXX_COMPILER_LAUNCHER=ccache
fi
cmake --preset "$preset" >/dev/null
cmake --build --preset "$preset" --target factory_test >/dev/null
program=$PWD/build/$preset/apps/factory_test/factory_test
mkdir -p build/monkey
cd build/monkey

# Compares the first line that tells of memory (KiB), threads and open files with the last one. Before a million
# events the painter's bounded store of texts still fills, and a little for a million more; a leak needs events to show.
judge() {
  awk -v few=$((events < 1500000)) -v day=$((days > 0 ? day : 0)) '
       / KiB resident/ && (day ? $7 >= day : $4 >= 1000000) {
         threads = $(NF - 4); files = $(NF - 2)
         if (!looks++) { threads1 = threads; files1 = files }
       }
       / KiB resident/ && $4 >= 1000000 {
         memory = $(NF - 7); told = $4
         if (!lines++) { memory1 = memory; told1 = told }
       }
       END {
         isLeft = threads > threads1 || files > files1
         if (isLeft) printf "threads: %d, then %d; open files: %d, then %d\n", threads1, threads, files1, files
         if (told - told1 < 400000) { print "growth is not judged: too few events were told of"; exit isLeft || !few }
         growth = 100 * (memory - memory1) / memory1
         printf "growth from %d events to %d: %.2f %%\n", told1, told, growth
         exit growth > 1 || isLeft
       }' "$1"
}

# Whether all verdicts of a file are of the simulated days, which begin with a year, and none took a day.
judge_times() {
  local latest # two million events take less than a day
  latest=$(date -u -d "2026-01-01 + $((days + events / 2000000 + 1)) days" +%FT%TZ)
  jq -e --arg latest "$latest" --argjson day $day \
    '.results | length > 0 and all(.started > "2026" and .started < $latest and .duration_ms < $day)' "$1" >/dev/null ||
    { echo "$1: times are wrong"; return 1; }
}

# play SEED: with the exit codes of verdicts, which a monkey gives as it likes, it is well.
play() {
  local code=0 results=$1.json
  rm -f "$results"
  BRIMOL_MONKEY=$1:$events:$rest BRIMOL_RECORD=$1.trace "$program" --stay --results "$results" 2>&1 |
    tee "$1.log" || code=$?
  ((code == 0 || code == 3 || code == 4)) || { echo "exit code $code"; return 1; }
  judge "$1.log" && judge_times "$results"
}

failed=()
for seed in "${seeds[@]}"; do
  if play "$seed"; then
    rm "$seed.trace" "$seed.json"
  else
    failed+=("$seed")
  fi
done
((${#failed[@]} == 0)) || { echo "monkey.sh: failed: ${failed[*]}; see build/monkey" >&2; exit 1; }
