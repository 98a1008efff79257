#!/usr/bin/env bash
# Fails when a source of a subsystem includes a subsystem that its target does not link.
#
# Each tovrin/<subsystem>/CMakeLists.txt declares its target with
#   tovrin_add_subsystem(<subsystem> DEPS <subsystem>...)
# and every file under tovrin/<subsystem>/ (sources, headers, tests) may include headers of its
# own subsystem and of those DEPS only. A subsystem whose CMakeLists.txt links the whole library
# instead (the widgets) may include any subsystem. The tests (*_test.cpp and the *_test_*.h,
# *_testing.h support beside them) link the shared test support as well, tovrin/testing.
set -euo pipefail
cd "$(dirname "$0")/.."

status=0
declare -A allowed
for cmake in tovrin/*/CMakeLists.txt; do
  sub=$(basename "$(dirname "$cmake")")
  decl=$(tr '\n' ' ' <"$cmake" | grep -o "tovrin_add_subsystem([^)]*)" || true)
  if [[ -n $decl ]]; then
    name=$(sed -E 's/tovrin_add_subsystem\(\s*([A-Za-z_]+).*/\1/' <<<"$decl")
    if [[ $name != "$sub" ]]; then
      echo "$cmake: declares subsystem '$name' in folder '$sub'"
      status=1
    fi
    deps=$(sed -E 's/.*DEPS([^)]*)\)/\1/; t; s/.*//' <<<"$decl")
    allowed[$sub]=" $sub $deps "
  elif grep -Eq "target_link_libraries\([^)]*\btovrin\b" "$cmake"; then
    allowed[$sub]="*"
  else
    echo "$cmake: no tovrin_add_subsystem(...) and no link to the whole library"
    status=1
  fi
done

for sub in "${!allowed[@]}"; do
  while IFS=: read -r file line text; do
    target=$(sed -E 's@.*#include [<"]tovrin/([A-Za-z_]+)/.*@\1@' <<<"$text")
    if [[ $target == testing && $(basename "$file") =~ _test|_testing ]]; then
      continue
    fi
    if [[ ${allowed[$sub]} == "*" ]]; then
      [[ -n ${allowed[$target]:-} ]] && continue
    elif [[ ${allowed[$sub]} == *" $target "* ]]; then
      continue
    fi
    echo "$file:$line: subsystem '$sub' includes '$target', which its target does not link"
    status=1
  done < <(grep -rnE '#include [<"]tovrin/[A-Za-z_]+/' "tovrin/$sub" || true)
  # The umbrella header belongs to users of the whole library.
  if [[ ${allowed[$sub]} != "*" ]]; then
    if grep -rnE '#include [<"]tovrin/tovrin\.h[">]' "tovrin/$sub"; then
      echo "subsystem '$sub' includes the whole library (tovrin/tovrin.h)"
      status=1
    fi
  fi
done

if [[ $status -eq 0 ]]; then
  echo "layers: every subsystem includes only what its target links"
fi
exit $status
