#!/usr/bin/env bash
# hardening.sh FILE...: whether a program or shared library is built as cmake/Hardening.cmake says.
set -euo pipefail

failures=0
# expect WHAT PATTERN OPTION...: what readelf shows with the options must match the pattern.
expect() {
    local what=$1 pattern=$2
    shift 2
    # Not by a pipe: grep would end before readelf has written all.
    local shown
    shown=$(readelf --wide "$@")
    if ! grep --quiet --extended-regexp "$pattern" <<<"$shown"; then
        echo "$file: $what is missing"
        failures=$((failures + 1))
    fi
}

for file in "$@"; do
    expect "a place that is free to choose (PIE)" 'Type: +DYN' --file-header "$file"
    expect "RELRO" 'GNU_RELRO' --program-headers "$file"
    expect "binding at start" 'BIND_NOW|FLAGS_1.* NOW' --dynamic "$file"
    expect "the stack protector" '__stack_chk_fail' --dyn-syms "$file"
    expect "_FORTIFY_SOURCE" '__[a-z]+_chk@' --dyn-syms "$file"
done
exit $((failures > 0))
