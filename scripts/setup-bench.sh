#!/usr/bin/env bash
# Installs the benchmark-only yardstick: Debian's Boost.Math headers. The tovrin library itself
# never depends on Boost; bench/gammabeta_bench.cpp compares against it when the headers exist.
set -euo pipefail

if [ -f /usr/include/boost/math/special_functions/gamma.hpp ]; then
  echo "Boost.Math headers already present"
  exit 0
fi

SUDO=""
if [ "$(id -u)" -ne 0 ]; then
  SUDO="sudo"
fi
export DEBIAN_FRONTEND=noninteractive
$SUDO apt-get update
$SUDO apt-get install -y --no-install-recommends libboost-math-dev libboost-dev
