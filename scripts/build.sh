# For ./run, ./test and .ci/run: sets up and builds. Sourced by bash with `root` set.
#
#   tz_build PRESET [TARGET]    builds; TZ_BUILD then names the build folder

tz_build() {
    local preset=$1 target=${2:-all} log
    TZ_BUILD=$root/build/$preset
    log=$root/build/$preset.log
    mkdir -p "$root/build"
    sh "$root/scripts/setup.sh" build
    if command -v ccache >/dev/null; then
        export CMAKE_CXX_COMPILER_LAUNCHER=${CMAKE_CXX_COMPILER_LAUNCHER-ccache}
    fi
    # A build without faults is of no interest; of another its errors are.
    if ! (cd "$root" && cmake --preset "$preset") >"$log" 2>&1; then
        cat "$log" >&2
        return 1
    fi
    # The build shows its progress on a terminal only, in one line that rewrites itself.
    if [[ -t 1 ]]; then
        (cd "$root" && cmake --build --preset "$preset" --target "$target")
    elif ! (cd "$root" && cmake --build --preset "$preset" --target "$target") >"$log" 2>&1; then
        grep -v '^\[' "$log" | head -n 100 >&2 || true
        echo "The whole of it is in ${log#"$root"/}." >&2
        return 1
    fi
}
