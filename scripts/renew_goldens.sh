#!/usr/bin/env bash
# Draws the golden item lists and pictures anew, writes docs/gallery.md, which shows them, and names
# what differs from the last commit. Look at each of them before you commit it.
set -euo pipefail
cd "$(dirname "$0")/.."

scripts/install_packages.sh
echo "== Building in build/release"
cmake --preset release >/dev/null
cmake --build --preset release --target golden_test brimol_gallery
echo "== Drawing into tests/golden/data"
mkdir -p tests/golden/data
data=$PWD/tests/golden/data
# In the build's folder, where the picture widget finds its picture; without the widgets' log.
(cd build/release/tests/golden && ./golden_test --renew "$data" 2> >(grep -v '^BRIMOL_' >&2))
echo "== Writing docs/gallery.md"
build/release/apps/gallery/brimol_gallery --document >docs/gallery.md
echo "== Changed"
git status --short --untracked-files=all -- tests/golden/data docs/gallery.md
