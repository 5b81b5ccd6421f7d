#!/usr/bin/env bash
# consume.sh SOURCE BUILD WAY: builds examples/host as a stranger would, outside of this build, and
# compares what it prints. WAY is find_package or pkg_config, both with the package installed from
# BUILD into a folder and then moved to another, or add_subdirectory, which builds all of the library
# again: several sources as one, or with BRINDLE_EACH_SOURCE each by itself, which takes minutes more.
set -euo pipefail
source_dir=$1 build_dir=$2 way=$3
work="$build_dir/consume/$way"
prefix="$work/prefix"
project="$source_dir/tests/consume/$way"
options=(-DBRINDLE_SOURCE_DIR="$source_dir" -DCMAKE_BUILD_TYPE=Debug)

mkdir -p "$work"
if [ "$way" != add_subdirectory ]; then
    rm -rf "$prefix" "$work/first"
    cmake --install "$build_dir" --prefix "$work/first" >"$work/install.log"
    mv "$work/first" "$prefix"
fi
case $way in
    find_package)
        project="$source_dir/examples/host"
        options=(-DCMAKE_PREFIX_PATH="$prefix") ;;
    pkg_config)
        PKG_CONFIG_PATH=$(dirname "$(find "$prefix" -name brindle.pc)")
        export PKG_CONFIG_PATH ;;
    add_subdirectory)
        options+=(-DCMAKE_CXX_FLAGS_DEBUG=-O0)
        [ -n "${BRINDLE_EACH_SOURCE:-}" ] ||
            options+=(-DCMAKE_UNITY_BUILD=ON -DCMAKE_UNITY_BUILD_BATCH_SIZE=12) ;;
esac

cmake --fresh -G Ninja -S "$project" -B "$work/host" "${options[@]}"
cmake --build "$work/host" --target host
(cd "$work" && "$work/host/host" && grep -q "^<svg\|^<?xml" song.svg && grep -q HarmSignKeys song.json) |
    diff "$source_dir/examples/host/expected.txt" -

# The same for the host in C, which finds the shared library alone.
case $way in
    find_package)
        cmake --fresh -G Ninja -S "$source_dir/examples/c" -B "$work/host_in_c" "${options[@]}"
        cmake --build "$work/host_in_c" ;;
    pkg_config)
        mkdir -p "$work/host_in_c"
        # The flags are words of their own.
        # shellcheck disable=SC2046
        cc -std=c11 -o "$work/host_in_c/host_in_c" "$source_dir/examples/c/main.c" \
            $(pkg-config --cflags --libs brindle-c) -Wl,-rpath,"$(pkg-config --variable=libdir brindle-c)" ;;
    *)
        exit 0 ;;
esac
# The lines of the README that build both, with the package where they put it.
if [ "$way" = pkg_config ]; then
    mkdir -p "$work/readme/build" && cd "$work/readme"
    ln -sfn "$source_dir/examples" examples && ln -sfn "$prefix" build/installed
    {
        echo "set -eu"
        grep -hE '^(export PKG_CONFIG_PATH|cc |c\+\+ |\(cd build|LD_LIBRARY_PATH)' "$source_dir/README.md"
    } >lines.sh
    [ "$(wc -l <lines.sh)" -eq 6 ]
    bash lines.sh >shown.txt
    grep -q "^A Minor$" shown.txt
    cd "$work"
fi
"$work/host_in_c/host_in_c" | diff "$source_dir/examples/c/expected.txt" -
