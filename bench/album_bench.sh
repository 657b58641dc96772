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

best() { # best of three runs of a command, in ms; the command gets a fresh folder as $1
    local best_ms=""
    for run in 1 2 3; do
        rm -rf "$work/out"
        mkdir -p "$work/out"
        sync
        local start end ms
        start=$(date +%s%N)
        "$@" "$work/out" >/dev/null 2>&1
        end=$(date +%s%N)
        ms=$(( (end - start) / 1000000 ))
        if [ -z "$best_ms" ] || [ "$ms" -lt "$best_ms" ]; then best_ms=$ms; fi
    done
    echo "$best_ms"
}
copy() { cp "$work"/pictures/*.jpg "$1"/; }
album() { "$cli" --catalog "$work/catalog.hbi" album-html 1 --folder "$1"; }

cp_ms=$(best copy)
album_ms=$(best album)
echo "pictures:                 1000 ($(( bytes / 1048576 )) MB)"
echo "cp into a folder:         $cp_ms ms"
echo "album-html (pages+copies): $album_ms ms   = $(awk "BEGIN {printf \"%.2f\", $album_ms / ($cp_ms > 0 ? $cp_ms : 1)}")x cp   (target 1.3x)"
