#!/usr/bin/env bash
# Makes the reference of the library in build/reference/index.html, from the public headers and the
# guides in docs/. A type, function or field without its line is an error, and so is all else that
# doxygen warns of.
set -euo pipefail
source "$(dirname "$(readlink -f "${BASH_SOURCE[0]}")")/../cmake/setup.sh"
cd "$root"
need_packages doxygen
mkdir -p build/reference
log=build/reference.log
doxygen docs/Doxyfile >"$log" 2>&1 || true
if grep . "$log"; then exit 1; fi
test -e build/reference/index.html
