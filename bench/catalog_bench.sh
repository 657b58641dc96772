#!/usr/bin/env bash
# OpenCatalog and SaveCatalog of 100,000 pictures + 20,000 documents + 1,000 of
# each other kind, beside the time `cp` takes to copy the same file.
set -euo pipefail
build=${1:-build}
bench="$build/bin/catalog_bench"
work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT
file="$work/HearthbookInfo.hbi"

"$bench" generate "$file"
size=$(stat -c %s "$file")

best_cp=""
for _ in 1 2 3; do
    start=$(date +%s%N)
    cp "$file" "$work/copy.hbi"
    end=$(date +%s%N)
    t=$(( (end - start) / 1000 ))
    rm -f "$work/copy.hbi"
    if [ -z "$best_cp" ] || [ "$t" -lt "$best_cp" ]; then best_cp=$t; fi
done
start=$(date +%s%N)
cp "$file" "$work/copy.hbi" && sync "$work/copy.hbi"
end=$(date +%s%N)
cp_sync=$(( (end - start) / 1000 ))

out=$("$bench" open "$file")
open_ms=$(echo "$out" | awk '/^open_ms/ {print $2}')
save_ms=$(echo "$out" | awk '/^save_ms/ {print $2}')
peak_mb=$(echo "$out" | awk '/^peak_mb/ {print $2}')
cp_ms=$(awk "BEGIN {printf \"%.1f\", $best_cp / 1000}")
cp_sync_ms=$(awk "BEGIN {printf \"%.1f\", $cp_sync / 1000}")

echo "catalog file:             $(awk "BEGIN {printf \"%.1f\", $size / 1048576}") MB"
echo "cp of the file (floor):   $cp_ms ms"
echo "cp + fsync:               $cp_sync_ms ms"
echo "OpenCatalog (best of 3):  $open_ms ms   = $(awk "BEGIN {printf \"%.1f\", $open_ms / $cp_ms}")x cp   (target 5x)"
echo "SaveCatalog (best of 3):  $save_ms ms   = $(awk "BEGIN {printf \"%.1f\", $save_ms / $cp_ms}")x cp, $(awk "BEGIN {printf \"%.1f\", $save_ms / $cp_sync_ms}")x cp+fsync   (target 5x; the save flushes to disk)"
echo "peak memory (open+save):  $peak_mb MB   (target < 150 MB)"
