# Shared by run.sh and test.sh: installs the missing packages and builds the release preset.
# Everything it says goes to standard error, so that the program's output stays clean.

packages=(g++ cmake ninja-build libboost-dev libfmt-dev nlohmann-json3-dev libcli11-dev
          libxml2-dev libzip-dev libplist-dev doctest-dev libbenchmark-dev gettext clang-format)

say() { printf 'brindle: %s\n' "$*" >&2; }

missing_packages() {
    local package
    for package in "${packages[@]}"; do
        [ "$(dpkg-query -W -f='${db:Status-Status}' "$package" 2>/dev/null)" = installed ] || echo "$package"
    done
}

install_missing() {
    local missing sudo=()
    missing=$(missing_packages | tr '\n' ' ')
    [ -n "$missing" ] || return 0
    [ "$(id -u)" -eq 0 ] || sudo=(sudo)
    say "installing $missing(log: build/setup.log)"
    if ! { "${sudo[@]}" apt-get update && DEBIAN_FRONTEND=noninteractive \
           "${sudo[@]}" apt-get install -y --no-install-recommends $missing; } \
           >"$cd_root/build/setup.log" 2>&1 </dev/null; then
        say "could not install them; these packages are needed: $missing"
        exit 1
    fi
}

# build_release TARGET: configures once, then builds; quick when there is nothing to do.
build_release() {
    local build="$cd_root/build/release" log="$cd_root/build/build.log"
    mkdir -p "$cd_root/build"
    if [ ! -f "$build/build.ninja" ]; then
        install_missing
        say "building (log: build/build.log)"
        if ! (cd "$cd_root" && cmake --preset release) >"$log" 2>&1; then
            tail -20 "$log" >&2
            say "the configuration failed"
            exit 1
        fi
    fi
    if ! cmake --build "$build" --target "$1" >"$log" 2>&1; then
        tail -40 "$log" >&2
        say "the build failed"
        exit 1
    fi
}
