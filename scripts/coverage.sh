#!/usr/bin/env bash
# How much of the code is reached, in lines and branches. `scripts/coverage.sh --help` says more.
set -euo pipefail
cd "$(dirname "$0")/.."

usage() {
  cat <<'END'
Usage: scripts/coverage.sh [--fuzzers]

Without an argument: what the library's unit and thread tests reach of src/ and include/MW/, by file, and line by line
in build/coverage/report.html.

  --fuzzers   what each fuzzer reaches of the code that it is for, with its corpus and what scripts/fuzz.sh has learnt
              in this folder
  --help      this text

Branches that only an exception takes do not count, nor those that the compiler finds to be never taken.
END
}

# build TARGET...
build() {
  if command -v ccache >/dev/null; then
    export CMAKE_C_COMPILER_LAUNCHER=ccache CMAKE_CXX_COMPILER_LAUNCHER=ccache
  fi
  cmake --preset coverage >/dev/null
  cmake --build build/coverage --target "$@"
}

forget() { find build/coverage -name '*.gcda' -delete; }

# report OPTION...: of what has run since forget
report() {
  gcovr --root . --exclude-throw-branches --exclude-unreachable-branches --gcov-ignore-parse-errors --print-summary \
    "$@" build/coverage
}

of_tests() {
  local tests=(core_tests allocation_tests widget_tests text_tests dialog_tests list_tests descriptor_tests
    stress_tests) test
  build "${tests[@]}"
  forget
  for test in "${tests[@]}"; do
    "$(find build/coverage/tests -type f -name "$test" -perm -u+x)" --gtest_brief=1
  done
  report --filter src/ --filter include/MW/ --html-details build/coverage/report.html
}

# of_fuzzers NAME... -- PREFIX...: what these reach together of the files whose paths begin so
of_fuzzers() {
  local name prefix filters=() names=()
  while [[ $1 != -- ]]; do
    names+=("$1")
    shift
  done
  shift
  for prefix in "$@"; do filters+=(--filter "$prefix"); done
  forget
  for name in "${names[@]}"; do
    mkdir -p "build/fuzz/learnt/$name"
    "build/coverage/fuzz/fuzz_$name" "fuzz/corpus/$name" "build/fuzz/learnt/$name" >/dev/null
  done
  echo "== ${names[*]}: of $*"
  report "${filters[@]}" --output build/coverage/fuzzers.txt
}

of_all_fuzzers() {
  local remote=platform/pc/remote library=(src/ include/MW/) names name
  mapfile -t names < <(ls fuzz/corpus)
  build "${names[@]/#/fuzz_}"
  for name in widget_events texts api_calls; do of_fuzzers "$name" -- "${library[@]}"; done
  of_fuzzers widget_events texts api_calls -- "${library[@]}"
  of_fuzzers trace_files -- platform/pc/input/{trace_{attempts,parser,runner,steps,words},line_file,script_fingers}
  of_fuzzers result_files -- apps/factory_test/results/{results_json,test_result,utc_time}
  of_fuzzers plan_files -- apps/factory_test/plan/{json_lines,plan_json,plan_reader}
  of_fuzzers session_files -- tools/replay/session.cpp
  of_fuzzers viewers -- $remote/{action_queue,caller,hosts,message_gate,viewer_hands,web_answers}
}

case "$*" in
  "") of_tests ;;
  --fuzzers) of_all_fuzzers ;;
  --help) usage ;;
  *)
    echo "coverage.sh: unknown option '$1' (try --help)" >&2
    exit 2
    ;;
esac
