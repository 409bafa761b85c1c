# The library comes out the same to the last byte where it is built once more, in another folder, at another time
# and under other settings. Without a cache of compiled sources, which would answer with what it has.
. "$SOURCE/tests/install/common.sh"
export CCACHE_DISABLE=1 LC_ALL=C TZ=Asia/Tokyo SOURCE_DATE_EPOCH=1
umask 077

again=$WORK/reproducible/much/deeper
rm -rf "$WORK/reproducible"
mkdir -p "$again/source"
for each in "$SOURCE"/*; do
  [[ ${each##*/} == build ]] || cp -r "$each" "$again/source"
done
cmake -S "$again/source" -B "$again/build" -G Ninja -DCMAKE_BUILD_TYPE=Release -DCMAKE_CXX_COMPILER="$CXX" \
  -DBRIMOL_TESTS=OFF -DBRIMOL_APPLICATIONS=OFF -DBRIMOL_BENCHMARKS=OFF >/dev/null
cmake --build "$again/build" --target brimol3_widget >/dev/null
library=src/libbrimol3_widget.so
cmp "$BUILD/$library" "$again/build/$library" ||
  fail "Two builds differ: see diffoscope $BUILD/$library $again/build/$library"
rm -rf "$WORK/reproducible"
