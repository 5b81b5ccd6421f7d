#!/usr/bin/env bash
# Sets up what is missing, builds everything, and runs the tests; arguments go to ctest.
set -euo pipefail
source "$(dirname "$(readlink -f "${BASH_SOURCE[0]}")")/cmake/setup.sh"
build release all
exec ctest --test-dir "$root/build/release" --output-on-failure -j "$(nproc)" "$@"
