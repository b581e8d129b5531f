#!/usr/bin/env bash
# Builds the Release configuration into build/release and runs every benchmark, each printing its
# figures and, where it compares against a reference, the ratio from the same run.
set -euo pipefail
cd "$(dirname "$0")/.."

bash scripts/deps.sh
cmake --preset release
cmake --build --preset release
for bench in build/release/bench/*_bench; do
    echo "== $(basename "$bench")"
    "$bench" "$@"
done
