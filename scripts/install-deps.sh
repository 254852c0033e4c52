#!/usr/bin/env bash
# Installs every Debian package that building, running and testing Penmoor needs.
# Does nothing (not even an apt-get update) when all of them are already present.
set -euo pipefail

packages=(
    # build
    g++ cmake ninja-build pkg-config
    qt6-base-dev qt6-base-dev-tools libgl-dev
    libgtest-dev libgmock-dev googletest libbenchmark-dev
    # fuzzing: clang with libFuzzer and the sanitizer runtimes
    clang libclang-rt-14-dev
    # fonts: Liberation Sans is metric-compatible with Arial, used by the sheet picture
    fonts-liberation
    # independent readers of the .xls files, used by the format tests
    python3 python3-xlrd python3-olefile gnumeric libreoffice-calc-nogui
    # looking at the program: a virtual display, screenshots, PDF to PNG, driving it by mouse
    xvfb xauth x11-apps imagemagick poppler-utils xdotool
    # Windows build of the core, run under Wine
    g++-mingw-w64-x86-64-posix wine64
    # benchmarks: peers and whole-process timing
    libxlsxwriter-dev python3-xlwt hyperfine time
)

missing=()
for p in "${packages[@]}"; do
    if ! dpkg-query -W -f='${Status}' "$p" 2>/dev/null | grep -q "install ok installed"; then
        missing+=("$p")
    fi
done

if [ ${#missing[@]} -eq 0 ]; then
    exit 0
fi

echo "Installing: ${missing[*]}"
sudo_cmd=()
if [ "$(id -u)" -ne 0 ]; then
    sudo_cmd=(sudo)
fi
"${sudo_cmd[@]}" apt-get update -q
DEBIAN_FRONTEND=noninteractive "${sudo_cmd[@]}" apt-get install -y -q --no-install-recommends "${missing[@]}"
