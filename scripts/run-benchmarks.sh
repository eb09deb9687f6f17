#!/usr/bin/env bash
# Usage: scripts/run-benchmarks.sh <bin dir>
# Runs every bench_* executable in the directory; fails if any of them fails.
set -euo pipefail

bin_dir=$1
shopt -s nullglob
benchmarks=("$bin_dir"/bench_*)

if [ ${#benchmarks[@]} -eq 0 ]; then
    echo "run-benchmarks: no benchmarks in $bin_dir"
    exit 0
fi

for benchmark in "${benchmarks[@]}"; do
    echo "== $(basename "$benchmark")"
    "$benchmark"
done
