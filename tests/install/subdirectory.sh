# In another project this one is the library alone: no tests, no programs, no installation, no settings
# that reach the other project (its CMakeLists.txt looks at that).
. "$SOURCE/tests/install/common.sh"
outer=$WORK/outer
cmake -S "$here/outer" -B "$outer" "-DBRIMOL=$SOURCE" -DCMAKE_CXX_FLAGS="-g -O0"
cmake --build "$outer" --parallel "$(nproc)"
grep -q 'Total Tests: 0' <<<"$(ctest --test-dir "$outer" -N)" || fail "The subdirectory registers tests."
cmake --install "$outer" --prefix "$WORK/outer_installed"
[[ ! -d $WORK/outer_installed ]] || fail "The subdirectory installs files."
