#!/usr/bin/env bash
# Installs the Debian packages the project needs (only those missing), then
# configures and builds. Idempotent; run as root on a fresh machine, or as a
# user when everything is already installed.
#
#   scripts/setup.sh [--build-dir DIR] [--asan] [--tsan] [--no-build]
set -euo pipefail

ROOT="$(cd "$(dirname "${BASH_SOURCE[0]}")/.." && pwd)"
BUILD_DIR=""
SANITIZE=""
DO_BUILD=1
while [[ $# -gt 0 ]]; do
    case "$1" in
        --build-dir) BUILD_DIR="$2"; shift 2 ;;
        --asan) SANITIZE="address;undefined"; shift ;;
        --tsan) SANITIZE="thread"; shift ;;
        --no-build) DO_BUILD=0; shift ;;
        *) echo "setup.sh: unknown option $1" >&2; exit 2 ;;
    esac
done
if [[ -z "$BUILD_DIR" ]]; then
    case "$SANITIZE" in
        "") BUILD_DIR="$ROOT/build" ;;
        thread) BUILD_DIR="$ROOT/build-tsan" ;;
        *) BUILD_DIR="$ROOT/build-asan" ;;
    esac
fi

PACKAGES=(
    build-essential cmake ninja-build ccache pkg-config
    qtbase5-dev qtbase5-dev-tools libqt5sql5-sqlite libqt5svg5-dev
    qttools5-dev qttools5-dev-tools
    liblcms2-dev libxlsxwriter-dev libbenchmark-dev libsqlite3-dev
    python3-openpyxl python3-pil xvfb xauth
)

missing=()
for p in "${PACKAGES[@]}"; do
    if ! dpkg-query -W -f='${Status}' "$p" 2>/dev/null | grep -q "install ok installed"; then
        missing+=("$p")
    fi
done
if [[ ${#missing[@]} -gt 0 ]]; then
    echo "setup: installing ${missing[*]}"
    SUDO=""
    if [[ $(id -u) -ne 0 ]]; then SUDO="sudo"; fi
    $SUDO apt-get update -qq
    DEBIAN_FRONTEND=noninteractive $SUDO apt-get install -y -qq --no-install-recommends "${missing[@]}" >/dev/null
fi

[[ $DO_BUILD -eq 1 ]] || exit 0

GENERATOR=()
if command -v ninja >/dev/null; then GENERATOR=(-G Ninja); fi
LAUNCHER=()
if command -v ccache >/dev/null; then
    LAUNCHER=(-DCMAKE_CXX_COMPILER_LAUNCHER=ccache)
    export CCACHE_DIR="${CCACHE_DIR:-$HOME/.cache/ccache}"
    export CCACHE_BASEDIR="$ROOT"
    # Debug info names the build folder; ignore it so clones in other folders share hits.
    export CCACHE_NOHASHDIR=1
    ccache --max-size=5G >/dev/null 2>&1 || true
fi

if [[ ! -f "$BUILD_DIR/CMakeCache.txt" ]]; then
    cmake -S "$ROOT" -B "$BUILD_DIR" "${GENERATOR[@]}" "${LAUNCHER[@]}" \
        -DCMAKE_BUILD_TYPE=RelWithDebInfo \
        -DCMAKE_INSTALL_PREFIX="$BUILD_DIR/install" \
        -DVEXA_SANITIZE="$SANITIZE" >/dev/null
else
    cmake "$BUILD_DIR" >/dev/null
fi
cmake --build "$BUILD_DIR" --parallel "$(nproc)"
