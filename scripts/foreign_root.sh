#!/usr/bin/env bash
# Unpacks what a build for another architecture needs into a folder. `scripts/foreign_root.sh --help` says which.
set -euo pipefail
cd "$(dirname "$0")/.."

usage() {
  cat <<'END'
Usage: scripts/foreign_root.sh i386|arm64|armhf

Unpacks Debian's own packages of that architecture into build/roots/ARCHITECTURE, for a build's preset of that name.
The machine's packages and its list of architectures stay as they are. A complete folder is kept.

  --help   this text
END
}

fail_usage() {
  echo "foreign_root.sh: $1 (try --help)" >&2
  exit 2
}

architecture=${1:-}
case $architecture in
  --help) usage; exit ;;
  i386 | arm64 | armhf) ;;
  '') fail_usage "which architecture?" ;;
  *) fail_usage "unknown architecture or option '$architecture'" ;;
esac
(($# == 1)) || fail_usage "one architecture at a time"

packages=(libc6-dev libstdc++-12-dev android-libutils-dev android-liblog-dev libgtest-dev libgmock-dev)
root=$PWD/build/roots/$architecture
complete=$root/packages.txt

if [[ -f $complete && $(<"$complete") == "${packages[*]}" ]]; then
  exit 0
fi
echo "== Unpacking packages of $architecture into build/roots/$architecture"
rm -rf "$root"
apt=$root/apt
mkdir -p "$apt/state/lists/partial" "$apt/cache/archives/partial"
: >"$apt/status"
private_apt() {
  apt-get -qq -o "Dir::State=$apt/state" -o "Dir::State::status=$apt/status" -o "Dir::Cache=$apt/cache" \
    -o "APT::Architecture=$architecture" -o "APT::Architectures=$architecture" -o Debug::NoLocking=1 \
    -o APT::Sandbox::User="$(id -un)" "$@"
}
private_apt update || echo "Some lists of packages are missing; going on with the others." >&2
private_apt install --download-only --no-install-recommends --yes "${packages[@]}" >/dev/null
for package in "$apt"/cache/archives/*.deb; do dpkg-deb -x "$package" "$root"; done
rm -rf "$apt"
echo "${packages[*]}" >"$complete"
