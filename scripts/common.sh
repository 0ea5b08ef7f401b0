# Shared by run.sh and test.sh: install what is missing, then build.
set -euo pipefail

ROOT=$(cd "$(dirname "${BASH_SOURCE[0]}")/.." && pwd)
BUILD_DIR=${BUILD_DIR:-$ROOT/build}

BUILD_PACKAGES=(g++ cmake make libwxgtk3.2-dev)
TEST_PACKAGES=(libgtest-dev xvfb xauth xdotool clang-format libx11-dev)

install_missing() {
    local missing=() package
    for package in "$@"; do
        dpkg-query -W -f='${Status}' "$package" 2>/dev/null | grep -q "install ok installed" ||
            missing+=("$package")
    done
    ((${#missing[@]})) || return 0
    local sudo=()
    [ "$(id -u)" -eq 0 ] || sudo=(sudo)
    echo "Installing ${missing[*]}"
    "${sudo[@]}" apt-get update -qq
    DEBIAN_FRONTEND=noninteractive "${sudo[@]}" apt-get install -y -qq "${missing[@]}" >/dev/null
}

# build [TARGET...]: everything when no target is named.
build() {
    cmake -S "$ROOT" -B "$BUILD_DIR" -DCMAKE_COMPILE_WARNING_AS_ERROR=ON >/dev/null
    local targets=()
    (($#)) && targets=(--target "$@")
    cmake --build "$BUILD_DIR" -j"$(nproc)" "${targets[@]}"
}
