#!/usr/bin/env bash
# make_packages.sh [--try]: makes the Debian packages in build/package and checks them with lintian.
# With --try the library is built as part of a host, and, as root, a bare Debian is set up in a folder
# below build/package, where the packages are installed and used: the program, its man pages, its
# completions, and a host that is built with libbrindle-dev.
set -euo pipefail
source "$(dirname "$(readlink -f "${BASH_SOURCE[0]}")")/../cmake/setup.sh"
cd "$root"
build="$root/build/package"
need_packages "${program_packages[@]}" gettext lintian dpkg-dev ${1:+debootstrap}

say "building (log: build/package.log)"
cmake --preset release -B "$build" -DCMAKE_INSTALL_PREFIX=/usr \
    -DBRINDLE_TESTS=OFF -DBRINDLE_BENCH=OFF -DBRINDLE_FUZZ=OFF ${BRINDLE_CMAKE_OPTIONS:-} \
    >"$root/build/package.log"
cmake --build "$build" >>"$root/build/package.log"
rm -f "$build"/*.deb
(cd "$build" && cpack >>"$root/build/package.log")
lintian --fail-on error,warning --suppress-tags-from-file cmake/package/lintian-tags "$build"/*.deb
ls -l "$build"/*.deb
[ "${1:-}" = --try ] || exit 0

say "building the library as part of a host, each source by itself (log: build/package.log)"
BRINDLE_EACH_SOURCE=1 tests/consume/consume.sh "$root" "$build" add_subdirectory >>"$root/build/package.log"

bare="$build/bare"
codename=$(. /etc/os-release && echo "$VERSION_CODENAME")
mirror=$(apt-cache policy | awk -v suite="$codename/main" '$3 == suite {print $2; exit}')
if [ ! -e "$bare/etc/debian_version" ]; then
    rm -rf "$bare"
    say "setting up a bare Debian (log: build/debootstrap.log)"
    debootstrap --variant=minbase "$codename" "$bare" "$mirror" >"$root/build/debootstrap.log"
fi
rm -rf "$bare/tmp/"*
cp "$build"/*.deb "$bare/tmp/"
cp -r examples/host "$bare/tmp/"
cat >"$bare/tmp/try.sh" <<'TRY'
set -euo pipefail
cd /tmp
export DEBIAN_FRONTEND=noninteractive
apt-get update -q
apt-get install -qy --no-install-recommends ./brindle_*.deb man-db bash-completion
[ "$(brindle numerals 'ii7 V7' --key C)" = "Dm7 G7" ]
brindle grid Am | grep -q x02210
LANGUAGE=de LC_ALL=C.UTF-8 brindle analyse "Dm7 G7 C" | grep -q "C major"
man brindle | grep -q COMMANDS
man brindle-markov-learn | grep -q "model"
bash -c 'compopt() { :; }
    source /usr/share/bash-completion/completions/brindle
    COMP_WORDS=(brindle analyse --ro); COMP_CWORD=2; _brindle; [ "${COMPREPLY[0]}" = --route ]'
apt-get install -qy --no-install-recommends ./libbrindle*.deb g++ cmake ninja-build pkg-config
cmake -G Ninja -S host -B host/build
cmake --build host/build
(cd host && build/host >told.txt && diff expected.txt told.txt)
pkg-config --cflags --libs brindle-c
apt-get purge -qy brindle 'libbrindle*'
test ! -e /usr/bin/brindle -a ! -e /usr/include/brindle
echo "the packages work"
TRY
# The completion of bash reads from /dev/fd.
mount -t proc proc "$bare/proc"
trap 'umount "$bare/proc"' EXIT
# A bare Debian knows nothing of how this one builds.
env -u CMAKE_CXX_COMPILER_LAUNCHER -u CMAKE_C_COMPILER_LAUNCHER -u CC -u CXX -u CXXFLAGS \
    chroot "$bare" bash /tmp/try.sh
