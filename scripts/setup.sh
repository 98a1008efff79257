#!/usr/bin/env bash
# Installs the build requirements of tovrin with apt-get when they are missing.
set -euo pipefail
missing=()
command -v cmake >/dev/null || missing+=(cmake)
command -v g++ >/dev/null || missing+=(g++)
command -v pkg-config >/dev/null || missing+=(pkg-config)
[ -d /usr/include/gtest ] || missing+=(libgtest-dev libgmock-dev)
[ -d /usr/include/benchmark ] || missing+=(libbenchmark-dev)
python3 -c 'import mpmath' 2>/dev/null || missing+=(python3 python3-mpmath)
# Qt 6 Widgets for tovrin::widgets and tovrin-studio (fonts for their offscreen rendering).
[ -n "$(find /usr/lib -path '*/cmake/Qt6Widgets/Qt6WidgetsConfig.cmake' -print -quit 2>/dev/null)" ] ||
  missing+=(qt6-base-dev)
[ -n "$(find /usr/share/fonts -name '*.ttf' -print -quit 2>/dev/null)" ] || missing+=(fonts-dejavu-core)
if [ ${#missing[@]} -gt 0 ]; then
  echo "installing: ${missing[*]}"
  if [ "$(id -u)" -eq 0 ]; then SUDO=""; else SUDO="sudo"; fi
  $SUDO apt-get update -qq
  DEBIAN_FRONTEND=noninteractive $SUDO apt-get install -y -qq "${missing[@]}"
fi
