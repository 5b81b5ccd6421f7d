#!/usr/bin/env bash
# host.sh PROGRAM EXPECTED: runs the example of a host in C and compares what it prints.
set -euo pipefail
"$1" | diff "$2" -
