#!/usr/bin/env bash
# Configures and builds into build/ (two parallel jobs). Extra arguments are build targets.
set -euo pipefail
cd "$(dirname "$0")/.."
generator=()
if command -v ninja >/dev/null; then generator=(-G Ninja); fi
if [ ! -f build/CMakeCache.txt ]; then
    cmake -S . -B build "${generator[@]}" -DCMAKE_BUILD_TYPE=RelWithDebInfo
fi
if [ $# -gt 0 ]; then
    for target in "$@"; do cmake --build build --target "$target" -j2; done
else
    cmake --build build -j2
fi
