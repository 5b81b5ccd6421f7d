#!/usr/bin/env bash
# Writes what the program shows now into tests/cli/golden, for review with git diff.
set -euo pipefail
source "$(dirname "$(readlink -f "${BASH_SOURCE[0]}")")/../cmake/setup.sh"
build release all
BRINDLE_RENEW_GOLDEN=1 "$root/build/release/bin/test_cli"
git -C "$root" status --short -- tests/cli/golden
