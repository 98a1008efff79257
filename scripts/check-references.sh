#!/usr/bin/env bash
# Regenerates every reference table (<unit>_reference.py writes <unit>_reference.inc beside
# itself) in a scratch folder and fails when one differs from the committed .inc.
set -euo pipefail
cd "$(dirname "$0")/.."
python3 -c 'import mpmath' || { echo "check-references: python3 lacks mpmath (scripts/setup.sh)"; exit 1; }
scratch=$(mktemp -d)
trap 'rm -rf "$scratch"' EXIT
status=0
for script in $(find tovrin -name '*_reference.py' | sort); do
  name=$(basename "$script" .py)
  table="$(dirname "$script")/$name.inc"
  mkdir -p "$scratch/$name"
  cp "$script" "$scratch/$name/"
  if ! (cd "$scratch/$name" && python3 "$name.py" >/dev/null); then
    echo "FAILED to run $script"; status=1; continue
  fi
  if [ ! -f "$table" ]; then
    echo "MISSING $table (written by $script)"; status=1
  elif ! diff -u "$table" "$scratch/$name/$name.inc"; then
    echo "DIFFERS $table from what $script writes"; status=1
  else
    echo "ok $table"
  fi
done
exit $status
