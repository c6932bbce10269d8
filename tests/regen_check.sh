#!/usr/bin/env bash
# regen_check.sh PVXGEN SOURCE_ROOT: regenerating from the tables into a
# scratch tree must give the committed files byte for byte.
set -euo pipefail
gen=$1 root=$2
tmp=$(mktemp -d)
trap 'rm -rf "$tmp"' EXIT
"$gen" "$root" "$tmp"
status=0
while IFS= read -r f; do
  rel=${f#"$tmp"/}
  if ! cmp -s "$f" "$root/$rel"; then
    echo "stale generated file: $rel (run: cmake --build BUILD --target regen)"
    status=1
  fi
done < <(find "$tmp" -type f)
# no generated file may be left behind by a removed table
for f in "$root"/*/*.exports.inc; do
  [ -e "$f" ] || continue
  rel=${f#"$root"/}
  [ -e "$tmp/$rel" ] || { echo "orphaned generated file: $rel"; status=1; }
done
[ $status = 0 ] && echo "api_regen_check: generated files are current"
exit $status
