# What the scripts share: installing what is missing, and building a preset. Sourced, not run. All messages go to
# standard error, so that a script's standard output is its own.

# The status with which a script ends when the machine could not be set up. The tool itself never ends with it.
readonly SETUP_FAILED=10

say() { printf '%s: %s\n' "$(basename -- "$0")" "$*" >&2; }

give_up() {
  say "$*"
  exit "$SETUP_FAILED"
}

# Prints those of the packages that are not installed.
missing_packages() {
  local package
  for package in "$@"; do
    case $(dpkg-query -W -f='${db:Status-Status}' "$package" 2>/dev/null || true) in
      installed) ;;
      *) printf '%s\n' "$package" ;;
    esac
  done
}

# require_packages PACKAGE...: installs what is missing, and nothing where nothing is.
require_packages() {
  command -v dpkg-query >/dev/null || {
    say "this is not a Debian system; these packages are assumed to be installed: $*"
    return 0
  }
  local missing
  mapfile -t missing < <(missing_packages "$@")
  [ "${#missing[@]}" -gt 0 ] || return 0

  local as_root=()
  if [ "$(id -u)" -ne 0 ]; then
    command -v sudo >/dev/null ||
      give_up "missing: ${missing[*]} (run as root: apt-get install ${missing[*]})"
    as_root=(sudo)
    [ -t 0 ] || as_root=(sudo -n)
  fi
  local apt=("${as_root[@]}" env DEBIAN_FRONTEND=noninteractive apt-get -q -o DPkg::Lock::Timeout=300)
  say "installing ${missing[*]}"
  "${apt[@]}" update </dev/null >&2 || say "the package lists could not be updated; trying with those at hand"
  "${apt[@]}" install -y --no-install-recommends "${missing[@]}" </dev/null >&2 ||
    give_up "apt-get could not install ${missing[*]}"
}

# configured DIRECTORY: whether the folder is set up for this checkout, with the presets as they are now.
configured() {
  [ -f "$1/build.ninja" ] && [ "$1/build.ninja" -nt "$root/CMakePresets.json" ] &&
    grep -qxF "CMAKE_HOME_DIRECTORY:INTERNAL=$root" "$1/CMakeCache.txt"
}

# build_preset PRESET [TARGET...]: configures where that is needed and builds. Two at a time wait for each other.
build_preset() {
  local preset=$1 directory=$root/build/$1
  shift
  mkdir -p "$directory" || give_up "$directory cannot be made"
  exec 9>"$directory/.lock"
  flock 9
  if ! configured "$directory"; then
    say "setting up build/$preset"
    cmake --fresh -S "$root" --preset "$preset" >&2 9>&- || give_up "cmake could not set up build/$preset"
  fi
  # The first build shows its progress. Later ones mostly have nothing to do, and then print nothing.
  if [ ! -e "$directory/.built" ]; then
    say "building build/$preset; the first time takes some minutes"
    ninja -C "$directory" "$@" >&2 9>&- || give_up "build/$preset could not be built"
    : >"$directory/.built"
  else
    ninja -C "$directory" --quiet "$@" 2>&1 9>&- | sed -u '/^ninja: no work to do\.$/d' >&2 9>&- ||
      give_up "build/$preset could not be built"
  fi
  exec 9>&-
}
