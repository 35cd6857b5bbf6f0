# shellcheck shell=bash
# Wine as this project uses it. Sourced, never run; needs processes.sh and, of packages.sh, "${wine_packages[@]}".

# The 64-bit loader itself: Debian's wrapper "wine" asks for the 32-bit one. scripts/other-wine sets another Wine.
wine=${TOLVARIS_WINE:-/usr/lib/wine}/wine64
wineserver=${TOLVARIS_WINE:-/usr/lib/wine}/wineserver64

# Makes the directory the Wine prefix that everything after uses (exports WINEPREFIX), and makes it first if it is not
# there yet, which takes about 15 s. Wine's processes there end with the script: prepare_prefix DIRECTORY
prepare_prefix() {
  mkdir -p "$1"
  WINEPREFIX=$(realpath "$1")
  # Code page 1252 and file names in UTF-8: Wine takes the first from the locale's language, the second from its set.
  export WINEPREFIX WINEARCH=win64 WINEDEBUG=${WINEDEBUG:--all} LANG=C.UTF-8 LC_ALL=C.UTF-8 LANGUAGE=
  # No offer to download .NET or a browser, no menu entries in the desktop of who runs this.
  export WINEDLLOVERRIDES='mscoree,mshtml=;winemenubuilder.exe=d'
  on_exit end_wine
  if [[ ! -e $WINEPREFIX/prepared ]]; then
    say "Preparing Wine in ${WINEPREFIX##*/}"
    make_prefix
    touch "$WINEPREFIX/prepared"
  fi
}

make_prefix() {
  # Another Wine than the installed one finds the libraries that it needs beside its own only here.
  if [[ -n ${TOLVARIS_WINE:-} ]]; then
    install -D -t "$WINEPREFIX/drive_c/windows/system32" "$TOLVARIS_WINE"/../../x86_64-w64-mingw32/lib/*.dll
  fi
  # Without a display, Wine prepares just as well.
  run_wine wineboot.exe --init >/dev/null 2>&1 || fail "Wine could not prepare $WINEPREFIX"
  # Without a window manager a managed window takes 2 s to close; a crash would wait for a debugger.
  set_registry 'HKCU\Software\Wine\X11 Driver' Managed N
  set_registry 'HKCU\Software\Wine\WineDbg' ShowCrashDialog 0 REG_DWORD
  set_registry 'HKLM\Software\Microsoft\Windows NT\CurrentVersion\AeDebug' Debugger ''
  set_registry 'HKLM\Software\Microsoft\Windows NT\CurrentVersion\AeDebug' Auto 0
  make_user_directories
  wait_wine
}

# File dialogs fail where a user's directory is a link to one that does not exist.
make_user_directories() {
  local directory
  find "$WINEPREFIX/drive_c/users" -type l -print0 | while IFS= read -r -d '' directory; do
    rm "$directory"
    mkdir "$directory"
  done
}

# Runs a Windows program in the prefix: run_wine PROGRAM ARGUMENTS...
run_wine() {
  "$wine" "$@"
}

# Sets a registry value: set_registry KEY NAME TEXT [TYPE]
set_registry() {
  run_wine reg.exe add "$1" /v "$2" /t "${4:-REG_SZ}" /d "$3" /f >/dev/null 2>&1 || fail "could not set $1\\$2"
}

# Removes a registry key and all below it; none is fine: remove_registry KEY
remove_registry() {
  run_wine reg.exe delete "$1" /f >/dev/null 2>&1 || true
}

# Lets a drive of the prefix stand for a directory: set_drive LETTER DIRECTORY
set_drive() {
  ln -sfn "$(realpath "$2")" "$WINEPREFIX/dosdevices/${1,,}:"
}

# Leaves the prefix without that drive: remove_drive LETTER
remove_drive() {
  rm -f "$WINEPREFIX/dosdevices/${1,,}:"
}

# Makes the directory a file system as small as a floppy disk until the script ends. It fails where this machine does
# not let us mount one: mount_floppy DIRECTORY
mount_floppy() {
  local -a administrator=()
  if [[ $(id -u) != 0 ]]; then administrator=(sudo -n); fi
  mkdir -p "$1"
  # What a run left that was killed; one that somebody still looks into goes when he is done.
  "${administrator[@]}" umount -l "$1" 2>/dev/null || true
  "${administrator[@]}" mount -t tmpfs -o "size=1440k,uid=$(id -u),mode=755" tolvaris-floppy "$1" 2>/dev/null || return 1
  on_exit "${administrator[@]}" umount -l "$1"
}

# Waits until all of the prefix's programs have ended.
wait_wine() {
  "$wineserver" -w
}

# Ends all of the prefix's programs.
end_wine() {
  "$wineserver" -k 2>/dev/null || true
  "$wineserver" -w 2>/dev/null || true
}
