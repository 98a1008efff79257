#!/usr/bin/env bash
# Installs the benchmark-only yardsticks: Debian's Boost.Math headers and GNU datamash. The
# tovrin library itself never depends on either; bench/gammabeta_bench.cpp compares against
# Boost when the headers exist, and bench/describe_bench.sh runs `tovrin describe` beside
# datamash.
set -euo pipefail

if [ -f /usr/include/boost/math/special_functions/gamma.hpp ] && command -v datamash >/dev/null; then
  echo "Boost.Math headers and datamash already present"
  exit 0
fi

SUDO=""
if [ "$(id -u)" -ne 0 ]; then
  SUDO="sudo"
fi
export DEBIAN_FRONTEND=noninteractive
$SUDO apt-get update
$SUDO apt-get install -y --no-install-recommends libboost-math-dev libboost-dev datamash
