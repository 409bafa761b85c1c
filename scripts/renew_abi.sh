#!/usr/bin/env bash
# Accepts the interface as it is now: renews what tests/install compares with, which is the library's
# binary interface, the PC platform's calls and the list of installed files. Look at what changed before
# you commit it; docs/compatibility.md says what a change asks for.
set -euo pipefail
cd "$(dirname "$0")/.."

scripts/install_packages.sh
echo "== Building in build/release and build/interface"
cmake --preset release >/dev/null
cmake --build --preset release
cmake -S tests/install/outer -B build/interface "-DBRIMOL=$PWD" -DCMAKE_CXX_FLAGS="-g -O0" >/dev/null
cmake --build build/interface --parallel "$(nproc)"

echo "== Renewing tests/install/abi and tests/install/files.txt"
abidw --exported-interfaces-only --drop-undefined-syms --no-corpus-path --no-comp-dir-path \
  --no-show-locs --type-id-style hash build/interface/brimol/src/libbrimol3_widget.so |
  sed "s#$PWD/##" >tests/install/abi/brimol3_widget.abi
nm --dynamic --defined-only --format=just-symbols build/release/platform/pc/libbrimol_pc.so |
  LC_ALL=C sort >tests/install/abi/brimol_pc.txt
staged=$(mktemp --directory)
trap 'rm -rf "$staged"' EXIT
cmake --install build/release --prefix "$staged" >/dev/null
tests/install/list_files.sh "$staged" >tests/install/files.txt
echo "== Changed"
git status --short -- tests/install
