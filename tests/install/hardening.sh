# The shared libraries are linked so that nothing of them is both writable and executable, and compiled with
# the checks that their build promises.
. "$SOURCE/tests/install/common.sh"

for library in "$staged/$LIBRARIES"/libbrimol*.so; do
  headers=$(readelf --wide --segments --dynamic "$library")
  grep -q 'GNU_RELRO' <<<"$headers" || fail "$library has no RELRO."
  grep -qE 'FLAGS.*NOW' <<<"$headers" || fail "$library binds its symbols while it runs."
  ! grep -q 'TEXTREL' <<<"$headers" || fail "$library has relocations in its code."
  ! grep -E 'GNU_STACK.* RWE ' <<<"$headers" || fail "$library wants an executable stack."
done

# Marks of jumps are looked for in the code: with Debian's start files no library tells of them itself.
for library in "$staged/$LIBRARIES"/libbrimol{3_widget,_pc}.so; do
  hardening-check --nopie --nocfprotection "$library" || fail "A check is missing."
  if [[ $(uname -m) == x86_64 ]]; then
    grep -q endbr64 <<<"$(objdump --disassemble --no-show-raw-insn "$library")" || fail "Jumps have no marks."
  fi
done

# blhc reads the commands of a Debian package's build.
{
  echo "dpkg-buildpackage: info: source package brimol3-widget"
  ninja -C "$BUILD" -t commands brimol3_widget brimol_pc | grep -E '/src/|/platform/pc/|libbrimol'
} >"$WORK/commands"
blhc --bindnow --ignore-flag=-g --arch="$(dpkg --print-architecture)" "$WORK/commands" ||
  fail "The commands above lack a flag."
