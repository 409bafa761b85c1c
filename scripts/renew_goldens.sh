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
# In the build's folder, where the picture widget finds its picture.
(cd build/release/tests/golden && BRIMOL_RENEW_GOLDENS=1 ./golden_test --gtest_brief=1 \
  --gtest_filter='*Golden*')
echo "== Writing docs/gallery.md"
build/release/apps/gallery/brimol_gallery --document >docs/gallery.md
echo "== Changed"
git status --short --untracked-files=all -- tests/golden/data docs/gallery.md
