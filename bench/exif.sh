#!/usr/bin/env bash
# EXIF reading over the camera samples: `hearthbook-cli exif` beside
# `exiv2 -pa`, one process per file, then one process for all files, then
# Hearthbook's reader alone (no process start-up).
# Usage: bench/exif.sh BUILD_DIR
set -euo pipefail
build=${1:-build}
rounds=${HB_BENCH_ROUNDS:-5}
samples=${HB_EXIF_SAMPLES:-$(cd "$(dirname "$0")/.." && pwd)/../shared/testdata/exif-samples/jpg}
command -v exiv2 >/dev/null || { echo "exiv2 missing"; exit 1; }
mapfile -t files < <(find "$samples" -name '*.jp*g' | sort)
[ ${#files[@]} -gt 0 ] || { echo "no samples in $samples"; exit 1; }

per_file() { # per_file COMMAND...: mean wall milliseconds of COMMAND FILE over all files
    local start end
    start=$(date +%s.%N)
    for ((r = 0; r < rounds; r++)); do
        for f in "${files[@]}"; do
            "$@" "$f" >/dev/null 2>&1 || true
        done
    done
    end=$(date +%s.%N)
    awk -v a="$start" -v b="$end" -v n="$((rounds * ${#files[@]}))" \
        'BEGIN { printf "%.3f", (b - a) * 1000 / n }'
}

batch() { # batch COMMAND...: mean wall milliseconds of COMMAND FILE... (all files)
    local start end
    start=$(date +%s.%N)
    for ((r = 0; r < rounds; r++)); do
        "$@" "${files[@]}" >/dev/null 2>&1 || true
    done
    end=$(date +%s.%N)
    awk -v a="$start" -v b="$end" -v n="$rounds" 'BEGIN { printf "%.3f", (b - a) * 1000 / n }'
}

cat "${files[@]}" >/dev/null
ours=$(per_file "$build/bin/hearthbook-cli" exif)
theirs=$(per_file exiv2 -pa)
oursBatch=$(batch "$build/bin/hearthbook-cli" exif)
theirsBatch=$(batch exiv2 -pa)
inside=$("$build/bin/exif_bench" 200 "${files[@]}" | awk '/^microseconds_per_file/ {print $2}')
printf 'EXIF of %d camera JPEGs, %d rounds, one process per file\n' "${#files[@]}" "$rounds"
printf '  hearthbook-cli exif: %7.3f ms per file\n' "$ours"
printf '  exiv2 -pa:           %7.3f ms per file\n' "$theirs"
printf '  exiv2 time / hearthbook time: %s (above 1: hearthbook is faster)\n' \
    "$(awk -v a="$theirs" -v b="$ours" 'BEGIN { printf "%.2f", a / b }')"
printf 'The same files in one process each\n'
printf '  hearthbook-cli exif FILE...: %7.3f ms\n' "$oursBatch"
printf '  exiv2 -pa FILE...:           %7.3f ms\n' "$theirsBatch"
printf '  exiv2 time / hearthbook time: %s\n' \
    "$(awk -v a="$theirsBatch" -v b="$oursBatch" 'BEGIN { printf "%.2f", a / b }')"
printf '  reader alone, in one process: %s us per file\n' "$inside"
