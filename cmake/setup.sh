# Shared by run.sh, test.sh and .ci/run: installs the packages that are missing and builds. All that
# it says goes to standard error, so that the program's own output stays clean.

root=$(cd "$(dirname "$(readlink -f "${BASH_SOURCE[0]}")")/.." && pwd)

# Debian's names of what the library and the program are built with.
program_packages=(g++ cmake ninja-build pkg-config libboost-dev libfmt-dev nlohmann-json3-dev
                  libcli11-dev libxml2-dev libzip-dev libplist-dev libarchive-dev)
# The same for the tests and the benches; gettext makes the catalogues, without which the program
# speaks English.
test_packages=(doctest-dev libbenchmark-dev python3-jsonschema gettext)
# The same for the tests under sanitizers and the fuzzers, which share one build by clang.
sanitizer_packages=(clang libclang-rt-14-dev)

say() { printf 'brindle: %s\n' "$*" >&2; }

# Those of the named packages that are not installed.
missing_packages() {
    local installed package
    installed=$'\n'$(dpkg-query -W -f='${Package} ${db:Status-Status}\n' "$@" 2>/dev/null || true)$'\n'
    for package in "$@"; do
        [[ $installed == *$'\n'"$package installed"$'\n'* ]] || printf '%s ' "$package"
    done
}

# need_packages NAME...: installs what is missing of them.
need_packages() {
    # Without Debian's package manager the configuration tells what it does not find.
    command -v dpkg-query >/dev/null || return 0
    local missing as_root=() log="$root/build/packages.log"
    missing=$(missing_packages "$@")
    [ -n "$missing" ] || return 0
    missing=${missing% }
    [ "$(id -u)" -eq 0 ] || as_root=(sudo)
    mkdir -p "$root/build"
    if [ "$(id -u)" -ne 0 ] && ! command -v sudo >/dev/null; then
        echo "neither root nor sudo" >"$log"
    else
        say "installing $missing (log: build/packages.log)"
        # An installation that was cut off is finished first; a source that does not answer need not
        # keep these packages from being found in another.
        { "${as_root[@]}" dpkg --configure -a || true
          "${as_root[@]}" apt-get update || true
          "${as_root[@]}" env DEBIAN_FRONTEND=noninteractive apt-get -o DPkg::Lock::Timeout=120 \
              install -y --no-install-recommends $missing || true; } >"$log" 2>&1 </dev/null
        missing=$(missing_packages "$@")
        [ -n "$missing" ] || return 0
        grep -E '^(E:|sudo:)' "$log" | head -3 >&2 || true
    fi
    say "these packages are needed and could not be installed: ${missing% }"
    say "as root: apt-get install ${missing% }"
    exit 1
}

# Copies the build's lines to the log; says on the terminal how far it is, elsewhere only once that
# there is something to build.
show_progress() {
    local line said=
    while IFS= read -r line; do
        printf '%s\n' "$line"
        [[ $line =~ ^\[([0-9]+)/([0-9]+)\]\ (Building|Linking) ]] || continue
        if [ -t 2 ]; then
            printf '\rbrindle: building, step %d of %d ' "${BASH_REMATCH[1]}" "${BASH_REMATCH[2]}" >&2
        elif [ -z "$said" ]; then
            say "building (log: build/build.log)"
        fi
        said=yes
    done
    if [ -n "$said" ] && [ -t 2 ]; then printf '\r\033[K' >&2; fi
}

# fail_with_log LOG MESSAGE: the first error of the log in a few lines.
fail_with_log() {
    { grep -E -m1 -A11 '^FAILED|error:|^CMake Error' "$1" || tail -12 "$1"; } | cut -c1-200 >&2
    say "$2 (log: ${1#"$root"/})"
    exit 1
}

# is_configured PRESET [OPTION...]: as these say, in this folder, up to the end.
is_configured() {
    [ "$(cat "$root/build/$1/configured" 2>/dev/null || true)" = "$root $*" ]
}

# configure PRESET [OPTION...]: once; again when the last time did not come to its end, was for other
# options, or was for a folder of another name.
configure() {
    local preset=$1 build="$root/build/$1" log="$root/build/configure.log"
    is_configured "$@" && return 0
    rm -f "$build/configured"
    say "configuring the $preset build"
    (cd "$root" && cmake --fresh --preset "$preset" "${@:2}") >"$log" 2>&1 </dev/null ||
        fail_with_log "$log" "the configuration failed"
    printf '%s' "$root $*" >"$build/configured"
}

# build PRESET TARGET [OPTION...]: a configured and built target, on all cores.
build() (
    mkdir -p "$root/build"
    if command -v flock >/dev/null; then
        exec 9>"$root/build/lock"
        flock -n 9 || { say "waiting for another build"; flock 9; }
    fi
    local packages=("${program_packages[@]}")
    [[ " $* " == *" -DBRINDLE_TESTS=OFF "* ]] || packages+=("${test_packages[@]}")
    need_packages "${packages[@]}"
    configure "$1" "${@:3}"
    cmake --build "$root/build/$1" --target "$2" 2>&1 </dev/null | show_progress \
        >"$root/build/build.log" || fail_with_log "$root/build/build.log" "the build failed"
)

# build_program: the program without what only tests and benches need. They share its folder, and a
# folder that is configured for them has the program, too; so neither undoes the other's work.
build_program() {
    local options=(-DBRINDLE_TESTS=OFF -DBRINDLE_BENCH=OFF -DBRINDLE_FUZZ=OFF)
    if is_configured release; then options=(); fi
    build release brindle_cli "${options[@]}"
}
