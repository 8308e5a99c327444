#!/bin/bash
# SPDX-License-Identifier: GPL-3.0-or-later
set -eu

cd "$(dirname "${BASH_SOURCE[0]}")"
. scripts/packages.sh

usage() {
    cat <<END
Usage: ./test.sh [--qt6] [--sanitizers] [-- CTEST-OPTION...]

Builds the program with its tests and runs them all. What is needed is installed first, on Debian and Ubuntu.
The exit status is CTest's.

  --qt6               built with Qt 6 instead of Qt 5
  --sanitizers        under AddressSanitizer and UndefinedBehaviorSanitizer
  -- CTEST-OPTION...  passed on to ctest, for example -- -R leases
  -h, --help          this text
END
}

preset=debug
qt=
groups=(build run screenshot test)
while [ $# -gt 0 ]; do
    case $1 in
    --qt6)
        qt=-qt6
        groups+=(qt6)
        ;;
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

require_packages "${groups[@]}"
scripts/fetch-tools
scripts/build "$preset$qt"
export ORV_TOOLS_DIR=$PWD/build/tools
results=$PWD/build/$preset$qt/tests.xml
status=0
rm -f "$results"
ctest --preset "$preset$qt" --output-junit "$results" "$@" || status=$?

# CTest names the tests that were skipped but keeps their reasons to itself.
[ ! -e "$results" ] || python3 - "$results" <<'END'
import sys
import xml.etree.ElementTree

for test in xml.etree.ElementTree.parse(sys.argv[1]).iter("testcase"):
    if test.find("skipped") is not None:
        print(f"Skipped: {test.get('name')}\n{test.findtext('system-out')}")
END
exit "$status"
