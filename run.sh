#!/usr/bin/env bash
# Sets up what is missing, builds, and runs the program with the given arguments.
set -euo pipefail
cd_root=$(cd "$(dirname "${BASH_SOURCE[0]}")" && pwd)
source "$cd_root/cmake/setup.sh"
build_release brindle_cli
exec "$cd_root/build/release/bin/brindle" "$@"
