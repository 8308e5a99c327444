# SPDX-License-Identifier: GPL-3.0-or-later
# shellcheck shell=bash
# What tests in shell have in common. To be sourced; the test ends with "exit $((failures > 0))".
failures=0

# check WHAT COMMAND...: COMMAND succeeds.
check() {
    if "${@:2}"; then
        echo "ok      $1"
    else
        echo "FAILED  $1"
        failures=$((failures + 1))
    fi
}

equal() {
    [ "$1" = "$2" ] || { printf '        is       %s\n        expected %s\n' "$1" "$2" && false; }
}

differ() {
    [ "$1" != "$2" ] || { printf '        is       %s\n' "$1" && false; }
}

contains() {
    [[ $1 == *"$2"* ]] || { printf '        lacks %s:\n%s\n' "$2" "$1" && false; }
}

# becomes COMMAND...: COMMAND succeeds sooner or later.
becomes() {
    local attempts=600
    until "$@"; do
        ((attempts-- > 0)) || return 1
        sleep 0.1
    done
}
