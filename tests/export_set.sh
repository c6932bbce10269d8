#!/usr/bin/env bash
# export_set.sh LIBPVXI.so PVXI_H: the dynamic symbols that the library
# defines and the functions that the header declares must be the same set.
set -euo pipefail
lib=$1 header=$2
tmp=$(mktemp -d)
trap 'rm -rf "$tmp"' EXIT
nm -D --defined-only "$lib" | awk 'NF >= 3 && ($2 == "T" || $2 == "W" || $2 == "i") { s = $3; sub(/@.*/, "", s); print s }' \
  | sort -u > "$tmp/exported"
grep -E '^PVX_API ' "$header" | sed -E 's/\(.*//; s/.*[ *]//' | sort -u > "$tmp/declared"
n=$(wc -l < "$tmp/declared")
if ! diff -u "$tmp/declared" "$tmp/exported" > "$tmp/diff"; then
  echo "exported symbols and pvxi.h prototypes differ (- declared only, + exported only):"
  grep -E '^[-+][a-zA-Z_]' "$tmp/diff" | head -n 40
  exit 1
fi
echo "export_set: $n functions, exported and declared alike"
