#!/usr/bin/env bash
# Installs the Debian packages Quorvane needs, but only when one of them is missing.
set -euo pipefail
packages=(qt6-base-dev qt6-speech-dev qt6-declarative-dev qt6-speech-flite-plugin
          qt6-speech-speechd-plugin libgtest-dev libgmock-dev libbenchmark-dev cmake
          ninja-build g++ xvfb imagemagick mame python3)
missing=()
for p in "${packages[@]}"; do
    dpkg-query -W -f='${Status}' "$p" 2>/dev/null | grep -q "install ok installed" || missing+=("$p")
done
if [ ${#missing[@]} -eq 0 ]; then
    exit 0
fi
echo "Installing: ${missing[*]}"
sudo=""
if [ "$(id -u)" -ne 0 ]; then sudo="sudo"; fi
$sudo apt-get update
$sudo env DEBIAN_FRONTEND=noninteractive apt-get install -y --no-install-recommends "${missing[@]}"
