# shellcheck shell=bash
# Installs what a fresh Debian 12 or Ubuntu machine lacks. Sourced, never run; needs processes.sh.

# What each kind of work needs, as lists for install_packages.
# shellcheck disable=SC2034  # the scripts that source this file use them
native_packages=(g++ cmake ninja-build libgtest-dev zlib1g-dev)
# shellcheck disable=SC2034
sanitize_packages=(clang-14 libclang-rt-14-dev)
# shellcheck disable=SC2034
windows_packages=(g++-mingw-w64-x86-64-posix binutils-mingw-w64-x86-64 cmake ninja-build googletest
  libz-mingw-w64-dev)
# shellcheck disable=SC2034
release_packages=(libc-bin nsis zip)
# shellcheck disable=SC2034
wine_packages=(wine64 fonts-wine fonts-liberation
  libxcomposite1 libxcursor1 libxfixes3 libxi6 libxinerama1 libxrandr2 libxrender1 libxxf86vm1)
# shellcheck disable=SC2034
display_packages=(xvfb xdotool x11-utils imagemagick)
# shellcheck disable=SC2034
demonstration_packages=(cc65 imagemagick librsvg2-bin mednafen python3 zip)

package_missing() {
  [[ $(dpkg-query -W -f '${db:Status-Status}' "$1" 2>/dev/null) != installed ]]
}

# Runs the command as the administrator: as_root COMMAND...
as_root() {
  if [[ $(id -u) == 0 ]]; then
    "$@"
  elif command -v sudo >/dev/null; then
    sudo "$@"
  else
    fail "neither root nor sudo: please run '$*' as root"
  fi
}

# Installs those of the packages that are missing, and says which: install_packages PACKAGE...
install_packages() {
  local package log
  local -a missing=()
  command -v dpkg-query >/dev/null || fail "this machine has no Debian packages; needed are: $*"
  for package in "$@"; do
    if [[ " ${missing[*]} " != *" $package "* ]] && package_missing "$package"; then missing+=("$package"); fi
  done
  ((${#missing[@]})) || return 0
  say "Installing ${missing[*]}"
  log=$(mktemp)
  # Without its lists, apt knows no package; with old ones the installation may still work.
  as_root apt-get -q update >"$log" 2>&1 || true
  if ! as_root env DEBIAN_FRONTEND=noninteractive apt-get -q install -y --no-install-recommends "${missing[@]}" \
      >>"$log" 2>&1; then
    cat "$log" >&2
    fail "could not install ${missing[*]}"
  fi
  rm -f "$log"
}
