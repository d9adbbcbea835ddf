#!/usr/bin/env bash
# Creates a Quorvane home folder for trying the program: settings for this host, a small ROM
# library, game records that show every colour and icon of the tree, a ROM folder with
# archives (pong.zip runs in the installed emulator without any ROM file), screenshots and
# sample history and information files.
#   usage: scripts/make-demo-home.sh DIR
set -euo pipefail
if [ $# -ne 1 ]; then
    echo "usage: $0 DIR" >&2
    exit 2
fi
src="$(cd "$(dirname "$0")/.." && pwd)/demo"
mkdir -p "$1"
home="$(cd "$1" && pwd)"

mkdir -p "$home/roms" "$home/snap" "$home/logs" "$home/hi" "$home/artwork" "$home/sta" \
         "$home/marquee" "$home/samples" "$home/ctrlr"
cp "$src/mame_rom_lib.inc" "$src/games.inc" "$src/history.dat" "$src/mameinfo.dat" "$home/"
cp "$src"/snap/*.png "$home/snap/"

# The ROM folder. These are stand-in archives (a text file inside), except pong.zip: Pong is
# emulated from its logic circuits and needs no ROM file, so an empty archive is enough.
python3 - "$home/roms" <<'PY'
import os, sys, zipfile
folder = sys.argv[1]
games = {
    "pacman": 3, "galaga": 5, "frogger": 2, "dkong": 4, "joust": 3, "mystery": 1,
    "qbert": 2, "centiped": 3, "digdug": 4, "1942": 6,
}
for name, kilobytes in games.items():
    with zipfile.ZipFile(os.path.join(folder, name + ".zip"), "w", zipfile.ZIP_STORED) as z:
        z.writestr("readme.txt", ("Stand-in archive for %s. " % name).ljust(kilobytes * 1024, "."))
with zipfile.ZipFile(os.path.join(folder, "pong.zip"), "w") as z:
    pass
with open(os.path.join(folder, "readme.txt"), "w") as f:
    f.write("Quorvane demo ROM folder. Its size counts in the total; it is not a game.\n")
PY

# Settings for this host: the emulator Debian installs, every folder inside the home.
{
    printf '# Quorvane Configuration File\r\n'
    printf '# Updated: demo home made by make-demo-home.sh\r\n'
    printf '\r\n'
    printf ' ### MAME Path, Files information\r\n'
    printf '    MamePath = /usr/games/\r\n'
    printf '    MameExec = mame\r\n'
    printf '    DefaultROMdir = %s\r\n' "$home/roms"
    printf '    CheatsFile = %s\r\n' "$home/cheat.dat"
    printf '    CtrlrFile = default.zip\r\n'
    printf '    CtrlrDir = %s\r\n' "$home/ctrlr"
    printf '    SnapDir = %s\r\n' "$home/snap"
    printf '    HighDir = %s\r\n' "$home/hi"
    printf '    ArtworkDir = %s\r\n' "$home/artwork"
    printf '    MameInfoFile = %s\r\n' "$home/mameinfo.dat"
    printf '    HistoryFile = %s\r\n' "$home/history.dat"
    printf '    StateDir = %s\r\n' "$home/sta"
    printf '\r\n### Miscellaneous MAME Options\r\n\r\n'
    printf '# Volume = -32 to 0\r\n    Volume = -8\r\n\r\n'
    printf '# Joystick enabled?\r\n    Joystick = No\r\n\r\n'
    printf '# Enable sound by default?\r\n    Sound = Yes\r\n\r\n'
    printf '### Interface Options\r\n\r\n'
    printf '# Allow editing (delete, rating, categories, working, mouse, notes, etc.)\r\n    Edit = Yes\r\n\r\n'
    printf '# Show hidden files on game tree\r\n    ShowHidden = No\r\n\r\n'
    printf '# Show working ROMs only on game tree\r\n    ShowWorking = No\r\n\r\n'
    printf '# Save ROM information on Exit?\r\n    SaveOnExit = Yes\r\n\r\n'
    printf '# Game categories, separate with comma\r\n    GameType = Favourites,Classics\r\n\r\n'
    printf '# Windows 2000 or XP?\r\n    Windows2000XP = Yes\r\n\r\n'
    printf '### Voice synthesizer options\r\n\r\n'
    printf '# Use the voice synthesizer (MS Direct Speech)\r\n    Speak = Yes\r\n\r\n'
    printf '# Voice id, depends on voice engine installed\r\n    Voice = 1\r\n\r\n'
    printf '# Spoken when program starts\r\n    Intro = Hey you!  Would you like to play a game?\r\n\r\n'
    printf '# Ratings\r\n'
    printf '    Rate0 = No opinion\r\n    Rate1 = It sucks!\r\n    Rate2 = Lame!\r\n'
    printf "    Rate3 = It's fun.\r\n    Rate4 = It's Cool!\r\n    Rate5 = This game rocks!\r\n"
} > "$home/config.inc"

cat > "$home/readme.txt" <<TXT
Quorvane demo home
==================

Start Quorvane on this folder with:

    QUORVANE_HOME="$home" quorvane

config.inc         settings for this host (emulator /usr/games/mame, folders below)
mame_rom_lib.inc   the ROM library: $(grep -vc '^#' "$src/mame_rom_lib.inc") lines of arcade games in several categories
games.inc          your game records; they show every colour and icon of the tree:
                     pacman, pong, centiped, digdug  working, archive present, screenshot  (black)
                     galaga, frogger                 working, present, no screenshot       (light blue)
                     dkong                           not marked working                    (red)
                     joust                           hidden (View > View My Hidden ROMs)
                     missile                         archive missing                       (grey)
                     mystery.zip                     unidentified archive, title = file name
                     ^qbert.zip                      removed by the user, archive still on disk
                     1942.zip                        new archive found by the folder scan
roms/              the ROM folder; pong.zip plays in the installed emulator without ROM files
snap/              screenshots
history.dat, mameinfo.dat   sample reference texts
quorvane.log       the activity log, written by the program
TXT
echo "Demo home ready: $home"
