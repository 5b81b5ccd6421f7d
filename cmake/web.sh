# The page's part of run.sh and test.sh: builds the package for JavaScript and the page on it, serves it,
# and tests it in a browser. All but web/node_modules lies under build/web.

page_folder="$root/build/web"
# The browser that the tests drive.
page_test_packages=(chromium)

# Whether there is a Node that the page's tools run on.
has_page_tools() {
    node -e 'const [major, minor] = process.versions.node.split(".").map(Number);
process.exit(major > 20 || (major === 20 && minor >= 19) ? 0 : 1)' 2>/dev/null && command -v npm >/dev/null
}

# build_page: into build/web/page. 77 where something is missing that this system does not have.
build_page() {
    has_page_tools || { say "left out: the page, as there is no Node from 20.19 on with npm"; return 77; }
    build_js || return
    need_node_modules "$root/web" || return 1
    say "building the page"
    mkdir -p "$page_folder"
    if ! npm --prefix "$root/web" run build >"$page_folder/build.log" 2>&1 </dev/null; then
        tail -25 "$page_folder/build.log" >&2
        return 1
    fi
}

# show_page [PORT]: builds the page, opens it where there is a desktop, and serves it until it is stopped.
show_page() {
    build_page || return
    local port=${1:-8137}
    if [ -n "${DISPLAY:-}${WAYLAND_DISPLAY:-}" ] && command -v xdg-open >/dev/null; then
        (sleep 1; xdg-open "http://127.0.0.1:$port/" >/dev/null 2>&1) &
    fi
    exec node "$root/web/serve.mjs" "$port"
}

# Whether there is a browser for the tests.
has_browser() {
    [ -n "${BRINDLE_CHROMIUM:-}" ] || command -v chromium google-chrome >/dev/null
}

# test_web [ARGUMENT...]: builds the page and tests it in a browser; arguments go to Node's test runner.
test_web() {
    build_page || return
    has_browser || (need_packages "${page_test_packages[@]}") || {
        say "left out: the page's tests, as there is no Chromium; BRINDLE_CHROMIUM can name one"
        return 77
    }
    (cd "$root/web" && node --test --test-concurrency=1 "$@" tests/*.test.mjs)
}
