#!/usr/bin/env bash
# Loading 10,000 files in 200 folders with the unique check, twice, against the
# time find takes to list the same tree with sizes and times (the scan floor);
# then 100,000 managed pictures listed through the search filter.
# Usage: bench/document_load.sh BUILD_DIR
set -euo pipefail
build=${1:-build}
tree=$(mktemp -d)
trap 'rm -rf "$tree"' EXIT

for d in $(seq 1 200); do
    mkdir -p "$tree/folder$d"
    for f in $(seq 1 50); do
        printf 'file %d %d\n' "$d" "$f" > "$tree/folder$d/doc$f.txt"
    done
done

ms() { # ms COMMAND...: wall time of the command in ms
    local start end
    start=$(date +%s%N)
    "$@" > /dev/null
    end=$(date +%s%N)
    echo $(( (end - start) / 1000000 ))
}

find "$tree" -type f -printf '%s %T@\n' > /dev/null # warm the cache
floor=$(ms find "$tree" -type f -printf '%s %T@\n')
floor=$(( floor > 0 ? floor : 1 ))
result=$("$build/bin/document_load" "$tree")
echo "$result"
pass1=$(echo "$result" | awk '/^pass1_ms/ {print $2}')
pass2=$(echo "$result" | awk '/^pass2_ms/ {print $2}')
echo "find floor: ${floor} ms"
awk -v p1="$pass1" -v p2="$pass2" -v f="$floor" 'BEGIN {
    printf "pass 1: %.1f ms = %.2fx the floor (target 3x)\n", p1, p1 / f
    printf "pass 2: %.1f ms = %.2fx the floor (target 3x)\n", p2, p2 / f
}'
listing=$("$build/bin/managed_list")
list=$(echo "$listing" | awk '{print $2}')
first=$(echo "$listing" | awk '{print $4}')
echo "100,000 managed pictures listed in ${list} ms (target 50 ms); into an empty list ${first} ms"
