#!/bin/sh
# Installs the Debian packages that are missing:
#
#   scripts/setup.sh [build|checks|package|pages]    the group "build", or that and another one
#
# Does nothing, and asks for no rights, when all are there.
set -eu
here=$(cd "$(dirname "$0")" && pwd)
group=${1:-build}

if ! command -v dpkg-query >/dev/null; then
    echo "This is no Debian system; the packages of scripts/packages.txt are taken as installed." >&2
    exit 0
fi

missing=
for package in $(awk -v group="$group" '$1 == "build" || $1 == group { print $2 }' "$here/packages.txt"); do
    state=$(dpkg-query -W -f='${db:Status-Status}' "$package" 2>/dev/null || true)
    case $state in
        installed*) ;;
        *) missing="$missing $package" ;;
    esac
done
[ -n "$missing" ] || exit 0

if [ "$(id -u)" = 0 ]; then
    as_root=
elif command -v sudo >/dev/null; then
    as_root=sudo
else
    echo "These packages are missing, and neither root nor sudo is at hand to install them:$missing" >&2
    echo "Ask for: apt-get install$missing" >&2
    exit 1
fi
echo "Installing:$missing"
export DEBIAN_FRONTEND=noninteractive
$as_root apt-get update -qq
# shellcheck disable=SC2086  # a list of names
$as_root apt-get install -y -qq --no-install-recommends $missing >/dev/null
