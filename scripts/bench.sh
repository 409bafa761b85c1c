#!/usr/bin/env bash
# Measures what the toolkit and the platform cost and writes the tables of docs/performance.md. Once built, it takes a
# minute and a half on a machine that does nothing else.
# scripts/bench.sh --against COMMIT builds that commit beside, under the same benchmarks, runs both by
# turns, and prints how painting, start, memory and latency compare: below 1 this tree is better.
set -euo pipefail
cd "$(dirname "$0")/.."

readonly page=docs/performance.md
readonly rounds=5

# build SOURCE BUILD PROGRAM...
build() {
  cmake -S "$1" -B "$2" -G Ninja -DCMAKE_BUILD_TYPE=Release >/dev/null
  cmake --build "$2" --target "${@:3}" >"$2/build.log" || {
    grep -m 3 'error' "$2/build.log" >&2
    echo "bench.sh: $1 does not build under these benchmarks: $2/build.log" >&2
    return 1
  }
}

# run BUILD PROGRAM: what the benchmark found, as JSON.
run() { "$1/bench/$2" --benchmark_format=json 2>/dev/null; }

# figures BUILD: a line of name, figure and value for each figure that two commits are compared by.
figures() {
  local program
  for program in painter_bench start_bench latency_bench; do
    run "$1" $program | jq -r '.benchmarks[] | . as $of | ["least_us", "median_us", "least_ms", "median_ms",
      "p99_ms", "resident_mb", "core_percent", "wakeups_per_s", "allocations"][] | select($of[.]) |
      [($of.name | gsub("^painting/|/(iterations:\\d+|manual_time|real_time)"; "") | gsub("_"; " ")) +
        ", " + sub("_(?<unit>.*)"; " \(.unit)" | gsub("_"; " ")), $of[.]] | @tsv'
  done
}

