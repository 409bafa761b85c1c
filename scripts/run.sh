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

# Only the program itself writes to stdout.
{
  "$here/scripts/install_packages.sh"
  echo "== Building in build/release"
  (
    cd "$here"
    [[ -f build/release/build.ninja ]] || cmake --preset release >/dev/null
    cmake --build --preset release --target factory_test
  )
} >&2

# needs_screen ARGUMENT...: not for what prints something, nor for --headless.
needs_screen() {
  [[ ${1:-} != export && ${1:-} != report ]] || return 1
  local argument
  for argument in "$@"; do
    case $argument in --headless | --shot | --shot=* | --monkey | --monkey=* | --print-plan | --version) return 1 ;; esac
  done
}

if [[ -z ${DISPLAY:-}${WAYLAND_DISPLAY:-} && -z ${BRIMOL_DISPLAY:-} ]] && needs_screen "$@"; then
  echo "== No display is there: open the address below in a browser (docs/browser.md)" >&2
  export BRIMOL_DISPLAY=browser
fi
echo "== Starting $program $*" >&2
exec "$program" "$@"
