# shellcheck shell=bash
# Functions of ./run, ./test and .ci/run.

step() {
    printf '==> %s\n' "$*" >&2
}

fail() {
    printf '%s: %s\n' "$(basename "$0")" "$*" >&2
    exit 1
}

# Installs those of the named Debian packages that are missing.
need_packages() {
    command -v dpkg-query >/dev/null || fail "this script installs Debian packages, and dpkg is not here"
    local missing=() package
    for package in "$@"; do
        dpkg-query -W -f='${db:Status-Status}' "$package" 2>/dev/null | grep -qx installed ||
            missing+=("$package")
    done
    [ ${#missing[@]} -eq 0 ] && return
    local as_root=()
    if [ "$(id -u)" -ne 0 ]; then
        command -v sudo >/dev/null || fail "packages are missing and need root or sudo: ${missing[*]}"
        as_root=(sudo)
    fi
    step "installing ${missing[*]}"
    local log
    log=$(mktemp)
    if ! { "${as_root[@]}" apt-get update &&
        "${as_root[@]}" env DEBIAN_FRONTEND=noninteractive \
            apt-get install -y --no-install-recommends "${missing[@]}"; } >"$log" 2>&1 </dev/null; then
        cat "$log" >&2
        rm -f "$log"
        fail "could not install ${missing[*]}"
    fi
    rm -f "$log"
}

# shellcheck disable=SC2034
BUILD_PACKAGES=(g++ cmake ninja-build libcurl4-openssl-dev libmicrohttpd-dev libcli11-dev
    libfmt-dev libmnl-dev libsystemd-dev nlohmann-json3-dev)
# shellcheck disable=SC2034
TEST_PACKAGES=(libgtest-dev libgmock-dev rpm python3 mariadb-server postgresql-15 shellcheck
    sblim-wbemcli libxml2-utils systemd iproute2 procps pciutils usbutils dmidecode mandoc
    chromium)
# shellcheck disable=SC2034
FUZZ_PACKAGES=(clang libclang-rt-14-dev libgtest-dev libgmock-dev)
# shellcheck disable=SC2034
PACKAGING_PACKAGES=(dpkg-dev file fakeroot rpm lintian debootstrap pkg-config systemd-container)
# shellcheck disable=SC2034
BENCHMARK_PACKAGES=(libexpat1-dev libbenchmark-dev python3)
# shellcheck disable=SC2034
COMPARED_PACKAGES=(fusioninventory-agent lshw)

# Installs the checker of accessibility that the test of the HTML page runs in a browser. It is not
# in Debian; without npm, or without a registry, that one test is skipped.
want_axe_core() {
    local version=4.14.1 place=$ROOT/build/axe
    [ -f "$place/node_modules/axe-core/axe.min.js" ] && return
    mkdir -p "$place"
    step "fetching axe-core"
    npm install --silent --no-audit --no-fund --ignore-scripts --prefix "$place" \
        "axe-core@$version" >/dev/null 2>&1 </dev/null ||
        step "axe-core is not to be had: the page's accessibility will not be checked"
}

# Runs a command whose output is shown only when it fails; the first argument says what it does.
quietly() {
    local what=$1 log
    shift
    log=$(mktemp)
    step "$what"
    "$@" >"$log" 2>&1 || { cat "$log" >&2; rm -f "$log"; fail "$what failed"; }
    rm -f "$log"
}

# Further arguments go to cmake.
configure_preset() {
    (cd "$ROOT" && quietly "configuring $1" cmake --preset "$@")
}

# Configures a preset unless that is done, and builds it. Further arguments go to the build.
build_preset() {
    [ -f "$ROOT/build/$1/build.ninja" ] || configure_preset "$1"
    (cd "$ROOT" && quietly "building $1" cmake --build --preset "$@")
}
