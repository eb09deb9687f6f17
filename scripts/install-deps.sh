#!/usr/bin/env bash
# Installs the Debian packages the build needs, touching apt only when something is missing.
set -euo pipefail

packages=(
    cmake g++ make ninja-build
    libboost-thread-dev libgtest-dev libgmock-dev libbenchmark-dev
    nlohmann-json3-dev libstb-dev libcli11-dev
    clang libclang-rt-14-dev
)

if ! command -v dpkg >/dev/null 2>&1; then
    echo "install-deps: not a Debian system; install these yourself: ${packages[*]}" >&2
    exit 0
fi

missing=()
for package in "${packages[@]}"; do
    if ! dpkg -s "$package" 2>/dev/null | grep -q '^Status: install ok installed'; then
        missing+=("$package")
    fi
done

if [ ${#missing[@]} -eq 0 ]; then
    exit 0
fi

sudo=()
if [ "$(id -u)" -ne 0 ]; then
    if ! command -v sudo >/dev/null 2>&1; then
        echo "install-deps: missing ${missing[*]}; run as root or install sudo" >&2
        exit 1
    fi
    sudo=(sudo)
fi

echo "install-deps: installing ${missing[*]}"
"${sudo[@]}" apt-get update
"${sudo[@]}" env DEBIAN_FRONTEND=noninteractive apt-get install -y "${missing[@]}"
