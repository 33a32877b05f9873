#!/usr/bin/env bash
# Installs what is missing, builds, and runs the main job.
set -euo pipefail
root=$(cd "$(dirname "$0")/.." && pwd)
bash "$root/scripts/install-deps.sh"
bash "$root/scripts/build.sh" build -DORLO_TESTS=OFF -DORLO_BENCH=OFF -DORLO_SANITIZE=OFF -DCMAKE_BUILD_TYPE=RelWithDebInfo
"$root/build/bin/orlo"
