# What the scripts of this folder share. The build sets SOURCE, BUILD, WORK, LIBRARIES (the libraries'
# folder under the prefix), INTERFACE (its version), CC, CXX, CLANG and CLANGXX.
set -euo pipefail
here=$SOURCE/tests/install
staged=$WORK/moved

fail() {
  echo "$*" >&2
  exit 1
}
