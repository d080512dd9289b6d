#!/usr/bin/env bash
# Installs what the build needs from Debian, when it is missing.
set -euo pipefail
packages=(cmake g++ libhalide14-0-dev libgtest-dev libbenchmark-dev libopencv-core-dev)
missing=()
for p in "${packages[@]}"; do
    dpkg-query -W -f='${Status}' "$p" 2>/dev/null | grep -q 'install ok installed' || missing+=("$p")
done
if [ ${#missing[@]} -gt 0 ]; then
    sudo_cmd=""
    [ "$(id -u)" -eq 0 ] || sudo_cmd="sudo"
    $sudo_cmd apt-get update
    $sudo_cmd env DEBIAN_FRONTEND=noninteractive apt-get install -y "${missing[@]}"
fi
