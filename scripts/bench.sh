#!/usr/bin/env bash
# Measures what painting costs and writes the table of docs/performance.md.
# scripts/bench.sh --against COMMIT builds that commit's painter beside, runs both by turns, and prints
# how the least and the median of each scene compare: below 1 this tree is faster.
set -euo pipefail
cd "$(dirname "$0")/.."

readonly page=docs/performance.md
readonly rounds=5

# build SOURCE BUILD: the painter's benchmark.
build() {
  cmake -S "$1" -B "$2" -G Ninja -DCMAKE_BUILD_TYPE=Release >/dev/null
  cmake --build "$2" --target painter_bench >/dev/null
}

# measure PROGRAM: lines of scene, least and median microseconds, the same in memsets, allocations.
measure() {
  "$1" --benchmark_format=json 2>/dev/null |
    jq -r '.benchmarks[] | [(.name | split("/")[1]), .least_us, .median_us, .least_memsets,
      .median_memsets, .allocations] | @tsv'
}

# best FIELD: of all rounds, the smallest value of that field for each scene, in their order.
best() {
  awk -v field="$1" '!($1 in low) { order[++count] = $1; low[$1] = $field }
    $field < low[$1] { low[$1] = $field }
    END { for (i = 1; i <= count; ++i) print order[i], low[order[i]] }'
}

compare_with() {
  local commit folder old_runs='' new_runs='' round field
  commit=$(git rev-parse --verify --short "$1^{commit}")
  folder=$PWD/build/against/$commit
  [[ -d $folder/source ]] || git worktree add --quiet --detach "$folder/source" "$commit"
  rm -rf "$folder/source/bench"
  cp -r bench "$folder/source/bench" # the same scenes, over that commit's painter
  echo "== Building $commit in build/against/$commit, and this tree in build/release"
  build "$folder/source" "$folder/build"
  build . build/release
  for ((round = 1; round <= rounds; ++round)); do
    echo "== Round $round of $rounds"
    old_runs+=$(measure "$folder/build/bench/painter_bench")$'\n'
    new_runs+=$(measure build/release/bench/painter_bench)$'\n'
  done
  for field in 2 3; do
    ((field == 2)) && echo "== Least microseconds: scene, $commit, this tree, ratio"
    ((field == 3)) && echo "== Median microseconds: scene, $commit, this tree, ratio"
    join <(best $field <<<"${old_runs%$'\n'}" | sort) <(best $field <<<"${new_runs%$'\n'}" | sort) |
      awk '{ printf "%-24s %10.1f %10.1f %6.2f\n", $1, $2, $3, $3 / $2 }'
  done
}

# Puts the table between its two marks on the page.
write_table() {
  local table
  table=$(
    echo '| scene | least, us | median, us | least, memsets | median, memsets | allocations |'
    echo '|---|---|---|---|---|---|'
    measure build/release/bench/painter_bench | awk -F'\t' '{ gsub("_", " ", $1)
      printf "| %s | %.1f | %.1f | %.3f | %.3f | %.0f |\n", $1, $2, $3, $4, $5, $6 }'
  )
  TABLE=$table awk '/<!-- scenes end -->/ { print ENVIRON["TABLE"]; skip = 0 }
    !skip { print } /<!-- scenes -->/ { skip = 1 }' "$page" >"$page.new"
  mv "$page.new" "$page"
}

case ${1:-} in
  '')
    echo "== Building in build/release"
    build . build/release
    echo "== Measuring"
    write_table
    echo "== Wrote the table of $page"
    ;;
  --against)
    compare_with "${2:?--against needs a commit}"
    ;;
  *)
    echo "bench.sh: unknown argument '$1': nothing, or --against COMMIT" >&2
    exit 2
    ;;
esac
