#!/usr/bin/env bash
# Builds the chunk-walk fuzzer with clang and runs it under AddressSanitizer for
# SECONDS (default 60) on a fresh copy of the seed corpus:
#     scripts/fuzz.sh [SECONDS]
# Installs nothing. ORLO_FUZZ_BUILD names the build folder (default build-fuzz).
# A crash leaves its input as crash-* in that folder.
set -euo pipefail
root=$(cd "$(dirname "$0")/.." && pwd)
seconds=${1:-60}
dir="$root/${ORLO_FUZZ_BUILD:-build-fuzz}"

CC=clang CXX=clang++ cmake -S "$root" -B "$dir" -G Ninja -DORLO_FUZZ=ON -DORLO_TESTS=OFF -DORLO_BENCH=OFF >/dev/null
cmake --build "$dir" -j "$(nproc)" --target fuzz_chunk_stream fuzz_seed_corpus

corpus=$(mktemp -d)
trap 'rm -rf "$corpus"' EXIT
cp "$dir/fuzz/seeds/"* "$corpus/"
ASAN_OPTIONS=detect_leaks=1:abort_on_error=1 \
    "$dir/bin/fuzz_chunk_stream" -max_total_time="$seconds" -timeout=10 -rss_limit_mb=2048 \
    -artifact_prefix="$dir/" -print_final_stats=1 "$corpus"
