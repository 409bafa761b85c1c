# The guide's application is built with pkg-config against the moved installation, too, and draws the
# same; a C program, built both ways, calls the entry points for C; a missing component is named.
. "$SOURCE/tests/install/common.sh"
export BRIMOL_DISPLAY=headless PKG_CONFIG_PATH=$staged/$LIBRARIES/pkgconfig
guide=$WORK/guide/bench
out=$WORK/application
rm -rf "$out"
mkdir -p "$out"

flags=$(pkg-config --cflags --libs brimol3_widget-pc)
path=-Wl,-rpath,$staged/$LIBRARIES
# shellcheck disable=SC2086 # the flags are several words
"$CXX" -std=c++20 "$guide"/src/*.cpp $flags "$path" -o "$out/bench"
grep -q "libbrimol3_widget.so.$INTERFACE => $staged/" <<<"$(ldd "$out/bench")" ||
  fail "The program does not run with the installed library."
BRIMOL_TRACE=$guide/traces/lamp.trace BRIMOL_REPORT_DIR=$out/report "$out/bench"
cmp "$out/report/menu.png" "$guide/report/menu.png"

export BRIMOL_SCREEN=400x300
cmake -S "$here/c_program" -B "$out/c_program" "-DCMAKE_PREFIX_PATH=$staged" >"$out/configured"
cmake --build "$out/c_program"
"$out/c_program/c_program"
# shellcheck disable=SC2086
"$CC" -std=c11 -Wall -Wextra -Wpedantic -Werror "$here/c_program/main.c" $flags "$path" \
  -o "$out/c_by_pkg_config"
"$out/c_by_pkg_config"

mkdir "$out/unknown"
cat >"$out/unknown/CMakeLists.txt" <<'END'
cmake_minimum_required(VERSION 3.25)
project(unknown LANGUAGES CXX)
find_package(brimol3_widget 0.1 REQUIRED COMPONENTS nonsense)
END
if cmake -S "$out/unknown" -B "$out/unknown/build" "-DCMAKE_PREFIX_PATH=$staged" >"$out/unknown.log" 2>&1; then
  fail "A component that does not exist was found."
fi
grep -q nonsense "$out/unknown.log" || fail "The missing component is not named."
