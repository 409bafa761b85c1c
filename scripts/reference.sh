#!/usr/bin/env bash
# Writes the reference of the public headers as HTML: scripts/reference.sh [FOLDER] (build/reference)
set -euo pipefail
cd "$(dirname "$0")/.."

folder=${1:-build/reference}
mkdir -p "$folder"
doxygen - < <(
  cat docs/reference/Doxyfile
  echo "OUTPUT_DIRECTORY = \"$folder\""
  echo "PROJECT_NUMBER = $(sed -n 's/^ *VERSION \([0-9.]*\)$/\1/p' CMakeLists.txt)"
)
echo "== Written: $folder/html/index.html"
