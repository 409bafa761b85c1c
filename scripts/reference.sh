#!/usr/bin/env bash
# Writes the reference of the public headers as HTML. `scripts/reference.sh --help` says where.
set -euo pipefail
cd "$(dirname "$0")/.."

usage() {
  cat <<'END'
Usage: scripts/reference.sh [FOLDER]

Writes the reference of the public headers as HTML into FOLDER/html; FOLDER is build/reference when not said.
Any warning and any name without a comment fails.

  --help   this text
END
}

fail_usage() {
  echo "reference.sh: $1 (try --help)" >&2
  exit 2
}

folder=${1:-build/reference}
case $folder in
  --help) usage; exit ;;
  -*) fail_usage "unknown option '$folder'" ;;
esac
(($# <= 1)) || fail_usage "one folder at most"

mkdir -p "$folder"
doxygen - < <(
  cat docs/reference/Doxyfile
  echo "OUTPUT_DIRECTORY = \"$folder\""
  echo "PROJECT_NUMBER = $(sed -n 's/^ *VERSION \([0-9.]*\)$/\1/p' CMakeLists.txt)"
)
echo "== Written: $folder/html/index.html"