# compared OLD NEW: the least and the median of each figure's rounds, in the order of the first round, and
# their ratios.
compared() {
  jq -rn --arg old "$1" --arg new "$2" '
    def rounds: split("\n") | map(select(. != "") | split("\t") | {name: .[0], value: (.[1] | tonumber)});
    def values($name): map(select(.name == $name).value) | sort;
    def middle: if length == 0 then null else .[length / 2 | floor] end;
    def ratio($a; $b): if $a == null or $b == null or $a == 0 then null else $b / $a end;
    ($old | rounds) as $olds | ($new | rounds) as $news |
    (reduce $news[].name as $each ([]; if index([$each]) then . else . + [$each] end))[] as $name |
    ($olds | values($name)) as $a | ($news | values($name)) as $b |
    [$name, $a[0], $b[0], ratio($a[0]; $b[0]), ($a | middle), ($b | middle), ratio($a | middle; $b | middle)] |
    map(. // "-") | @tsv' | awk -F'\t' '
    function shown(value) { return value == "-" ? value : sprintf("%.2f", value) }
    BEGIN { printf "%-46s %29s  %29s\n", "", "least: old, new, ratio", "median: old, new, ratio" }
    { printf "%-46s %10s %10s %7s  %10s %10s %7s\n", $1, shown($2), shown($3), shown($4), shown($5), shown($6),
      shown($7) }'
}

compare_with() {
  local commit folder round old_runs='' new_runs=''
  commit=$(git rev-parse --verify --short "$1^{commit}")
  folder=$PWD/build/against/$commit
  rm -rf "$folder/source"
  mkdir -p "$folder/source"
  git archive "$commit" | tar -x -C "$folder/source"
  rm -rf "$folder/source/bench"
  cp -r bench "$folder/source/bench" # the same benchmarks, over that commit
  echo "== Building $commit in build/against/$commit, and this tree in build/release"
  build "$folder/source" "$folder/build" painter_bench start_bench latency_bench
  build . build/release painter_bench start_bench latency_bench
  for ((round = 1; round <= rounds; ++round)); do
    echo "== Round $round of $rounds"
    old_runs+=$(figures "$folder/build")$'\n'
    new_runs+=$(figures build/release)$'\n'
  done
  echo "== Of all rounds: $commit, this tree, ratio"
  compared "$old_runs" "$new_runs"
}

# table MARK HEADER FORMAT: puts a table of the lines of values that it reads between two marks of the
# page. The format is printf's, of one line; the header names its columns.
table() {
  local rows
  rows=$(echo "$2" && sed -E 's/[^|]+/---/g' <<<"$2" &&
    awk -F'\t' -v format="$3\n" '{ printf format, $1, $2, $3, $4, $5, $6 }')
  ROWS=$rows awk -v mark="$1" '$0 == "<!-- " mark " end -->" { print ENVIRON["ROWS"]; skip = 0 }
    !skip { print } $0 == "<!-- " mark " -->" { skip = 1 }' "$page" >"$page.new"
  mv "$page.new" "$page"
}

write_library_tables() {
  local found
  found=$(run build/release library_bench)
  jq -r '.benchmarks[] | select(.name | test("^(drawing|timer)/")) |
    [(.name | sub("/buttons/(?<n>.*)"; ", buttons: \(.n)") | sub("/"; ", ")),
      .bare_ns, .pass_ns, .ratio, .frame_us] | @tsv' <<<"$found" |
    table passes '| pass | by hand | the pass | ratio | of a frame, us |' '| %s | %.1f | %.1f | %.2f | %.2f |'
  jq -r '.benchmarks | INDEX(.name) as $of |
    ($of | keys_unsorted[] | select(startswith("registering/")) |
      ["registering and unregistering a button, beside others: " + sub(".*/"; ""), $of[.].cpu_time / 1e3, "us"]),
    ($of["memoryOfButtons/10000/iterations:1"] | ["memory of a button, of 10000", .bytes_each, "bytes"]),
    ($of["hugeText/iterations:1"] | ["`setText` of 100 MB", .set_ms, "ms"],
      ["memory of that text", .memory_mb, "MB"], ["drawing a view of it", .draw_us, "us"]) | @tsv' <<<"$found" |
    table growth '| | measured |' '| %s | %.1f %s |'
  jq -r '.benchmarks | INDEX(.name) as $of |
    ["`setText`, lines of 64 bytes", $of["settingText/64"].bytes_per_second / 1e6, "MB/s", "100 MB/s"],
    ["`setText`, one line", $of["settingText/10000000"].bytes_per_second / 1e6, "MB/s", "100 MB/s"],
    ["a search, found in the last line", $of["searching/at_the_end"].cpu_time, "ms", "50 ms"],
    ["a search, found in every line", $of["searching/in_every_line"].cpu_time, "ms", "50 ms"],
    ["drawing a view into 1,000,000 lines, against one into 100", $of["showingLongText"].ratio, "", "about 1"] |
    @tsv' <<<"$found" |
    table texts '| | measured | aim |' '| %s | %.4g %s | %s |'
}

write_latency_tables() {
  local found
  found=$(run build/release latency_bench)
  jq -r '.benchmarks[] | select(.median_ms) | [(.name | sub("/.*"; "") | {
      pressToCallback: "to the button'"'"'s callback", pressToFrame: "to the painted frame and a copy of it",
      pressBehindTenFingers: "behind ten fingers that moved 120 times a second for 5 s"}[.] // .),
      .median_ms, .p99_ms] | @tsv' <<<"$found" |
    table latency '| | median, ms | 99 %, ms |' '| %s | %.2f | %.2f |'
  jq -r '.benchmarks[] | select(.core_percent) | [.core_percent, .bare_percent, .wakeups_per_s] | @tsv' <<<"$found" |
    table idle '| of a core | wakeups alone | wakeups a second |' '| %.1f %% | %.1f %% | %.0f |'
}

write_tables() {
  write_library_tables
  write_latency_tables
  run build/release start_bench |
    jq -r '.benchmarks[] | [(.name | split("/")[1]), .least_ms, .median_ms, .resident_mb] | @tsv' |
    table start '| screen | least, ms | median, ms | resident then, MB |' '| %s | %.1f | %.1f | %.1f |'
  run build/release replay_bench | jq -r '.benchmarks | INDEX(.name | sub("/.*"; "")) as $of |
    ["an idle minute, simulated: seconds", $of.simulatedSeconds.real_time / 1e3],
    ["a dragged list, played without pictures: frames a second", ($of.replayedFrames.frames_per_second | round)],
    ["an idle second: ms of a processor", $of.recordedSecond.real_cpu_ms],
    ["the same, recorded", $of.recordedSecond.recorded_cpu_ms] | @tsv' |
    table replay '| | measured |' '| %s | %.4g |'
  run build/release painter_bench |
    jq -r '.benchmarks[] | [(.name | split("/")[1] | gsub("_"; " ")), .least_us, .median_us, .least_memsets,
      .median_memsets, .allocations] | @tsv' |
    table scenes '| scene | least, us | median, us | least, memsets | median, memsets | allocations |' \
      '| %s | %.1f | %.1f | %.3f | %.3f | %.0f |'
}

case ${1:-} in
  '')
    echo "== Building in build/release"
    build . build/release library_bench latency_bench start_bench replay_bench painter_bench
    echo "== Measuring"
    write_tables
    echo "== Wrote the tables of $page"
    ;;
  --against)
    compare_with "${2:?--against needs a commit}"
    ;;
  *)
    echo "bench.sh: unknown argument '$1': nothing, or --against COMMIT" >&2
    exit 2
    ;;
esac
