# Every installed header compiles alone, by both compilers and without a warning. One that speaks of
# __cplusplus promises C, too.
. "$SOURCE/tests/install/common.sh"
cd "$staged/include"
warnings='-Wall -Wextra -Wpedantic -Wshadow -Werror -fsyntax-only -I.'
{
  find . -name '*.h' | while read -r header; do
    for compiler in "$CXX" "$CLANGXX"; do
      echo "$compiler -std=c++20 $warnings -x c++ -include $header /dev/null"
    done
  done
  grep -rl __cplusplus . | while read -r header; do
    for compiler in "$CC" "$CLANG"; do
      echo "$compiler -std=c11 $warnings -x c -include $header /dev/null"
    done
  done
} >"$WORK/headers"
(($(grep -c 'std=c11' "$WORK/headers") >= 16)) || fail "Headers for C are missing."
xargs -P "$(nproc)" -I{} sh -c '{}' <"$WORK/headers"
