# The page's part of run.sh and test.sh: fetches its packages by the lock file, builds the package for
# JavaScript and the page on it, serves it, and tests it in a browser. What is built lies under build/web.

page_folder="$root/build/web"
# The browser that the tests drive, and fonts for what the page has none of its own.
page_test_packages=(chromium fonts-liberation)

# Whether there is a Node that the page's tools run on.
has_page_tools() {
    node -e 'const [major, minor] = process.versions.node.split(".").map(Number);
process.exit(major > 20 || (major === 20 && minor >= 19) ? 0 : 1)' 2>/dev/null && command -v npm >/dev/null
}

# page_quietly LOG COMMAND...: with its output in a log, which is shown when it fails.
page_quietly() {
    local log="$page_folder/$1.log"
    "${@:2}" >"$log" 2>&1 </dev/null || { tail -25 "$log" >&2; say "this failed: $1"; return 1; }
}

# The packages of the page, once for each state of the lock file.
fetch_page_packages() {
    local wanted
    wanted=$(sha256sum "$root/web/package-lock.json")
    [ -d "$root/web/node_modules" ] && [ "$(cat "$page_folder/packages" 2>/dev/null || true)" = "$wanted" ] && return 0
    say "fetching the packages of the page"
    page_quietly fetch npm --prefix "$root/web" ci || return 1
    printf '%s' "$wanted" >"$page_folder/packages"
}

# build_page: the package for JavaScript and the page, into build/web/page. 77 without a Node.
build_page() {
    has_page_tools || { say "left out: the page, as there is no Node from 20.19 on with npm"; return 77; }
    build_js || return
    mkdir -p "$page_folder"
    fetch_page_packages || return 1
    say "building the page"
    page_quietly build npm --prefix "$root/web" run build
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

# test_page [ARGUMENT...]: builds the page and tests it in a browser; arguments go to node's test runner.
test_page() {
    build_page || return
    if [ -z "${BRINDLE_CHROMIUM:-}" ] && ! command -v chromium google-chrome >/dev/null; then
        (need_packages "${page_test_packages[@]}") || {
            say "left out: the page's tests, as there is no Chromium; BRINDLE_CHROMIUM can name one"
            return 77
        }
    fi
    (cd "$root/web" && node --test --test-concurrency=1 "$@" tests/*.test.mjs)
}
