#!/usr/bin/env bash
# Draws the details panel's switch, rating and play pictures (ImageMagick) into
# src/resources/icons/. Each switch has an off picture (…N) and an on picture (…Y): the same
# symbol on a dim tile, or bright on a green-rimmed tile. The PNGs are committed; run this again
# only when a picture changes.
set -euo pipefail
out="$(cd "$(dirname "$0")/.." && pwd)/src/resources/icons"
mkdir -p "$out"

tile() {  # tile FILE ON SYMBOL-DRAW-ARGS... (the symbol is drawn with colour $ink)
    local file=$1 on=$2; shift 2
    local bg=#2a2e4a rim=#5a5f80
    if [ "$on" = 1 ]; then bg=#16402a; rim=#00ff00; fi
    convert -size 32x32 xc:none \
        -fill "$bg" -stroke "$rim" -strokewidth 2 -draw 'roundrectangle 1,1 30,30 6,6' \
        "$@" -strip "PNG32:$out/$file"
}

for on in 0 1; do
    if [ "$on" = 1 ]; then ink=#ffffff; s=Y; else ink=#8a8fa8; s=N; fi
    # working: a tick when on, a cross when off
    if [ "$on" = 1 ]; then
        tile IWorking$s.png 1 -fill none -stroke "$ink" -strokewidth 3 -draw 'polyline 8,16 14,22 24,10'
    else
        tile IWorking$s.png 0 -fill none -stroke '#d04040' -strokewidth 3 \
            -draw 'line 10,10 22,22' -draw 'line 22,10 10,22'
    fi
    # mouse: a rounded body with a cable
    tile IMouse$s.png $on -fill none -stroke "$ink" -strokewidth 2 \
        -draw 'roundrectangle 10,10 22,26 6,6' -draw 'line 16,10 16,16' -draw 'line 16,10 16,5'
    # hidden: an eye, struck through when the game is hidden
    tile IHidden$s.png $on -fill none -stroke "$ink" -strokewidth 2 \
        -draw 'ellipse 16,16 10,6 0,360' -fill "$ink" -draw 'circle 16,16 16,19'
    if [ "$on" = 1 ]; then
        convert "$out/IHidden$s.png" -stroke '#ff5050' -strokewidth 3 -draw 'line 7,25 25,7' \
            -strip "PNG32:$out/IHidden$s.png"
    fi
    # cheats: a key
    tile ICheat$s.png $on -fill none -stroke "$ink" -strokewidth 2 \
        -draw 'circle 11,16 11,11' -draw 'line 16,16 26,16' -draw 'line 22,16 22,20' -draw 'line 25,16 25,20'
    # joystick: a stick with a ball on a base
    tile IJoy$s.png $on -fill "$ink" -stroke "$ink" -strokewidth 1 \
        -draw 'roundrectangle 7,22 25,26 2,2' -strokewidth 3 -draw 'line 16,22 16,12' \
        -strokewidth 1 -fill '#e8242b' -draw 'circle 16,10 16,6'
    # sound: a speaker with waves when on, a cross when off
    if [ "$on" = 1 ]; then
        tile IUSound$s.png 1 -fill "$ink" -stroke "$ink" -draw 'polygon 6,13 10,13 16,8 16,24 10,19 6,19' \
            -fill none -strokewidth 2 -draw 'arc 14,10 22,22 -60,60' -draw 'arc 14,6 28,26 -60,60'
    else
        tile IUSound$s.png 0 -fill "$ink" -stroke "$ink" -draw 'polygon 6,13 10,13 16,8 16,24 10,19 6,19' \
            -stroke '#d04040' -strokewidth 2 -draw 'line 19,12 26,20' -draw 'line 26,12 19,20'
    fi
    # artwork: a framed picture with a mountain
    tile IArt$s.png $on -fill none -stroke "$ink" -strokewidth 2 -draw 'rectangle 7,8 25,24' \
        -fill "$ink" -strokewidth 1 -draw 'polygon 8,23 14,14 18,19 21,16 24,23'
    # high priority: an upward arrow
    tile IPriority$s.png $on -fill "$ink" -stroke "$ink" \
        -draw 'polygon 16,6 25,16 19,16 19,26 13,26 13,16 7,16'
    # windowed: a small window with its title bar
    tile IWin$s.png $on -fill none -stroke "$ink" -strokewidth 2 -draw 'rectangle 7,9 25,24' \
        -fill "$ink" -draw 'rectangle 7,9 25,12'
done

# Ratings: IR0 .. IR5, that many of five stars filled.
star='0.0,-8.5 2.1,-2.9 8.1,-2.6 3.4,1.1 5.0,6.9 0.0,3.6 -5.0,6.9 -3.4,1.1 -8.1,-2.6 -2.1,-2.9'
for n in 0 1 2 3 4 5; do
    args=()
    for i in 0 1 2 3 4; do
        x=$((10 + i * 20))
        if [ $i -lt $n ]; then fill=#f5c400; stroke=#a07d00; else fill=none; stroke=#8a8fa8; fi
        args+=(-fill "$fill" -stroke "$stroke" -strokewidth 1.5 -draw "translate $x,11 polygon $star")
    done
    convert -size 100x22 xc:none "${args[@]}" -strip "PNG32:$out/IR$n.png"
done

# Play button: ready (IPlayN), active under the mouse (IPlayY), disabled (IPlayX).
play() {  # play FILE FILL RIM TRIANGLE [extra draw args]
    local file=$1 fill=$2 rim=$3 tri=$4; shift 4
    convert -size 56x56 xc:none -fill "$fill" -stroke "$rim" -strokewidth 3 -draw 'circle 28,28 28,3' \
        -fill "$tri" -stroke none -draw 'polygon 21,15 43,28 21,41' "$@" -strip "PNG32:$out/$file"
}
play IPlayN.png '#2b5fb8' '#9ab8ff' '#ffffff'
play IPlayY.png '#12a83a' '#00ff00' '#ffffff'
play IPlayX.png '#3a3d52' '#5a5f80' '#6b6e80' -stroke '#d04040' -strokewidth 4 -draw 'line 12,44 44,12'

# Executable (Image5): a chip; resolution (Image9): a monitor.
convert -size 24x24 xc:none -fill '#3a3f66' -stroke '#cfd3f0' -strokewidth 1.5 \
    -draw 'rectangle 6,6 18,18' -draw 'line 9,2 9,6' -draw 'line 15,2 15,6' \
    -draw 'line 9,18 9,22' -draw 'line 15,18 15,22' -draw 'line 2,9 6,9' -draw 'line 2,15 6,15' \
    -draw 'line 18,9 22,9' -draw 'line 18,15 22,15' -strip "PNG32:$out/Image5.png"
convert -size 24x24 xc:none -fill '#2b5fb8' -stroke '#cfd3f0' -strokewidth 1.5 \
    -draw 'roundrectangle 2,3 22,17 2,2' -draw 'line 12,17 12,20' -draw 'line 7,21 17,21' \
    -strip "PNG32:$out/Image9.png"
ls "$out"
