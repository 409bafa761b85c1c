# What the scripts of this folder share. The build sets SOURCE, BUILD, WORK, LIBRARIES (the libraries'
# folder under the prefix), INTERFACE (its version), CC, CXX, CLANG and CLANGXX.
set -euo pipefail
here=$SOURCE/tests/install
staged=$WORK/moved

# With pipefail a search that ends at its first find would fail the command that still writes, so what
# a command prints is searched as `grep -q ... <<<"$(command)"`.
fail() {
  echo "$*" >&2
  exit 1
}
