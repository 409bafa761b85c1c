# The library's binary interface is the accepted one. It is read from the build of subdirectory.sh, which
# has the symbols that this needs.
. "$SOURCE/tests/install/common.sh"
abidiff --exported-interfaces-only "$here/abi/brimol3_widget.abi" \
  "$WORK/outer/brimol/src/libbrimol3_widget.so" ||
  fail "The interface has changed: docs/compatibility.md says how a change is accepted."
nm --dynamic --defined-only --format=just-symbols "$BUILD/platform/pc/libbrimol_pc.so" |
  LC_ALL=C sort | diff -u "$here/abi/brimol_pc.txt" - || fail "The PC platform exports other calls."
