# Shared by the scripts here; they source it first. Sets `root` and moves nowhere.

root=$(cd "$(dirname "${BASH_SOURCE[0]}")/.." && pwd)

# Prints the comment at the head of the calling script as its help, and ends when it was asked for.
helpIfAsked() {
  case ${1:-} in
    -h | --help) sed -n '2,/^$/s/^# \{0,1\}//p' "$0"; exit 0 ;;
  esac
}

say() { printf '%s\n' "$*" >&2; }
fail() { say "$(basename "$0"): $*"; exit 1; }

# Runs a command with its output kept in a log; shows the log only when the command fails.
quietly() {
  local log=$1 status=0
  shift
  mkdir -p "$(dirname "$log")"
  "$@" >"$log" 2>&1 || status=$?
  if [[ $status != 0 ]]; then
    cat "$log" >&2
    fail "$1 failed; its output is above and in $log"
  fi
}

# configure PRESET [-DNAME=VALUE...]: writes the build files of a preset.
configure() {
  local preset=$1
  shift
  configuredHere "$preset" || rm -rf "$root/build/$preset"/CMake{Cache.txt,Files}
  cmake -S "$root" --preset "$preset" "$@" &&
    namedLibrary >"$root/build/$preset/named-library"
}

# The CDF library that the environment names, or nothing.
namedLibrary() {
  printf '%s' "${CDF_ROOT:-${CDF_BASE:-${CDF_INC:+${CDF_LIB:+$CDF_INC $CDF_LIB}}}}"
}

# Whether the preset was configured with the library that the environment names, if it names one.
configuredWithLibrary() {
  local name
  name=$(namedLibrary)
  [[ -z $name || $name == "$(cat "$root/build/$1/named-library" 2>/dev/null)" ]]
}

# Whether the preset was configured for this folder, and not before the tree was moved here.
configuredHere() {
  grep -Fxqs "CMAKE_HOME_DIRECTORY:INTERNAL=$root" "$root/build/$1/CMakeCache.txt"
}

# configured PRESET [NAME=VALUE...]: whether the preset is configured, with these settings and the
# CDF library that the environment names.
configured() {
  local cache=$root/build/$1/CMakeCache.txt preset=$1 setting
  shift
  [[ -f $root/build/$preset/build.ninja ]] && configuredHere "$preset" || return 1
  configuredWithLibrary "$preset" || return 1
  for setting in "$@"; do
    grep -q "^${setting%%=*}:[A-Z]*=${setting#*=}\$" "$cache" || return 1
  done
}

# Waits until no other of these scripts builds; holds until the (sub)shell that calls it ends.
takeTurns() {
  mkdir -p "$root/build"
  exec 9>"$root/build/.lock"
  ! command -v flock >/dev/null || flock 9
}

# makeVenv FOLDER REQUIREMENTS: a Python environment with CDF readers of others, unless it is there.
makeVenv() {
  local venv=$root/$1 wanted=$root/$2
  cmp -s "$wanted" "$venv/requirements.txt" && return
  say "Installing other readers of CDF files into $1"
  rm -rf "$venv"
  quietly "$venv.log" python3 -m venv "$venv"
  quietly "$venv.log" "$venv/bin/python" -m pip install --quiet -r "$wanted"
  cp "$wanted" "$venv/requirements.txt"
}

jobs() { nproc 2>/dev/null || getconf _NPROCESSORS_ONLN; }
