#!/usr/bin/env bash
# Installs what is missing, builds everything (program, tests, benchmarks) and runs the whole
# test suite. The exit code is ctest's.
set -euo pipefail
cd "$(dirname "$0")/.."
scripts/install-deps.sh
scripts/build.sh
export QT_QPA_PLATFORM=offscreen
ctest --test-dir build --output-on-failure --timeout 300 -j2
