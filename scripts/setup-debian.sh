#!/usr/bin/env bash
# Installs the Debian packages Hearthbook needs to build, run and test,
# only those that are missing.
set -euo pipefail

packages=(
    # build
    g++ cmake ninja-build pkg-config qt6-base-dev qt6-image-formats-plugins
    libgif-dev libcups2-dev
    # run
    xdg-utils fonts-liberation
    # independent checkers used by the tests
    exiv2 poppler-utils imagemagick
)
if [ "${HB_SETUP_EXTRA:-}" != "" ]; then
    # shellcheck disable=SC2206
    packages+=(${HB_SETUP_EXTRA})
fi

missing=()
for p in "${packages[@]}"; do
    if ! dpkg-query -W -f='${Status}' "$p" 2>/dev/null | grep -q "install ok installed"; then
        missing+=("$p")
    fi
done
[ ${#missing[@]} -eq 0 ] && exit 0

echo "Installing: ${missing[*]}"
sudo=""
if [ "$(id -u)" -ne 0 ]; then
    sudo="sudo"
fi
export DEBIAN_FRONTEND=noninteractive
$sudo apt-get update -qq
$sudo apt-get install -y -qq --no-install-recommends "${missing[@]}"
