#!/bin/bash
# SPDX-License-Identifier: GPL-3.0-or-later
set -eu

cd "$(dirname "${BASH_SOURCE[0]}")"
. scripts/packages.sh

usage() {
    cat <<END
Usage: ./test.sh [--sanitizers] [-- CTEST-OPTION...]

Builds the program with its tests and runs them all. What is needed is installed first, on Debian and Ubuntu.
The exit status is CTest's.

  --sanitizers        under AddressSanitizer and UndefinedBehaviorSanitizer
  -- CTEST-OPTION...  passed on to ctest, for example -- -R leases
  -h, --help          this text
END
}

preset=debug
while [ $# -gt 0 ]; do
    case $1 in
    --sanitizers) preset=sanitizers ;;
    -h | --help)
        usage
        exit
        ;;
    --)
        shift
        break
        ;;
    *)
        printf 'test.sh: unknown option %s\n\n' "$1" >&2
        usage >&2
        exit 2
        ;;
    esac
    shift
done

require_packages build run screenshot test
scripts/fetch-tools
scripts/build "$preset"
export ORV_TOOLS_DIR=$PWD/build/tools
status=0
ctest --preset "$preset" "$@" || status=$?

# CTest names the tests that were skipped but keeps their reasons to itself.
log=build/$preset/Testing/Temporary/LastTest.log
[ ! -e "$log" ] || awk '
    / Testing: / { name = $3; reason = "" }
    /^<end of output>$/ { inside = 0 }
    inside && !/^-+$/ { reason = reason "\n    " $0 }
    /^Output:$/ { inside = 1 }
    /^Test Skipped\.$/ { print name " was skipped:" reason }' "$log"
exit "$status"
