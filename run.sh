#!/usr/bin/env bash
# Sets up what is missing, builds, and runs the program with the given arguments.
set -euo pipefail
source "$(dirname "$(readlink -f "${BASH_SOURCE[0]}")")/cmake/setup.sh"
build_program
exec "$root/build/release/bin/brindle" "$@"
