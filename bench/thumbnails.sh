#!/usr/bin/env bash
# 200 generated 12-megapixel JPEGs to 200-pixel thumbnails: Hearthbook on one
# thread and on its pool, beside vipsthumbnail (one thread, then its default).
# Usage: bench/thumbnails.sh BUILD_DIR   (the JPEGs are kept for the next run)
set -euo pipefail
build=${1:-build}
count=${HB_BENCH_COUNT:-200}
size=200
photos=${HB_BENCH_DIR:-${TMPDIR:-/tmp}/hearthbook-bench-$(id -u)}/jpegs-12mp
command -v vipsthumbnail >/dev/null || { echo "vipsthumbnail missing (libvips-tools)"; exit 1; }

"$build/bin/thumbnail_bench" generate "$photos" "$count"
out=$(mktemp -d)
trap 'rm -rf "$out"' EXIT

seconds() { # seconds COMMAND...: wall time of the command
    local start end
    start=$(date +%s.%N)
    "$@" >/dev/null
    end=$(date +%s.%N)
    awk -v a="$start" -v b="$end" 'BEGIN { printf "%.3f", b - a }'
}
calc() { awk "BEGIN { printf \"%.2f\", $1 }"; }

cat "$photos"/*.jpg >/dev/null # same warm page cache for everyone
vips1=$(VIPS_CONCURRENCY=1 seconds vipsthumbnail --size "$size" -o "$out/%s-1.jpg" "$photos"/*.jpg)
vipsn=$(seconds vipsthumbnail --size "$size" -o "$out/%s-n.jpg" "$photos"/*.jpg)
ours=$("$build/bin/thumbnail_bench" run "$photos" "$size")
single=$(awk '/^single_seconds/ {print $2}' <<<"$ours")
pool=$(awk '/^pool_seconds/ {print $2}' <<<"$ours")
threads=$(awk '/^pool_threads/ {print $2}' <<<"$ours")

rate() { calc "$count / $1"; }
printf 'thumbnails of %d 12 MP JPEGs to %d px\n' "$count" "$size"
printf '  vipsthumbnail, 1 thread:     %6.2f s  %6s files/s\n' "$vips1" "$(rate "$vips1")"
printf '  vipsthumbnail, default:      %6.2f s  %6s files/s\n' "$vipsn" "$(rate "$vipsn")"
printf '  hearthbook, 1 thread:        %6.2f s  %6s files/s\n' "$single" "$(rate "$single")"
printf '  hearthbook, pool of %d:       %6.2f s  %6s files/s\n' "$threads" "$pool" "$(rate "$pool")"
printf '  single-threaded rate vs vipsthumbnail 1 thread: %.2fx (target >= 0.8x)\n' \
    "$(calc "$vips1 / $single")"
printf '  pool rate vs vipsthumbnail default:             %.2fx\n' \
    "$(calc "$vipsn / $pool")"
