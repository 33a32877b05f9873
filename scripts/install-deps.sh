#!/usr/bin/env bash
# Installs the Debian 12 packages that the build and the tests need, when any
# is missing. Needs root for apt-get; says so otherwise.
set -euo pipefail

packages=(g++ cmake ninja-build pkg-config
          libgtest-dev libgmock-dev libbenchmark-dev
          libxml2-dev libssl-dev libcli11-dev nlohmann-json3-dev
          clang lld libclang-rt-14-dev)

missing=()
for p in "${packages[@]}"; do
    dpkg-query -W -f='${Status}' "$p" 2>/dev/null | grep -q "install ok installed" || missing+=("$p")
done
if [ ${#missing[@]} -eq 0 ]; then
    exit 0
fi
echo "Installing: ${missing[*]}"
if [ "$(id -u)" -ne 0 ]; then
    echo "error: these packages are missing and installing them needs root:" >&2
    echo "  sudo apt-get install -y ${missing[*]}" >&2
    exit 1
fi
export DEBIAN_FRONTEND=noninteractive
apt-get update -qq
apt-get install -y -qq --no-install-recommends "${missing[@]}"
