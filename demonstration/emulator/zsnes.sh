#!/bin/bash
# Plays the emulator in the demonstration: Wine starts it with the Windows path of a game, and it starts Mednafen with
# that game and with the save directory that the configuration file beside this script names.
set -euo pipefail
shopt -s inherit_errexit

here=$(cd "$(dirname "${BASH_SOURCE[0]}")" && pwd)
prefix=${WINEPREFIX:-$HOME/.wine}

# The file of a directory whose name is the given one in any letter case: find_name DIRECTORY NAME
find_name() {
  local file name
  for file in "$1"/*; do
    name=${file##*/}
    if [[ ${name,,} == "${2,,}" ]]; then
      printf '%s' "$file"
      return
    fi
  done
  echo "zsnes.sh: no $2 in $1" >&2
  return 1
}

# The Linux path of a Windows path that begins with a drive: linux_path PATH
linux_path() {
  local drive=${1:0:1} rest=${1:2} path name
  local -a names
  path=$prefix/dosdevices/${drive,,}:
  IFS=/ read -r -a names <<<"${rest//\\//}"
  for name in "${names[@]}"; do
    if [[ -n $name ]]; then path=$(find_name "$path" "$name"); fi
  done
  printf '%s' "$path"
}

# The value of an entry of the configuration file, "Key = value": configured KEY
configured() {
  tr -d '\r' <"$here/zsnesw.cfg" | sed -n "s/^$1 = //Ip" | tail -n 1
}

if [[ $# != 1 ]]; then
  echo "usage: zsnes.sh GAME" >&2
  exit 2
fi

game=$(linux_path "$1")
saves=$(linux_path "$(configured SaveDirectory)")

# What Mednafen keeps of its own stays in the installation; a save is named as the game, with ".srm" behind it.
export MEDNAFEN_HOME=$here/mednafen
mkdir -p "$MEDNAFEN_HOME"
PATH=$PATH:/usr/games
# Whoever wants to end the game finds its process here.
echo $$ >"$here/mednafen.pid"
exec mednafen -video.driver softfb -sound 0 -video.fs 0 -snes.xscale 2 -snes.yscale 2 \
  -filesys.path_sav "$saves" -filesys.fname_sav '%F.%x' "$game" >"$here/mednafen.log" 2>&1
