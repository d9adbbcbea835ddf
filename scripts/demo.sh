#!/usr/bin/env bash
# Installs what is missing, builds Quorvane, prepares a demo home in build/demo-home (kept
# between runs, so your changes to it stay) and opens the main window on it.
set -euo pipefail
cd "$(dirname "$0")/.."
scripts/install-deps.sh
scripts/build.sh quorvane
if [ ! -f build/demo-home/config.inc ]; then
    scripts/make-demo-home.sh build/demo-home
fi
QUORVANE_HOME="$(pwd)/build/demo-home" exec build/quorvane
