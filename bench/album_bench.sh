#!/usr/bin/env bash
# A 1,000-picture album's pages and picture copies (hearthbook-cli album-html)
# beside `cp` of the same pictures into a folder.
set -euo pipefail
build=${1:-build}
work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT
"$build/bin/album_bench" pictures "$work/pictures" 1000
"$build/bin/album_bench" json "$work/pictures" "$work/album.json"
cli="$build/bin/hearthbook-cli"
"$cli" --catalog "$work/catalog.hbi" import-json "$work/album.json" >/dev/null
bytes=$(du -sb "$work/pictures" | cut -f1)

copy() { cp "$work"/pictures/*.jpg "$1"/; }
album() { "$cli" --catalog "$work/catalog.hbi" album-html 1 --folder "$1"; }
run_ms() { # one run of a command into a fresh folder, in ms
    rm -rf "$work/out"
    mkdir -p "$work/out"
    sync
    local start end
    start=$(date +%s%N)
    "$@" "$work/out" >/dev/null 2>&1
    end=$(date +%s%N)
    echo $(( (end - start) / 1000000 ))
}
# The two alternate, so that disk and machine noise falls on both alike.
cp_ms=""
album_ms=""
for run in 1 2 3 4 5; do
    t=$(run_ms copy)
    if [ -z "$cp_ms" ] || [ "$t" -lt "$cp_ms" ]; then cp_ms=$t; fi
    t=$(run_ms album)
    if [ -z "$album_ms" ] || [ "$t" -lt "$album_ms" ]; then album_ms=$t; fi
done
echo "pictures:                  1000 ($(( bytes / 1048576 )) MB)"
echo "cp into a folder:          $cp_ms ms (best of 5)"
echo "album-html (pages+copies): $album_ms ms (best of 5)  = $(awk "BEGIN {printf \"%.2f\", $album_ms / ($cp_ms > 0 ? $cp_ms : 1)}")x cp   (target 1.3x)"
