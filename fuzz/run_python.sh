#!/usr/bin/env bash
# fuzz/run_python.sh [SECONDS]: builds the Python package with sanitizers, runs its tests with it, and
# calls its functions with damaged input for so many seconds (10). Further arguments go to
# fuzz/python_fuzz.py; `fuzz/run_python.sh --call SEED NUMBER` makes one call again.
set -euo pipefail
source "$(dirname "$(readlink -f "${BASH_SOURCE[0]}")")/../cmake/setup.sh"
source "$root/cmake/python.sh"
need_packages "${sanitizer_packages[@]}"

# Without a Python the caller has been told.
prepare_python || { status=$?; [ "$status" -ne 77 ] || exit 0; exit "$status"; }
build asan brindle_c
make_environment plain
folder="$root/build/python/sanitized"
rm -rf "$folder/brindle" "$folder/build/stage"
mkdir -p "$folder"
install_library "$root/build/asan" "$folder/brindle"
config=$(dirname "$(find "$folder/brindle" -name BrindleConfig.cmake)")
quietly sanitized-configure env PATH="$python_folder/tools/bin:$PATH" cmake -S "$root/python" \
    -B "$folder/build" -G Ninja -DCMAKE_BUILD_TYPE=None -DCMAKE_CXX_FLAGS="-O1 -g1" \
    -DCMAKE_CXX_COMPILER=clang++ -DBRINDLE_SANITIZE=ON -DBRINDLE_STUBS=OFF \
    -DPython_EXECUTABLE="$python_folder/tools/bin/python" -DBrindle_DIR="$config"
say "building the package for Python with sanitizers"
quietly sanitized-build cmake --build "$folder/build"
quietly sanitized-data cmake --install "$folder/build" --prefix "$folder/build/stage"

# The interpreter gets its objects from malloc, so that their use is watched, too, and keeps at its end
# what would be leaks elsewhere.
export PYTHONPATH="$folder/build/stage" PYTHONMALLOC=malloc PYTHONDONTWRITEBYTECODE=1
export ASAN_OPTIONS=detect_leaks=0:allocator_may_return_null=1:hard_rss_limit_mb=4096
export UBSAN_OPTIONS=print_stacktrace=1 BRINDLE_LAST_CALL="$folder/last-call"
# The runtime looks for what throws exceptions when it is loaded, and the interpreter has none of it.
runtime="$(clang++ -print-file-name=libclang_rt.asan-x86_64.so) $(clang++ -print-file-name=libstdc++.so.6)"
run_sanitized() { LD_PRELOAD="$runtime" "$python_folder/plain/bin/python" "$@"; }

case ${1:-} in
    --call) run_sanitized "$root/fuzz/python_fuzz.py" "$@" ;;
    *)
        (cd "$folder" && run_sanitized -m pytest -q -c "$root/python/pyproject.toml" \
            --capture=sys -p no:cacheprovider --ignore "$root/python/tests/test_types.py" \
            --ignore "$root/python/tests/test_engines.py" -k "not leaks" "$root/python/tests")
        run_sanitized "$root/fuzz/python_fuzz.py" "$@" || {
            status=$?
            say "again: fuzz/run_python.sh $(cat "$BRINDLE_LAST_CALL")"
            exit "$status"
        } ;;
esac
