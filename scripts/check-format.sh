#!/usr/bin/env bash
# Checks the tracked C++ sources against .clang-format and lists each file that differs.
#   bash scripts/check-format.sh           every tracked .h and .cpp
#   bash scripts/check-format.sh BASE      only those changed since the commit BASE
#   bash scripts/check-format.sh --fix     reformat them instead (also with BASE)
# Generated reference tables (*.inc) are left as their scripts write them.
set -euo pipefail
cd "$(dirname "$0")/.."
fix=0
if [ "${1:-}" = "--fix" ]; then
  fix=1
  shift
fi
if [ $# -gt 0 ]; then
  mapfile -t files < <(git diff --name-only --diff-filter=d "$1" -- '*.h' '*.cpp')
else
  mapfile -t files < <(git ls-files -- '*.h' '*.cpp')
fi
[ ${#files[@]} -gt 0 ] || exit 0
if [ $fix -eq 1 ]; then
  clang-format -i "${files[@]}"
  exit 0
fi
bad=()
for f in "${files[@]}"; do
  clang-format --dry-run -Werror "$f" >/dev/null 2>&1 || bad+=("$f")
done
if [ ${#bad[@]} -gt 0 ]; then
  printf 'not formatted: %s\n' "${bad[@]}"
  echo "fix with: bash scripts/check-format.sh --fix${1:+ $1}"
  exit 1
fi
echo "format check: ${#files[@]} files follow .clang-format"
