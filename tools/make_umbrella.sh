#!/usr/bin/env bash
# Writes brindle/brindle.h, which includes every public header; with --check only tells whether it is
# as it would be written.
set -euo pipefail
cd "$(dirname "$(readlink -f "$0")")/.."

umbrella() {
    cat <<'TEXT'
// SPDX-License-Identifier: MIT
#pragma once

/// Everything a host needs, in one include. Made by tools/make_umbrella.sh.

TEXT
    find brindle -name '*.h' ! -path brindle/brindle.h ! -path '*/internal/*' ! -path '*/internal/*' | LC_ALL=C sort | sed 's/.*/#include "&"/'
}

if [ "${1:-}" = --check ]; then
    umbrella | diff brindle/brindle.h - || { echo "run tools/make_umbrella.sh" >&2; exit 1; }
else
    umbrella >brindle/brindle.h
fi
