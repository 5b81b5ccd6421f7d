#!/usr/bin/env bash
# Sets up what is missing, builds everything, and runs the tests. `./test.sh cpp` and `./test.sh python`
# run one part; further arguments go to its ctest or pytest, without a part to ctest.
set -euo pipefail
source "$(dirname "$(readlink -f "${BASH_SOURCE[0]}")")/cmake/setup.sh"
source "$root/cmake/python.sh"

test_cpp() {
    build release all
    ctest --test-dir "$root/build/release" --output-on-failure -j "$(nproc)" "$@"
}

case ${1:-} in
    cpp) test_cpp "${@:2}" ;;
    python) test_python "${@:2}" ;;
    *)
        test_cpp "$@"
        status=0
        test_python || status=$?
        # Without a Python the rest has passed, which was said.
        [ "$status" -eq 77 ] || exit "$status"
        ;;
esac
