#!/usr/bin/env bash
# Installs the Debian packages that building, testing and benchmarking need, and only those that are
# missing, so a second run on a prepared machine touches nothing and needs no network.
set -euo pipefail

packages=(
    cmake ninja-build make g++ pkg-config
    libboost-dev libboost-date-time-dev libboost-thread-dev libboost-system-dev
    libpugixml-dev
    libcairo2-dev fonts-dejavu-core
    libgtest-dev libgmock-dev libbenchmark-dev
    libsdl2-dev xvfb xauth xdotool
)

missing=()
for p in "${packages[@]}"; do
    if ! dpkg-query -W -f='${Status}' "$p" 2>/dev/null | grep -q 'install ok installed'; then
        missing+=("$p")
    fi
done

if [ ${#missing[@]} -eq 0 ]; then
    exit 0
fi

sudo=""
if [ "$(id -u)" -ne 0 ]; then
    sudo="sudo"
fi
echo "Installing: ${missing[*]}"
$sudo apt-get update -q
DEBIAN_FRONTEND=noninteractive $sudo apt-get install -y -q --no-install-recommends "${missing[@]}"
