#!/usr/bin/env bash
# Builds the fuzz preset, runs every fuzz target for the given number of
# seconds (default 300) on a copy of its seed corpus, then runs every kept
# regression input once. Exits non-zero when any target fails; the file that
# made it fail is named in the output.
set -euo pipefail
cd "$(dirname "${BASH_SOURCE[0]}")/.."

seconds=${1:-300}
# Below what a profile that copies its texts per adapter takes, far above
# what a sound reader needs for any regression input.
regression_rss_mb=512
bin=build/fuzz/fuzz
runs=build/fuzz/runs

echo "=== fuzz: configure and build"
cmake --preset fuzz
cmake --build --preset fuzz -j2

rm -rf "$runs"
mkdir -p "$runs"
failed=0
results=()

# The last value libFuzzer printed for a key, or "?".
last_value() {
  grep -oE "$1[0-9]+" "$2" | tail -n 1 | grep -oE '[0-9]+$' || echo '?'
}

for corpus in fuzz/corpus/*/; do
  target=$(basename "$corpus")
  run="$runs/$target"
  mkdir -p "$run/corpus" "$run/artifacts"
  cp "$corpus"* "$run/corpus/"
  echo "=== fuzz: $target for $seconds s"
  result=ok
  if ! "$bin/fuzz_$target" -max_total_time="$seconds" -timeout=10 -print_final_stats=1 \
      -artifact_prefix="$run/artifacts/" "$run/corpus" >"$run/log" 2>&1; then
    result="FAILED: $(grep -oE 'Test unit written to .*' "$run/log" | tail -n 1 || echo "see $run/log")"
    failed=1
  fi
  results+=("$(printf '%-20s execs %-10s cov %-6s ft %-7s %s' "$target" \
    "$(last_value 'stat::number_of_executed_units: *' "$run/log")" \
    "$(last_value 'cov: ' "$run/log")" "$(last_value 'ft: ' "$run/log")" "$result")")
done

for inputs in fuzz/regressions/*/; do
  target=$(basename "$inputs")
  log="$runs/regressions-$target.log"
  echo "=== fuzz: regression inputs of $target"
  result=ok
  if ! "$bin/fuzz_$target" -rss_limit_mb="$regression_rss_mb" -timeout=10 "$inputs"* >"$log" 2>&1; then
    result="FAILED: $(grep -oE '^Running: .*' "$log" | tail -n 1 | cut -d' ' -f2-) (see $log)"
    failed=1
  fi
  results+=("$(printf '%-20s regressions %-3s %s' "$target" "$(find "$inputs" -type f | wc -l)" "$result")")
done

echo "=== fuzz: summary ($seconds s per target)"
printf '%s\n' "${results[@]}"
exit "$failed"
