#!/usr/bin/env bash
# Builds the benchmarks in release and prints one line for each ratio with its bound; exit status 1
# when one is over. What they measure stands in docs/benchmarks.md.
#
#   scripts/bench.sh [NAME...]    those of add_bench(NAME ...) alone; all without
set -euo pipefail
root=$(cd "$(dirname "$0")/.." && pwd)
source "$root/scripts/build.sh"

names=("$@")
if ((${#names[@]} == 0)); then
    mapfile -t names < <(sed -n 's/^add_bench(\([a-z_]*\).*/\1/p' "$root"/bench/*/CMakeLists.txt)
fi
reports=$root/build/release/reports/bench
for name in "${names[@]}"; do
    tz_build release "bench_$name"
    mkdir -p "$reports"
    LC_ALL=C.UTF-8 FONTCONFIG_FILE="$TZ_BUILD/tests/fonts/fonts.conf" \
        "$TZ_BUILD/tests/bench_$name" --benchmark_out="$reports/$name.json" \
        --benchmark_out_format=json >"$reports/$name.log" 2>&1 || {
        cat "$reports/$name.log" >&2
        exit 1
    }
done
python3 "$root/scripts/ratios.py" "${names[@]/#/$reports/}"
