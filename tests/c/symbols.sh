#!/usr/bin/env bash
# symbols.sh LIBRARY LIST VERSION: whether a shared library exports exactly the symbols of the list and
# has the name that its version asks for.
set -euo pipefail
nm --dynamic --defined-only "$1" | awk '{ print $3 }' | LC_ALL=C sort | diff "$2" -
soname=$(readelf --wide --dynamic "$1" | sed -n 's/.*(SONAME).*\[\(.*\)\]/\1/p')
[ "$soname" = "libbrindle.so.${3%.*}" ] || { echo "the soname is $soname" >&2; exit 1; }
