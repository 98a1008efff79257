#!/usr/bin/env bash
# Regenerates every reference table (<unit>_reference.py writes <unit>_reference.inc beside
# itself) in a scratch folder and fails when one differs from the committed .inc. The mpmath
# tables take several minutes each.
set -euo pipefail
cd "$(dirname "$0")/.."
python3 -c 'import mpmath' || { echo "check-references: python3 lacks mpmath (scripts/setup.sh)"; exit 1; }
# The scripts' shared helpers (tovrin/testing/reference_support.py) are found through PYTHONPATH.
support="$PWD/tovrin/testing"
scratch=$(mktemp -d)
trap 'rm -rf "$scratch"' EXIT
status=0
for script in $(find tovrin -name '*_reference.py' | sort); do
  name=$(basename "$script" .py)
  table="$(dirname "$script")/$name.inc"
  mkdir -p "$scratch/$name"
  cp "$script" "$scratch/$name/"
  if ! (cd "$scratch/$name" && PYTHONPATH="$support" python3 "$name.py" >"$scratch/$name/stdout"); then
    echo "FAILED to run $script"; status=1; continue
  fi
  # A script that prints its table instead of writing it beside itself is read from its output.
  [ -f "$scratch/$name/$name.inc" ] || mv "$scratch/$name/stdout" "$scratch/$name/$name.inc"
  if [ ! -f "$table" ]; then
    echo "MISSING $table (written by $script)"; status=1
  elif ! diff -u "$table" "$scratch/$name/$name.inc"; then
    echo "DIFFERS $table from what $script writes"; status=1
  else
    echo "ok $table"
  fi
done
exit $status
