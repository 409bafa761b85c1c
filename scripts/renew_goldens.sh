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
# In the build's folder, where the picture widget finds its picture.
(cd build/release/tests/golden && BRIMOL_RENEW_GOLDENS=1 ./golden_test --gtest_brief=1)
echo "== Changed"
git status --short --untracked-files=all -- tests/golden/data
