#!/bin/bash
# SPDX-License-Identifier: GPL-3.0-or-later
set -eu

cd "$(dirname "${BASH_SOURCE[0]}")"
. scripts/packages.sh

program=build/release/app/orv-admin-dhcp
title="Configure DHCP server"

usage() {
    cat <<END
Usage: ./run.sh [OPTION]

Builds the program and starts it. What the build lacks is installed first, on Debian and Ubuntu.

  (no option)         on a demonstration site with a DHCP server and clients of its own, as any user; nothing of this
                      machine is touched
  --system            as the superuser, on the DHCP server of this machine
  --screenshot FILE   on the demonstration site without a display; saves a PNG picture of the window and ends
  -h, --help          this text
END
}

refuse() {
    printf 'run.sh: %s\n\n' "$1" >&2
    usage >&2
    exit 2
}

mode=demo
case ${1:-} in
"") ;;
--system) mode=system ;;
--screenshot)
    mode=screenshot
    [ $# -ge 2 ] || refuse "--screenshot needs the name of a file"
    if ! picture=$(cd "$OLDPWD" && realpath -- "$2" 2>/dev/null) || [ -d "$picture" ]; then
        refuse "--screenshot needs the name of a file, in a folder that exists"
    fi
    shift
    ;;
-h | --help)
    usage
    exit
    ;;
*) refuse "unknown option $1" ;;
esac
[ $# -le 1 ] || refuse "unexpected argument $2"

if [ "$mode" != screenshot ] && [ -z "${DISPLAY:-}${WAYLAND_DISPLAY:-}" ]; then
    echo "run.sh: the window needs a display, and neither DISPLAY nor WAYLAND_DISPLAY is set." >&2
    echo "run.sh: without one, ./run.sh --screenshot FILE saves a picture of the window." >&2
    exit 1
fi

groups=(build run)
if [ "$mode" = screenshot ]; then
    groups+=(screenshot)
elif [ -z "${DISPLAY:-}" ]; then
    groups+=(wayland)
    export QT_QPA_PLATFORM=${QT_QPA_PLATFORM:-wayland}
fi
# Before much is installed and built for nothing.
if [ "$mode" != system ] && ! scripts/private-network --try; then
    [ "$(id -u)" -eq 0 ] || echo "run.sh: the superuser may in most cases: sudo ./run.sh${picture:+ --screenshot "$picture"}" >&2
    exit 1
fi
require_packages "${groups[@]}"
[ "$mode" = system ] || scripts/fetch-tools isc-dhcp-server isc-dhcp-client
scripts/build release
site=(scripts/private-network demo/open-site "$program")

# The display, its key and the language, which sudo and pkexec drop.
session_variables() {
    local name
    export XAUTHORITY="${XAUTHORITY:-$HOME/.Xauthority}"
    case ${WAYLAND_DISPLAY:-} in
    "" | /*) ;;
    *) WAYLAND_DISPLAY=${XDG_RUNTIME_DIR:-}/$WAYLAND_DISPLAY ;;
    esac
    for name in DISPLAY XAUTHORITY WAYLAND_DISPLAY QT_QPA_PLATFORM LANG LANGUAGE LC_ALL; do
        [ -z "${!name:-}" ] || echo "$name=${!name}"
    done
}

case $mode in
demo)
    exec "${site[@]}"
    ;;
screenshot)
    scripts/screenshot "$picture" "$title" "${site[@]}"
    ;;
system)
    mapfile -t session < <(session_variables)
    if [ "$(id -u)" -eq 0 ]; then
        exec "$program"
    elif command -v sudo >/dev/null; then
        exec sudo env "${session[@]}" "$PWD/$program"
    elif command -v pkexec >/dev/null; then
        exec pkexec env "${session[@]}" "$PWD/$program"
    fi
    echo "run.sh: neither sudo nor pkexec is installed; run ./run.sh --system as root." >&2
    exit 1
    ;;
esac
