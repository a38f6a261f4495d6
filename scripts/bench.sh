#!/usr/bin/env bash
# Builds the benchmarks in release and prints one line for each ratio with its bound; exit status 1
# when one is over. What they measure stands in docs/benchmarks.md.
#
#   scripts/bench.sh [NAME...]    those of add_bench(NAME ...) alone; all without
#
# "process" is the comparison of tzconvert with other programs, scripts/compare.py.
set -euo pipefail
root=$(cd "$(dirname "$0")/.." && pwd)
source "$root/scripts/build.sh"

names=("$@")
if ((${#names[@]} == 0)); then
    mapfile -t names < <(sed -n 's/^add_bench(\([a-z_]*\).*/\1/p' "$root"/bench/*/CMakeLists.txt)
    names+=(process)
fi
reports=$root/build/release/reports/bench
measured=()
status=0
for name in "${names[@]}"; do
    if [[ $name == process ]]; then
        tz_build release bare_pass
        tz_build release tzconvert
        python3 "$root/scripts/compare.py" "$TZ_BUILD" || status=1
        continue
    fi
    tz_build release "bench_$name"
    mkdir -p "$reports"
    LC_ALL=C.UTF-8 FONTCONFIG_FILE="$TZ_BUILD/tests/fonts/fonts.conf" \
        "$TZ_BUILD/tests/bench_$name" --benchmark_out="$reports/$name.json" \
        --benchmark_out_format=json >"$reports/$name.log" 2>&1 || {
        cat "$reports/$name.log" >&2
        exit 1
    }
    measured+=("$reports/$name")
done
python3 "$root/scripts/ratios.py" "${measured[@]}" || status=1
exit $status
