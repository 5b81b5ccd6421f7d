#!/usr/bin/env bash
# Sets up what is missing, builds everything, and runs the tests; arguments go to ctest.
set -euo pipefail
cd_root=$(cd "$(dirname "${BASH_SOURCE[0]}")" && pwd)
source "$cd_root/cmake/setup.sh"
build_release all
exec ctest --test-dir "$cd_root/build/release" --output-on-failure -j "$(nproc)" "$@"
