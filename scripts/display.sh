# shellcheck shell=bash
# A virtual display and what is seen on it. Sourced, never run; needs processes.sh and, of packages.sh,
# "${display_packages[@]}".

# Starts Xvfb on a free display number and exports DISPLAY; it ends with the script: start_display [WIDTHxHEIGHT]
start_display() {
  local number
  number=$(mktemp)
  Xvfb -displayfd 3 -screen 0 "${1:-1280x1024}x24" -nolisten tcp 3>"$number" >/dev/null 2>&1 &
  on_exit stop_process $!
  on_exit rm -f "$number"
  # Xvfb writes the number and a line feed once it takes clients.
  wait_until 20 display_number_written "$number" || fail "Xvfb did not start"
  DISPLAY=:$(<"$number")
  export DISPLAY
}

display_number_written() {
  [[ $(wc -l <"$1") -ge 1 ]]
}

# The ids of the visible windows that have exactly this title, one a line: windows_titled TITLE
windows_titled() {
  local pattern
  # shellcheck disable=SC2001  # a back reference
  pattern=$(sed 's/[][\\.*^$+?(){}|]/\\&/g' <<<"$1")
  xdotool search --onlyvisible --name "^${pattern}\$" 2>/dev/null
}

# Waits for a visible window with exactly this title and prints its id: wait_window SECONDS TITLE
wait_window() {
  wait_until "$1" window_stands "$2" || return 1
  windows_titled "$2" | head -n 1
}

window_stands() {
  [[ -n $(windows_titled "$1") ]]
}

# Saves a picture of the whole display, or of one window: screenshot FILE [WINDOW]
screenshot() {
  import -silent -window "${2:-root}" "$1"
}

# How many different colours a picture has: colours FILE
colours() {
  identify -format '%k' "$1" 2>/dev/null || echo 0
}
