#!/usr/bin/env bash
# fuzz/run.sh [SECONDS]: builds every fuzzer and runs each for so many seconds (10). What
# it finds on its way stays in build/fuzz/corpus; an input that fails is written to build/fuzz.
set -euo pipefail
source "$(dirname "$(readlink -f "${BASH_SOURCE[0]}")")/../cmake/setup.sh"
need_packages "${sanitizer_packages[@]}"
build asan fuzzers

for source in "$root"/fuzz/*_fuzz.cpp; do
    name=$(basename "$source" .cpp) subject=$(basename "$source" _fuzz.cpp)
    log="$root/build/fuzz/$name.log"
    found="$root/build/fuzz/corpus/$subject"
    options=(-max_total_time="${1:-10}" -max_len=65536 -timeout=10 -rss_limit_mb=2048 -print_final_stats=1
             -artifact_prefix="$root/build/fuzz/$name-")
    [ ! -f "$root/fuzz/$subject.dict" ] || options+=(-dict="$root/fuzz/$subject.dict")
    # Options of one fuzzer: an input that takes long is cut, longer seeds are replayed by the tests.
    [ ! -f "$root/fuzz/$subject.options" ] || mapfile -t -O "${#options[@]}" options <"$root/fuzz/$subject.options"
    mkdir -p "$found"
    if ! "$root/build/asan/bin/$name" "${options[@]}" "$found" "$root/fuzz/corpus/$subject" >"$log" 2>&1; then
        tail -40 "$log"
        exit 1
    fi
    printf '%s: %s runs, nothing found\n' "$name" \
        "$(sed -n 's/^stat::number_of_executed_units: *//p' "$log")"
done
