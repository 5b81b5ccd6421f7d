# The JavaScript part of test.sh: compiles the library to WebAssembly, builds the package in js/ with it
# and tests that. All but js/node_modules and js/dist lies under build/wasm.

wasm_folder="$root/build/wasm"
javascript_packages=(emscripten dpkg-dev)

can_run_node() {
    node -e 'process.exit(Number(process.versions.node.split(".")[0]) < 18 ? 1 : 0)' 2>/dev/null && command -v npm >/dev/null
}

# in_wasm_log LOG COMMAND...: with its output in a log, which is shown when it fails.
in_wasm_log() {
    local log="$wasm_folder/$1.log"
    "${@:2}" >"$log" 2>&1 </dev/null || { tail -25 "$log" >&2; say "this failed: $1"; return 1; }
}

# The source package of libxml2 by the system's own sources, which are asked in a folder of ours.
fetch_libxml2() (
    mkdir -p "$wasm_folder/apt/sources" "$wasm_folder/apt/lists/partial" "$wasm_folder/apt/cache"
    cd "$wasm_folder"
    local file
    for file in /etc/apt/sources.list /etc/apt/sources.list.d/*.list /etc/apt/sources.list.d/*.sources; do
        [ -s "$file" ] || continue
        sed -E 's/^Types:.*/Types: deb-src/; s/^deb /deb-src /' "$file" >"apt/sources/${file##*/}"
    done
    local options=(-o Dir::Etc::sourcelist=/dev/null -o Dir::Etc::sourceparts="$wasm_folder/apt/sources"
        -o Dir::State::lists="$wasm_folder/apt/lists" -o Dir::Cache="$wasm_folder/apt/cache"
        -o APT::Sandbox::User=root)
    apt-get "${options[@]}" update
    rm -rf libxml2_* libxml2-source
    apt-get "${options[@]}" --download-only source libxml2
    dpkg-source -x libxml2_*.dsc libxml2-source
)

# What Brindle uses of it: both readers, the tree and paths.
compile_libxml2() {
    local part options=(-DBUILD_SHARED_LIBS=OFF -DHAVE_PTHREAD_H=OFF)
    for part in AUTOMATA C14N CATALOG DEBUG DOCB EXPR FTP HTML HTTP ICONV ICU LEGACY LZMA MEM_DEBUG \
        MODULES OUTPUT PATTERN PROGRAMS PUSH PYTHON READER REGEXPS RUN_DEBUG SCHEMAS SCHEMATRON TESTS \
        THREADS THREAD_ALLOC VALID WRITER XINCLUDE XPTR ZLIB; do
        options+=(-D"LIBXML2_WITH_$part=OFF")
    done
    emcmake cmake -S "$wasm_folder/libxml2-source" -B "$wasm_folder/libxml2" -G Ninja \
        -DCMAKE_BUILD_TYPE=Release -DCMAKE_C_FLAGS_RELEASE="-Os -DNDEBUG" "${options[@]}" \
        -DCMAKE_INSTALL_PREFIX="$wasm_folder/libraries" &&
        cmake --build "$wasm_folder/libxml2" --target install
}

# need_libxml2: once.
need_libxml2() {
    [ -f "$wasm_folder/libraries/lib/libxml2.a" ] && return 0
    say "fetching and compiling libxml2 for WebAssembly"
    in_wasm_log libxml2-fetch fetch_libxml2 && in_wasm_log libxml2-compile compile_libxml2
}

# need_node_modules FOLDER: as its lock file says, once for each lock file.
need_node_modules() {
    local stamp="$1/node_modules/.brindle-lock"
    cmp -s "$1/package-lock.json" "$stamp" && return 0
    say "fetching npm packages for ${1#"$root"/}"
    in_wasm_log npm npm --prefix "$1" ci --no-audit --no-fund || return 1
    cp "$1/package-lock.json" "$stamp"
}

# build_js: js/dist. 77 where something is missing that this system does not have.
build_js() {
    mkdir -p "$wasm_folder"
    can_run_node || (need_packages nodejs npm) || true
    can_run_node || { say "left out: JavaScript's part, as there is no Node from 18 on with npm"; return 77; }
    command -v dpkg-query >/dev/null || { say "left out: JavaScript's part, which needs Debian's packages"; return 77; }
    (need_packages "${javascript_packages[@]}") || return 77
    # Emscripten asks for a package of Debian's, which another Node than Debian's does not look for.
    export NODE_PATH=/usr/share/nodejs${NODE_PATH:+:$NODE_PATH}
    need_libxml2 || return 1
    build wasm brindle_wasm -DBRINDLE_TESTS=OFF -DBRINDLE_WEB_LIBRARIES="$wasm_folder/libraries" \
        -DCMAKE_TOOLCHAIN_FILE="$(dirname "$(readlink -f "$(command -v em++)")")/cmake/Modules/Platform/Emscripten.cmake" || return 1
    need_node_modules "$root/js" || return 1
    in_wasm_log package node "$root/js/scripts/build.mjs" "$wasm_folder/js"
}

# test_js [ARGUMENT...]: builds and tests the package; arguments go to Node's test runner.
test_js() {
    build_js || return
    build_program || return
    (cd "$root/js" && node scripts/schemas.mjs --check && node scripts/sizes.mjs --check &&
        node --test --expose-gc "$@" test/)
}
