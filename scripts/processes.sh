# shellcheck shell=bash
# Processes and clean-up, for the shell scripts of this folder. Sourced, never run.

# The commands that on_exit remembered, oldest first.
declare -a exit_commands=()

# Ends the script with a message: fail MESSAGE...
fail() {
  printf '%s: %s\n' "${0##*/}" "$*" >&2
  exit 1
}

# Says what the script is doing: say MESSAGE...
say() {
  printf '%s\n' "$*" >&2
}

# Runs the command when the script ends, however it ends; the latest remembered runs first: on_exit COMMAND...
on_exit() {
  local quoted
  printf -v quoted '%q ' "$@"
  exit_commands+=("$quoted")
  trap run_exit_commands EXIT
  trap 'exit 130' INT
  trap 'exit 143' TERM HUP
}

run_exit_commands() {
  local -i i
  set +e
  for ((i = ${#exit_commands[@]} - 1; i >= 0; --i)); do
    eval "${exit_commands[i]}"
  done
  exit_commands=()
}

# Polls until the command succeeds; fails after the given seconds: wait_until SECONDS COMMAND...
wait_until() {
  local -i end=$((SECONDS + $1))
  shift
  until "$@"; do
    ((SECONDS < end)) || return 1
    sleep 0.1
  done
}

# Whether the process is gone, or only waits for its parent to notice.
process_ended() {
  local state
  { state=$(<"/proc/$1/stat"); } 2>/dev/null || return 0
  [[ ${state##*) } == Z* ]]
}

# Ends a process that this script started and waits for its end: stop_process PID
stop_process() {
  process_ended "$1" && return
  kill "$1" 2>/dev/null || true
  wait_until 5 process_ended "$1" || kill -KILL "$1" 2>/dev/null || true
  wait "$1" 2>/dev/null || true
}
