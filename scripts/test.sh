#!/usr/bin/env bash
# Configures, builds and tests every preset, then runs the fuzz targets
# briefly; stops at the first failure.
set -euo pipefail
cd "$(dirname "${BASH_SOURCE[0]}")/.."

scripts/setup.sh

presets=(dev tsan i386 release)
summary=()
started=$SECONDS

for preset in "${presets[@]}"; do
  preset_started=$SECONDS
  echo "=== ${preset}: configure"
  cmake --preset "$preset"
  echo "=== ${preset}: build"
  cmake --build --preset "$preset" -j2
  echo "=== ${preset}: test"
  log="build/${preset}/ctest.log"
  ctest --preset "$preset" 2>&1 | tee "$log"
  summary+=("${preset} ($((SECONDS - preset_started)) s):")
  summary+=("$(grep -E 'tests passed, [0-9]+ tests failed out of' "$log" | tail -n 1)")
done

# A smoke run: every fuzz target briefly, and every regression input.
fuzz_started=$SECONDS
scripts/fuzz.sh 4 | tee build/fuzz-smoke.log
summary+=("fuzz ($((SECONDS - fuzz_started)) s): $(grep -c ' ok$' build/fuzz-smoke.log) targets and regression sets ok")

echo "=== summary"
printf '%s\n' "${summary[@]}"
echo "total: $((SECONDS - started)) s"
