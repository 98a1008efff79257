#!/usr/bin/env bash
# Installs clang, its runtime libraries (the sanitizers and libFuzzer live in
# libclang-rt-<version>-dev) and clang-format: what the Clang build, the ThreadSanitizer tests,
# the fuzzers (fuzz/run.sh) and the format check (scripts/check-format.sh) need.
set -euo pipefail
missing=()
command -v clang++ >/dev/null || missing+=(clang)
command -v clang-format >/dev/null || missing+=(clang-format)
version=$( (clang++ -dumpversion 2>/dev/null || echo 14) | cut -d. -f1)
dpkg -s "libclang-rt-$version-dev" >/dev/null 2>&1 || missing+=("libclang-rt-$version-dev")
if [ ${#missing[@]} -gt 0 ]; then
  echo "installing: ${missing[*]}"
  if [ "$(id -u)" -eq 0 ]; then SUDO=""; else SUDO="sudo"; fi
  $SUDO apt-get update -qq
  DEBIAN_FRONTEND=noninteractive $SUDO apt-get install -y -qq "${missing[@]}"
fi
