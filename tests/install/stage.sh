# Installs into one folder and moves it away, so that what still names the first one breaks.
. "$SOURCE/tests/install/common.sh"
rm -rf "$WORK/first" "$staged"
cmake --install "$BUILD" --prefix "$WORK/first"
mv "$WORK/first" "$staged"
