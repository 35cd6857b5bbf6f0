# shellcheck shell=bash
# Building with CMake's presets, for the project's scripts. Sourced, never run.

# Configures a preset. A build directory that was made elsewhere, in a tree that has been moved or copied since, starts
# anew: configure_preset PRESET
configure_preset() {
  local cache=build/$1/CMakeCache.txt
  local -a how=()
  if [[ -e $cache ]] && ! grep -qxF "CMAKE_HOME_DIRECTORY:INTERNAL=$(pwd -P)" "$cache"; then how=(--fresh); fi
  cmake --preset "$1" "${how[@]}"
}

# Configures a preset and builds it, or some of its targets: build_preset PRESET [TARGET...]
build_preset() {
  local preset=$1
  shift
  configure_preset "$preset" && cmake --build --preset "$preset" ${1:+--target "$@"}
}
