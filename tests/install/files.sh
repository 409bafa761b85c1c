# The installed files are those of the committed list, hold no path of the build, and are what the bill
# of materials says.
. "$SOURCE/tests/install/common.sh"
cd "$staged"

"$here/list_files.sh" "$staged" | diff -u "$here/files.txt" - ||
  fail "Other files are installed: where that is wanted, scripts/renew_abi.sh renews the list."

for path in "$SOURCE" "$BUILD" "$WORK"; do
  ! grep -rlF -e "$path" . || fail "The files above name a folder of the build, $path."
done

python3 "$SOURCE/tests/links_test.py" share/doc/brimol3_widget || fail "Installed pages lead nowhere."

bill=share/doc/brimol3_widget/brimol3_widget.spdx
sed -n 's/^FileName: \.\///p' "$bill" | sort >"$WORK/billed"
find . -type f ! -name '*.spdx' -printf '%P\n' | sort | diff -u "$WORK/billed" - ||
  fail "The bill of materials does not name each file."
sed -n 's/^FileName: //p; s/^FileChecksum: SHA256: //p' "$bill" |
  while read -r file && read -r sum; do echo "$sum  $file"; done | sha256sum --check --quiet
for package in libsdl2-2.0-0 android-libutils; do
  grep -q "DEPENDS_ON SPDXRef-Debian-$package\$" "$bill" || fail "The bill does not name $package."
done
