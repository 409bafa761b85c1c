#!/usr/bin/env bash
# Draws the golden item lists and pictures anew and names those that differ from the last commit.
# Look at each of them before you commit it.
set -euo pipefail
cd "$(dirname "$0")/.."

scripts/install_packages.sh
echo "== Building in build/release"
cmake --preset release >/dev/null
cmake --build --preset release --target golden_test
echo "== Drawing into tests/golden/data"
mkdir -p tests/golden/data
data=$PWD/tests/golden/data
# In the build's folder, where the picture widget finds its picture; without the widgets' log.
(cd build/release/tests/golden && ./golden_test --renew "$data" 2> >(grep -v '^BRIMOL_' >&2))
echo "== Changed"
git status --short --untracked-files=all -- tests/golden/data
