# Every library and program is compiled and linked with the checks that its build promises.
. "$SOURCE/tests/install/common.sh"
libraries=("$staged/$LIBRARIES"/libbrimol*.so)
programs=("$staged"/bin/*)

# Marks of jumps are looked for below: with Debian's start files no file tells of them itself.
hardening-check --nopie --nocfprotection "${libraries[@]}" || fail "A library lacks a check."
hardening-check --nocfprotection "${programs[@]}" || fail "A program lacks a check."
for file in "${libraries[@]}" "${programs[@]}"; do
  headers=$(readelf --wide --segments --dynamic "$file")
  ! grep -q 'TEXTREL' <<<"$headers" || fail "$file has relocations in its code."
  ! grep -E 'GNU_STACK.* RWE ' <<<"$headers" || fail "$file wants an executable stack."
done

# unmarked FILE SYMBOLS: where functions of a table of symbols begin without a mark for jumps.
unmarked() {
  local marked
  marked=$(objdump --disassemble --no-show-raw-insn "$1" |
    awk '/endbr64/ && label != "" { print label } { label = /^[0-9a-f]+ <.*>:$/ ? $1 : "" }' | sort -u)
  comm -23 <(awk '$2 == "T" { print $1 }' <<<"$2" | sort -u) <(echo "$marked")
}

flags="-fstack-clash-protection"
if [[ $(uname -m) == x86_64 ]]; then
  flags+=" -fcf-protection"
  for file in "${libraries[@]}"; do
    symbols=$(nm --dynamic --defined-only "$file")
    grep -q ' T ' <<<"$symbols" || fail "$file exports no function."
    [[ -z $(unmarked "$file" "$symbols") ]] || fail "$file: exported functions have no marks."
  done
  for file in "${programs[@]}"; do
    main=$(nm --defined-only "$file" | grep ' T main$') || fail "$file has no main function."
    [[ -z $(unmarked "$file" "$main") ]] || fail "$file: the main function has no mark."
  done
fi

# The build's commands. blhc takes them for those of a Debian package; it does not know all flags.
targets=()
for file in "${libraries[@]##*/lib}" "${programs[@]##*/}"; do targets+=("${file%.so}"); done
commands=$(ninja -C "$BUILD" -t commands "${targets[@]}")
awk -v flags="$flags" '
  / -o [^ ]*\.o -c / {
    compiled = 1
    count = split(flags, wanted, " ")
    for (i = 1; i <= count; ++i) if (!index($0 " ", " " wanted[i] " ")) { print; exit missing = 1 }
  }
  END { exit missing || !compiled }' <<<"$commands" || fail "The command above lacks one of $flags."
{
  echo "dpkg-buildpackage: info: source package brimol3-widget"
  echo "$commands"
} >"$WORK/commands"
blhc --bindnow --ignore-flag=-g --arch="$(dpkg --print-architecture)" "$WORK/commands" ||
  fail "The commands above lack a flag."
