#!/usr/bin/env bash
# Usage: scripts/configure.sh <build dir> [cmake arguments...]
# Configures the build directory once; a directory that is already configured is left alone
# (the build itself re-runs CMake when CMakeLists change). Uses Ninja when it is installed.
set -euo pipefail

build_dir=$1
shift

if [ -f "$build_dir/CMakeCache.txt" ] && { [ -f "$build_dir/build.ninja" ] || [ -f "$build_dir/Makefile" ]; }; then
    exit 0
fi

generator=()
if [ ! -f "$build_dir/CMakeCache.txt" ] && command -v ninja >/dev/null 2>&1; then
    generator=(-G Ninja)
fi

cmake -S . -B "$build_dir" "${generator[@]}" "$@"
