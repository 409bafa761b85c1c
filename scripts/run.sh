#!/usr/bin/env bash
# Builds the example application and runs it; the arguments go to it (try --help).
set -euo pipefail
cd "$(dirname "$0")/.."

scripts/install_packages.sh
echo "== Building in build/release"
[[ -f build/release/build.ninja ]] || cmake --preset release >/dev/null
cmake --build --preset release --target factory_test
if [[ -z ${DISPLAY:-}${WAYLAND_DISPLAY:-} ]]; then
  export BRIMOL_DISPLAY=${BRIMOL_DISPLAY:-browser} # it prints the address; docs/browser.md
fi
echo "== Starting build/release/apps/factory_test/factory_test $*"
exec build/release/apps/factory_test/factory_test "$@"
