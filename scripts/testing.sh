# What the tests of the Windows build run on, and how results are added up. Sourced, never run; needs processes.sh,
# building.sh, display.sh and wine.sh, and the project's root as the current directory.

declare -i passed=0 failed=0 skipped=0
declare checked= check_log= checking= # the check that start_check has started

# A display and a Wine prefix of the tests' own, which all programs under scripts/wine-run then use; another name is
# another prefix, for what may run at the same time: prepare_test_machine [NAME]
prepare_test_machine() {
  start_display
  prepare_prefix "${TOLVARIS_PREFIXES:-build/prefixes}/${1:-tests}"
  mount_floppy "$WINEPREFIX/drive_c/Disquete1440" || say "No floppy-sized disk can be mounted here"
  # A disk is in drive A: while a test has made this directory.
  set_drive a "$WINEPREFIX/drive_c/Disquete1440/Disco"
  hold_wine
  export TOLVARIS_WINE_READY=1
}

# Keeps Wine's own processes running between the programs. The first program would otherwise start them with its
# output, and whoever reads that output would wait for their end.
hold_wine() {
  local input
  input=$(mktemp -u)
  mkfifo "$input"
  "$wine" cmd.exe <>"$input" >/dev/null 2>&1 &
  on_exit stop_process $!
  rm "$input"
  # Whoever asks for the desktop first starts the program that keeps it.
  run_wine rundll32.exe user32.dll,GetDesktopWindow </dev/null >/dev/null 2>&1
}

# Adds one result to the count: count_result NAME STATUS
count_result() {
  if (($2 == 0)); then
    passed+=1
    say "passed: $1"
  else
    failed+=1
    say "FAILED: $1"
  fi
}

# Runs a check that is one result, showing its output only when it fails: run_check NAME COMMAND...
run_check() {
  local name=$1 log status=0
  shift
  log=$(mktemp)
  "$@" >"$log" 2>&1 || status=$?
  ((status == 0)) || cat "$log" >&2
  rm -f "$log"
  count_result "$name" "$status"
}

# The same of a check that takes minutes: it runs while others do, until finish_check waits for it; one at a time.
start_check() {
  checked=$1
  check_log=$(mktemp)
  shift
  "$@" >"$check_log" 2>&1 &
  checking=$!
  on_exit stop_process "$checking"
}

finish_check() {
  local status=0
  [[ -n $checking ]] || return 0
  wait "$checking" || status=$?
  checking=
  ((status == 0)) || cat "$check_log" >&2
  rm -f "$check_log"
  count_result "$checked" "$status"
}

# Configures a preset, which is all that clang-tidy needs; a failure is a failed result: configure PRESET
configure() {
  local log=build/$1.log
  mkdir -p build
  if ! configure_preset "$1" >"$log" 2>&1; then
    cat "$log" >&2
    count_result "configuration of $1" 1
    return 1
  fi
}

# Builds a preset; a build that fails is a failed result: build PRESET
build() {
  local log=build/$1.log
  say "Building $1"
  mkdir -p build
  if ! build_preset "$1" >"$log" 2>&1; then
    grep -E -A 12 'error|Error|FAILED' "$log" | head -n 60 >&2 || cat "$log" >&2
    count_result "build of $1" 1
    return 1
  fi
}

# Runs the tests of a preset that match the pattern and adds them up; no test at all is a failure:
# run_tests PRESET PATTERN [CTEST-OPTION...]
run_tests() {
  local preset=$1 pattern=$2 report status=0
  local -i tests failures unwanted
  shift 2
  report=$PWD/build/$preset.xml
  rm -f "$report"
  say "Testing $preset${pattern:+ ($pattern)}"
  ctest --preset "$preset" --no-tests=error --output-junit "$report" ${pattern:+-R "$pattern"} "$@" >&2 ||
    status=$?
  tests=$(junit_count "$report" tests)
  failures=$(junit_count "$report" failures)
  # A test may say that this machine cannot run it; any other that was to run but did not has not passed.
  unwanted=$(grep -c '<skipped message="SKIP_REGULAR_EXPRESSION_MATCHED"' "$report" 2>/dev/null || true)
  failures+=$(($(junit_count "$report" skipped) + $(junit_count "$report" disabled) - unwanted))
  if ((tests == 0 || (status != 0 && failures == 0))); then
    say "the tests of $preset could not be run"
    tests+=1
    failures+=1
  fi
  passed+=$((tests - failures - unwanted))
  failed+=failures
  skipped+=unwanted
}

# A number of the report's first line that has it: junit_count FILE ATTRIBUTE
junit_count() {
  local number=
  if [[ -e $1 ]]; then number=$(sed -n "s/.*[[:space:]]$2=\"\([0-9]*\)\".*/\1/p" "$1" | head -n 1); fi
  echo "${number:-0}"
}
