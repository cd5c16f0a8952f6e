# shellcheck shell=bash
# Sourced by the scripts at the root: builds quietly.

# Runs a command and shows what it wrote only when it fails.
quietly() {
  local log status=0
  log=$(mktemp)
  "$@" >"$log" 2>&1 || status=$?
  ((status == 0)) || cat "$log" >&2
  rm -f "$log"
  return "$status"
}

# build_preset NAME: configures and builds a preset. On a terminal ninja's line tells how far it is.
build_preset() {
  echo "Building ($1)" >&2
  quietly cmake --preset "$1"
  if [[ -t 2 ]]; then
    cmake --build --preset "$1" >&2
  else
    quietly cmake --build --preset "$1"
  fi
}
