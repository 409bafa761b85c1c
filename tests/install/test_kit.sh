# A test program without a framework is built against the moved installation, and passes. The kit
# supplies every call that the PC platform does, so that a screen of any application links with it.
. "$SOURCE/tests/install/common.sh"
out=$WORK/test_kit
rm -rf "$out"
cmake -S "$here/test_kit" -B "$out/build" "-DCMAKE_PREFIX_PATH=$staged" >/dev/null
cmake --build "$out/build"
"$out/build/test_kit" "$out/goldens"

calls() {
  nm --dynamic --defined-only --format=just-symbols "$staged/$LIBRARIES/$1" | grep -v '^_' | LC_ALL=C sort
}
calls libbrimol3_widget_test.so | LC_ALL=C comm -13 - <(calls libbrimol_pc.so) >"$out/missing"
[[ ! -s $out/missing ]] || fail "The kit does not supply: $(cat "$out/missing")"
