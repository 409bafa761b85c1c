# Which of our sources start programs or load libraries: the command of `--shell`, the application that
# brimol-replay was given and the shell that ends it with brimol-replay, and the libraries of a display. So no
# file that is read can do either.
. "$SOURCE/tests/install/common.sh"
wanted="apps/factory_test/command.cpp posix_spawn
platform/pc/libraries/on_demand.cpp dlopen
tools/replay/run.cpp posix_spawnp"
cd "$BUILD"
found=$(find apps platform src testkit tools -name '*.o' -print0 | xargs -0 nm --print-file-name --undefined-only |
  sed -nE 's|CMakeFiles/[^/]*\.dir/||; s/\.o: +U (dlm?open|exec[lv]p?e?|execveat|fexecve|v?fork|clone|popen|posix_spawnp?|system|wordexp)(@.*)?$/ \1/p' |
  sort -u)
diff <(echo "$wanted") <(echo "$found") || fail "Other sources than the expected ones (<) start programs."
