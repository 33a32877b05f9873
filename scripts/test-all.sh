#!/usr/bin/env bash
# Installs what is missing, builds, and runs every test: once in a plain
# build, once more under AddressSanitizer and UndefinedBehaviorSanitizer; then
# runs the fuzzers for two minutes and forty seconds.
set -euo pipefail
root=$(cd "$(dirname "$0")/.." && pwd)
bash "$root/scripts/install-deps.sh"

# Options are given in full: the main job configures the same tree without tests.
bash "$root/scripts/build.sh" build -DORLO_TESTS=ON -DORLO_BENCH=ON -DORLO_SANITIZE=OFF -DCMAKE_BUILD_TYPE=RelWithDebInfo
ctest --test-dir "$root/build" --output-on-failure -j "$(nproc)"

bash "$root/scripts/build.sh" build-asan -DORLO_TESTS=ON -DORLO_SANITIZE=ON -DORLO_BENCH=OFF -DCMAKE_BUILD_TYPE=Debug
ASAN_OPTIONS=detect_leaks=1:abort_on_error=1 UBSAN_OPTIONS=print_stacktrace=1:halt_on_error=1 \
    ctest --test-dir "$root/build-asan" --output-on-failure -j "$(nproc)"

# The fuzzers, built with clang, under AddressSanitizer: the chunk walk for a
# minute, the whole intake of a file and the iXML text for half a minute each,
# the link through the container and the sample map, the clip model's text
# parsers and the group scan's file names for twenty seconds each.
bash "$root/scripts/fuzz.sh" 60 fuzz_chunk_stream
bash "$root/scripts/fuzz.sh" 30 fuzz_movie
bash "$root/scripts/fuzz.sh" 30 fuzz_ixml
bash "$root/scripts/fuzz.sh" 20 fuzz_link
bash "$root/scripts/fuzz.sh" 20 fuzz_clip_text
bash "$root/scripts/fuzz.sh" 20 fuzz_group_names
