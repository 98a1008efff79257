#!/usr/bin/env bash
# Builds tovrin (Release, with tests, benchmarks and the tovrin program) and runs every test.
# Installs what a fresh machine lacks first.
set -euo pipefail
cd "$(dirname "$0")/.."
bash scripts/setup.sh
cmake --workflow --preset release
