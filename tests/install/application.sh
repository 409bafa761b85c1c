# A program is built against the moved installation, with CMake and with pkg-config, runs, and draws the
# same either way; a C program calls the entry points for C.
. "$SOURCE/tests/install/common.sh"
export BRIMOL_DISPLAY=headless BRIMOL_SCREEN=400x300
export PKG_CONFIG_PATH=$staged/$LIBRARIES/pkgconfig
out=$WORK/application
rm -rf "$out"
mkdir -p "$out"

for project in application c_program; do
  cmake -S "$here/$project" -B "$out/$project" "-DCMAKE_PREFIX_PATH=$staged" >"$out/configured"
  cmake --build "$out/$project"
done

flags=$(pkg-config --cflags --libs brimol3_widget-pc)
path=-Wl,-rpath,$staged/$LIBRARIES
# shellcheck disable=SC2086 # the flags are several words
"$CXX" -std=c++20 "$here/application/main.cpp" $flags "$path" -o "$out/by_pkg_config"
# shellcheck disable=SC2086
"$CC" -std=c11 -Wall -Wextra -Wpedantic -Werror "$here/c_program/main.c" $flags "$path" \
  -o "$out/c_by_pkg_config"

for program in application/application by_pkg_config; do
  "$out/$program" "$out/empty.png" "$out/$(basename "$program").png"
  grep -q "libbrimol3_widget.so.$INTERFACE => $staged/" <<<"$(ldd "$out/$program")" ||
    fail "$program does not run with the installed library."
done
cmp "$out/application.png" "$out/by_pkg_config.png"
! cmp -s "$out/application.png" "$out/empty.png" || fail "The button was not drawn."
"$out/c_program/c_program"
"$out/c_by_pkg_config"

if cmake -S "$here/application" -B "$out/unknown" "-DCMAKE_PREFIX_PATH=$staged" \
  -DCOMPONENTS=nonsense >"$out/unknown.log" 2>&1; then
  fail "A component that does not exist was found."
fi
grep -q nonsense "$out/unknown.log" || fail "The missing component is not named."
