#!/bin/sh
# Runs one fuzzer of the fuzz build for a while, from its seeds:
#
#   scripts/fuzz.sh build/fuzz/tests/fuzz_ini [SECONDS [OPTIONS...]]
#
# Inputs have up to 64 KB. Further options go to libFuzzer as they are. New inputs go to
# build/fuzz/corpus, those that crash to build/fuzz/crashes; a crash found becomes a test case.
set -eu
root=$(cd "$(dirname "$0")/.." && pwd)
program=$1
seconds=${2:-30}
shift "$(($# < 2 ? $# : 2))"
name=$(basename "$program")
name=${name#fuzz_}
found=$root/build/fuzz/corpus/$name
crashes=$root/build/fuzz/crashes
seeds=$root/fuzz/corpus/$name
mkdir -p "$found" "$crashes"
[ -d "$seeds" ] || seeds=
dictionary=$root/fuzz/dictionaries/$name.dict
[ -f "$dictionary" ] || dictionary=
export LC_ALL=C.UTF-8 FONTCONFIG_FILE="$root/build/fuzz/tests/fonts/fonts.conf"
# Leaks that are not ours, as the tests have it.
export LSAN_OPTIONS="suppressions='$root/tests/leaks.supp':print_suppressions=0"
export TZ_TEST_LIB="$root/build/fuzz/lib" TZ_TEST_BIN="$root/build/fuzz/bin" TZ_TEST_SOURCE="$root"
log=$crashes/$name.log
if "$program" -max_total_time="$seconds" -max_len=65536 -timeout=20 -rss_limit_mb=2500 \
    -print_final_stats=1 -artifact_prefix="$crashes/$name-" ${dictionary:+"-dict=$dictionary"} \
    "$@" "$found" ${seeds:+"$seeds"} >"$log" 2>&1; then
    runs=$(sed -n 's/^stat::number_of_executed_units: *//p' "$log")
    echo "fuzz_$name: $runs inputs, no crash"
else
    tail -n 60 "$log"
    echo "fuzz_$name: failed; the input lies in build/fuzz/crashes" >&2
    exit 1
fi
