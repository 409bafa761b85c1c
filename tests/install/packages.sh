# The Debian packages hold no fault that lintian knows, and what they need is named.
. "$SOURCE/tests/install/common.sh"
rm -rf "$WORK/packages"
cpack --config "$BUILD/CPackConfig.cmake" -B "$WORK/packages" >"$WORK/packages.log" 2>&1 ||
  { cat "$WORK/packages.log" && fail "cpack failed."; }
cd "$WORK/packages"
lintian --allow-root --fail-on error ./*.deb

needs() {
  dpkg-deb --field ./"$1"_*.deb Depends | grep -qE -- "(^|, )$2( |,|\$)" || fail "$1 does not need $2."
}
library=libbrimol3-widget$INTERFACE
needs "$library" android-libutils
needs "$library" libsdl2-2.0-0
needs "$library" fonts-roboto
needs libbrimol3-widget-dev "$library"
needs brimol3-widget-tools "$library"
dpkg-deb --fsys-tarfile ./"$library"_*.deb | tar -xO "./usr/share/doc/$library/copyright" |
  grep -q "not chosen a licence" || fail "The copyright file says nothing of a licence."
