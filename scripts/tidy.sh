#!/usr/bin/env bash
# Static analysis by clang-tidy, on two files at a time:
#
#   scripts/tidy.sh              every source file (long: some ten seconds a file)
#   scripts/tidy.sh FILES...     these
#   scripts/tidy.sh --since REF  those changed since a commit or branch
set -euo pipefail
cd "$(dirname "$0")/.."
build=build/tidy
# A compilation database by Clang: that of GCC holds options that Clang does not know.
cmake -S . -B $build -G Ninja -DCMAKE_CXX_COMPILER=clang++ -DCMAKE_BUILD_TYPE=Debug >/dev/null
if [[ ${1-} == --since ]]; then
    mapfile -t files < <(git diff --name-only --diff-filter=d "${2:?--since needs a commit}" -- '*.cpp')
elif (($#)); then
    files=("$@")
else
    mapfile -t files < <(git ls-files '*.cpp')
fi
((${#files[@]})) || exit 0
printf '%s\0' "${files[@]}" | xargs -0 -P "$(nproc)" -n 1 clang-tidy -p $build --quiet
