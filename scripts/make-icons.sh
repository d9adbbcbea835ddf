#!/usr/bin/env bash
# Draws the program's own icons (ImageMagick) into src/resources/icons/. The PNGs are committed,
# so this only needs to run again when a picture changes.
set -euo pipefail
out="$(cd "$(dirname "$0")/.." && pwd)/src/resources/icons"
mkdir -p "$out"
draw() {  # draw SIZE FILE DRAW-ARGS...
    local size=$1 file=$2; shift 2
    convert -size "$size" xc:none "$@" -strip "PNG32:$out/$file"
}

# Folders: a closed manila folder and an open one.
draw 16x16 fclosed.png \
    -fill '#c89b2c' -stroke '#6b4f12' -strokewidth 1 -draw 'polygon 1,3 6,3 7,5 14,5 14,13 1,13'
draw 16x16 fopen.png \
    -fill '#a97f1f' -stroke '#6b4f12' -strokewidth 1 -draw 'polygon 1,3 6,3 7,5 13,5 13,7 1,13' \
    -fill '#f0c65a' -draw 'polygon 3,7 15,7 13,13 1,13'

# A working game: a green ball with a white tick. A game that does not work: a red ball, white X.
draw 16x16 good.png \
    -fill '#1f9d2e' -stroke '#0b5e16' -draw 'circle 8,8 8,1' \
    -stroke white -strokewidth 2 -fill none -draw 'polyline 4,8 7,11 12,5'
draw 16x16 bad.png \
    -fill '#d22a2a' -stroke '#7a1010' -draw 'circle 8,8 8,1' \
    -stroke white -strokewidth 2 -draw 'line 5,5 11,11' -draw 'line 11,5 5,11'

# The logo: a joystick on an arcade-cabinet badge.
draw 48x48 logo.png \
    -fill '#1b1f3a' -stroke '#f5c400' -strokewidth 2 -draw 'roundrectangle 2,2 45,45 8,8' \
    -fill '#3a3f66' -stroke '#9aa0d0' -strokewidth 1 -draw 'roundrectangle 10,32 37,40 3,3' \
    -stroke '#cccccc' -strokewidth 3 -draw 'line 24,34 24,18' \
    -fill '#e8242b' -stroke '#8a0c10' -strokewidth 1 -draw 'circle 24,14 24,7' \
    -fill '#00c8ff' -stroke none -draw 'circle 34,28 34,25'

# Title-bar buttons.
draw 20x20 minimize.png \
    -fill '#2c3152' -stroke '#9aa0d0' -draw 'roundrectangle 1,1 18,18 3,3' \
    -fill white -stroke none -draw 'rectangle 5,12 14,14'
draw 20x20 exit.png \
    -fill '#8a1c1c' -stroke '#e0a0a0' -draw 'roundrectangle 1,1 18,18 3,3' \
    -stroke white -strokewidth 2 -draw 'line 6,6 13,13' -draw 'line 13,6 6,13'

# Search: a magnifying glass.
draw 20x20 search.png \
    -fill none -stroke '#dddddd' -strokewidth 2 -draw 'circle 8,8 8,3' \
    -strokewidth 3 -draw 'line 12,12 17,17'

ls -l "$out"
