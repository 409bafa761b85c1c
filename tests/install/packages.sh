# The Debian packages hold no fault that lintian knows, and what they need is named.
. "$SOURCE/tests/install/common.sh"
rm -rf "$WORK/packages"
cpack --config "$BUILD/CPackConfig.cmake" -B "$WORK/packages" >"$WORK/packages.log" 2>&1 ||
  { cat "$WORK/packages.log" && fail "cpack failed."; }
cd "$WORK/packages"
lintian --allow-root --fail-on error ./*.deb

needs() {
  grep -qE -- "(^|, )$2( |,|\$)" <<<"$(dpkg-deb --field ./"$1"_*.deb Depends)" ||
    fail "$1 does not need $2."
}
library=libbrimol3-widget$INTERFACE
needs "$library" android-libutils
needs "$library" libsdl2-2.0-0
needs "$library" 'libwebsockets[0-9]+'
needs "$library" fonts-roboto
needs libbrimol3-widget-dev "$library"
needs brimol3-widget-tools "$library"
dpkg-deb --extract ./"$library"_*.deb library
grep -q "not chosen a licence" "library/usr/share/doc/$library/copyright" ||
  fail "The copyright file says nothing of a licence."
