#!/usr/bin/env bash
# Builds the example application and runs it; the arguments go to it. Paths in them are the caller's.
set -euo pipefail
here=$(cd "$(dirname "$0")/.." && pwd)
program=$here/build/release/apps/factory_test/factory_test

for argument in "$@"; do
  [[ $argument == --help || $argument == -h ]] || continue
  [[ -x $program ]] && exec "$program" --help
  echo "Usage: scripts/run.sh [OPTION]..."
  echo "Builds the example application and runs it; what its options are, it says once it is built."
  exit 0
done

"$here/scripts/install_packages.sh"
echo "== Building in build/release"
(
  cd "$here"
  [[ -f build/release/build.ninja ]] || cmake --preset release >/dev/null
  cmake --build --preset release --target factory_test
)
if [[ -z ${DISPLAY:-}${WAYLAND_DISPLAY:-} && -z ${BRIMOL_DISPLAY:-} && " $* " != *" --headless "* ]]; then
  echo "== No display is there: open the address below in a browser (docs/browser.md)"
  export BRIMOL_DISPLAY=browser
fi
echo "== Starting $program $*"
exec "$program" "$@"
