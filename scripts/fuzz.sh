#!/usr/bin/env bash
# Builds a fuzz target with clang and runs it under AddressSanitizer for
# SECONDS (default 60) on a fresh copy of its seed corpus:
#     scripts/fuzz.sh [SECONDS] [TARGET]
# TARGET is fuzz_chunk_stream (default: the chunk walk), fuzz_ixml (the iXML
# text), fuzz_clip_text (the clip model's text parsers), fuzz_group_names (the
# group scan's name readers and filters), fuzz_movie (the whole intake of a
# file into a Movie) or fuzz_link (the link of a file through the container
# and the sample map). Installs nothing. ORLO_FUZZ_BUILD names
# the build folder (default build-fuzz). A crash leaves its input as crash-* in
# that folder.
set -euo pipefail
root=$(cd "$(dirname "$0")/.." && pwd)
seconds=${1:-60}
target=${2:-fuzz_chunk_stream}
dir="$root/${ORLO_FUZZ_BUILD:-build-fuzz}"

case "$target" in
    fuzz_chunk_stream | fuzz_movie | fuzz_link) seeds="$dir/fuzz/seeds" ;;
    fuzz_ixml) seeds="$root/fuzz/ixml-seeds" ;;
    fuzz_clip_text) seeds="$root/fuzz/clip-text-seeds" ;;
    fuzz_group_names) seeds="$root/fuzz/group-name-seeds" ;;
    *) echo "fuzz.sh: unknown target $target (fuzz_chunk_stream, fuzz_ixml, fuzz_movie, fuzz_link, fuzz_clip_text or fuzz_group_names)" >&2; exit 2 ;;
esac

CC=clang CXX=clang++ cmake -S "$root" -B "$dir" -G Ninja -DORLO_FUZZ=ON -DORLO_TESTS=OFF -DORLO_BENCH=OFF >/dev/null
cmake --build "$dir" -j "$(nproc)" --target "$target" fuzz_seed_corpus

corpus=$(mktemp -d)
trap 'rm -rf "$corpus"' EXIT
cp "$seeds/"* "$corpus/"
ASAN_OPTIONS=detect_leaks=1:abort_on_error=1 LSAN_OPTIONS=suppressions="$root/tests/lsan.supp" \
    "$dir/bin/$target" -max_total_time="$seconds" -timeout=10 -rss_limit_mb=2048 \
    -artifact_prefix="$dir/" -print_final_stats=1 "$corpus"
