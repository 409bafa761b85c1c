#!/usr/bin/env bash
# Installs the Debian packages of cmake/packages.txt that are missing. Nothing missing: does nothing.
set -euo pipefail
cd "$(dirname "$0")/.."

missing=()
while read -r package; do
  state=$(dpkg-query --show --showformat='${db:Status-Status}' "$package" 2>/dev/null || true)
  [[ $state == installed ]] || missing+=("$package")
done < <(grep -v '^#' cmake/packages.txt)

if ((${#missing[@]} == 0)); then
  echo "== All packages are installed."
  exit 0
fi

echo "== Installing ${#missing[@]} packages: ${missing[*]}"
as_root=()
if ((EUID != 0)); then
  command -v sudo >/dev/null || { echo "Run this as root, or install sudo." >&2; exit 1; }
  as_root=(sudo)
fi
"${as_root[@]}" apt-get -qq update
"${as_root[@]}" env DEBIAN_FRONTEND=noninteractive \
  apt-get -qq install --yes --no-install-recommends "${missing[@]}" >/dev/null
