#!/usr/bin/env bash
# Installs what is missing, builds, and runs the main job: orlo loads the
# plug-in module as an editing host does and links the bundled example take
# through it.
set -euo pipefail
root=$(cd "$(dirname "$0")/.." && pwd)
bash "$root/scripts/install-deps.sh"
bash "$root/scripts/build.sh" build -DORLO_TESTS=OFF -DORLO_BENCH=OFF -DORLO_SANITIZE=OFF -DCMAKE_BUILD_TYPE=RelWithDebInfo
cd "$root"
build/bin/orlo link examples/12A-T03.wav
