# SPDX-License-Identifier: GPL-3.0-or-later
# shellcheck shell=bash
# The one list of Debian packages that the scripts need, by purpose, and how a missing one is installed. To be sourced.
# None of them starts a service; programs whose packages would are fetched by scripts/fetch-tools instead.

declare -A packages=(
    [build]="cmake g++ ninja-build qtbase5-dev qttools5-dev qttools5-dev-tools"
    [run]="breeze-icon-theme dbus-daemon fonts-dejavu-core iproute2 libqt5svg5 mount procps qttranslations5-l10n socat \
util-linux xauth"
    [qt6]="libqt6svg6 qt6-base-dev qt6-l10n-tools qt6-tools-dev qt6-translations-l10n"
    [wayland]="qtwayland5"
    [screenshot]="fonts-wqy-microhei maim xauth xdotool xvfb"
    [package]="dpkg-dev lintian"
    [pictures]="blackbox librsvg2-bin locales python3-pil"
    [test]="appstream at-spi2-core bind9-utils debootstrap desktop-file-utils dpkg man-db python3 python3-pyatspi \
python3-xlib"
    [bench]="libbenchmark-dev python3"
    [fuzz]="clang libclang-rt-dev"
    [lint]="black clang-format clang-tidy clazy flake8 git shellcheck"
)

# From Qt 6.7 on the plugins for SVG pictures are in a package of their own.
if apt-cache show qt6-svg-plugins >/dev/null 2>&1; then
    packages[qt6]+=" qt6-svg-plugins"
fi

# as_root COMMAND-LINE: has a shell of the superuser's run it, or prints it for somebody who can and fails.
as_root() {
    if [ "$(id -u)" -eq 0 ]; then
        sh -c "$1"
    elif command -v sudo >/dev/null; then
        sudo sh -c "$1"
    else
        printf 'This needs the superuser, and there is no sudo. Run as root:\n    %s\n' "$1" >&2
        return 1
    fi
}

# missing_packages GROUP...: the packages of the groups that are not installed.
missing_packages() {
    local group package
    for group; do
        for package in ${packages[$group]}; do
            # A line for each architecture that it is known of. What has only triggers left to run is installed.
            dpkg-query --show --showformat='${db:Status-Status}\n' "$package" 2>/dev/null |
                grep --quiet --extended-regexp --line-regexp 'installed|triggers-(awaited|pending)' || echo "$package"
        done
    done
}

# require_packages GROUP...: installs what is missing of the groups; asks for no rights when nothing is. A machine with
# other packages than Debian's has to have the programs.
require_packages() {
    local missing
    if ! command -v dpkg-query >/dev/null || ! command -v apt-get >/dev/null; then
        echo "This machine has no apt: whether what is needed ($*) is there will be seen."
        return 0
    fi
    mapfile -t missing < <(missing_packages "$@")
    [ "${#missing[@]}" -gt 0 ] || return 0

    echo "Installing for this ($*): ${missing[*]}"
    # An archive of somebody else's that cannot be read stops nothing.
    as_root "apt-get update; DEBIAN_FRONTEND=noninteractive \
apt-get install -y --no-install-recommends ${missing[*]}"
}
