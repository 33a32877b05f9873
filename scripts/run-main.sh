#!/usr/bin/env bash
# Installs what is missing, builds, and runs the main job: the plug-in makes
# the clip of the bundled example take, and orlo shows it.
set -euo pipefail
root=$(cd "$(dirname "$0")/.." && pwd)
bash "$root/scripts/install-deps.sh"
bash "$root/scripts/build.sh" build -DORLO_TESTS=OFF -DORLO_BENCH=OFF -DORLO_SANITIZE=OFF -DCMAKE_BUILD_TYPE=RelWithDebInfo
cd "$root"
build/bin/orlo probe examples/12A-T03.wav
