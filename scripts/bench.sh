#!/usr/bin/env bash
# Builds the release preset and runs every benchmark; each prints its figures.
set -euo pipefail
cd "$(dirname "${BASH_SOURCE[0]}")/.."

scripts/setup.sh
cmake --preset release
cmake --build --preset release -j2
for bench in build/release/bench/tvx_*_bench; do
  echo "=== ${bench##*/}"
  "$bench" --benchmark_color=false
done
