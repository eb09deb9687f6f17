#!/usr/bin/env bash
# Usage: scripts/run-fuzzers.sh <fuzz build dir> <seconds per target>
# Runs every fuzz_<name> executable for the given time, seeded from fuzz/corpus/<name>/ and
# using fuzz/<name>.dict when present. New interesting inputs go to <build dir>/corpus/<name>/
# and crash reproducers to <build dir>/artifacts/<name>/, so the source tree stays untouched;
# copy reproducers into fuzz/corpus/<name>/ once fixed so the replay test keeps them fixed.
set -euo pipefail

build_dir=$1
seconds=$2
shopt -s nullglob
fuzzers=("$build_dir"/bin/fuzz_*)

if [ ${#fuzzers[@]} -eq 0 ]; then
    echo "run-fuzzers: no fuzz targets in $build_dir/bin"
    exit 0
fi

for fuzzer in "${fuzzers[@]}"; do
    name=$(basename "$fuzzer")
    name=${name#fuzz_}
    seeds=fuzz/corpus/$name
    found=$build_dir/corpus/$name
    artifacts=$build_dir/artifacts/$name
    mkdir -p "$seeds" "$found" "$artifacts"

    options=(-max_total_time="$seconds" -artifact_prefix="$artifacts/")
    if [ -f "fuzz/$name.dict" ]; then
        options+=(-dict="fuzz/$name.dict")
    fi

    echo "== fuzz_$name for ${seconds}s"
    "$fuzzer" "${options[@]}" "$found" "$seeds"
done
