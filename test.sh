#!/usr/bin/env bash
# Sets up what is missing, builds everything, and runs the tests. `./test.sh cpp`, `./test.sh python`,
# `./test.sh js` and `./test.sh web` run one part; further arguments go to its ctest, pytest or node --test,
# without a part to ctest.
set -euo pipefail
source "$(dirname "$(readlink -f "${BASH_SOURCE[0]}")")/cmake/setup.sh"
source "$root/cmake/python.sh"
source "$root/cmake/javascript.sh"
source "$root/cmake/web.sh"

test_cpp() {
    build release all
    ctest --test-dir "$root/build/release" --output-on-failure -j "$(nproc)" "$@"
}

# The parts beside C++, in this order.
other_parts=(python js web)

case ${1:-} in
    cpp) test_cpp "${@:2}" ;;
    python) test_python "${@:2}" ;;
    js) test_js "${@:2}" ;;
    web) test_web "${@:2}" ;;
    *)
        test_cpp "$@"
        for part in "${other_parts[@]}"; do
            status=0
            "test_$part" || status=$?
            # What a system does not have was said; the rest goes on.
            [ "$status" -eq 0 ] || [ "$status" -eq 77 ] || exit "$status"
        done
        ;;
esac
