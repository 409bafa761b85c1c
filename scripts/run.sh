#!/usr/bin/env bash
# Builds the example application and runs it; the arguments go to it (try --help).
set -euo pipefail
cd "$(dirname "$0")/.."

scripts/install_packages.sh
echo "== Building in build/release"
[[ -f build/release/build.ninja ]] || cmake --preset release >/dev/null
cmake --build --preset release --target factory_test
if [[ -z ${DISPLAY:-}${WAYLAND_DISPLAY:-} && $# == 0 ]]; then
  echo "== There is no display: it draws to memory. --shot FILE.png shows what; Ctrl-C ends it."
fi
echo "== Starting build/release/apps/factory_test/factory_test $*"
exec build/release/apps/factory_test/factory_test "$@"
