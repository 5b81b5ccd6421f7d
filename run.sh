#!/usr/bin/env bash
# Sets up what is missing, builds, and runs the program with the given arguments. `./run.sh page` builds
# and serves the page instead.
set -euo pipefail
source "$(dirname "$(readlink -f "${BASH_SOURCE[0]}")")/cmake/setup.sh"
if [ "${1:-}" = page ]; then
    source "$root/cmake/javascript.sh"
    source "$root/cmake/web.sh"
    show_page "${@:2}"
fi
build_program
exec "$root/build/release/bin/brindle" "$@"
