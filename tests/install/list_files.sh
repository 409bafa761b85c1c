#!/usr/bin/env bash
# The installed files under a prefix, in the form of files.txt: list_files.sh PREFIX
set -euo pipefail
(cd "$1" && find . ! -type d -printf '%P\n') |
  sed -E 's#^lib/[^/]*-linux-gnu[^/]*/#lib/#' | LC_ALL=C sort
