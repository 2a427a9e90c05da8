#!/bin/bash
# What the scripts install, and what they say where they cannot: scripts/setup.sh with stand-ins for the system's
# commands, so that nothing is installed for real.
set -u
here=$(cd -- "$(dirname -- "$0")" && pwd -P)
folder=$(mktemp -d)
trap 'rm -rf "$folder"' EXIT
failures=0

stand_in() { printf '#!/bin/bash\n%s\n' "$2" >"$folder/$1" && chmod +x "$folder/$1"; }

# Packages named old-... are installed; apt-get writes down what it is asked for.
stand_in dpkg-query 'case "${!#}" in old-*) echo installed ;; *) exit 1 ;; esac'
stand_in apt-get "echo \"apt-get \$*\" >>$folder/log; case \"\$*\" in *impossible*) exit 100 ;; esac"
stand_in sudo "echo \"sudo \$1\" >>$folder/log; [ \"\$1\" = -n ] && shift; exec \"\$@\""

# expect NAME STATUS LOG USER PACKAGE...
expect() {
  local name=$1 status=$2 log=$3 user=$4 output actual
  shift 4
  stand_in id "echo $user"
  : >"$folder/log"
  output=$(PATH=$folder:/usr/bin:/bin root=/nowhere bash -c '. "$0/../../scripts/setup.sh"; require_packages "$@"' \
    "$here" "$@" </dev/null 2>"$folder/err")
  actual=$?
  if [ "$actual" -ne "$status" ] || [ "$(cat "$folder/log")" != "$log" ] || [ -n "$output" ]; then
    printf 'FAILED: %s: status %s, on standard output "%s", log:\n%s\n' "$name" "$actual" "$output" \
      "$(cat "$folder/log" "$folder/err")"
    failures=$((failures + 1))
  fi
}

options='-q -o DPkg::Lock::Timeout=300'
install="apt-get $options install -y --no-install-recommends"
update="apt-get $options update"

expect 'nothing is missing and nothing is done' 0 '' 0 old-compiler old-library
expect 'only what is missing is installed' 0 "$update
$install new-library new-tool" 0 old-compiler new-library new-tool
expect 'a user who is not root gets sudo without questions' 0 "sudo -n
$update
sudo -n
$install new-library" 1000 new-library
expect 'a failed installation is a status of its own' 10 "$update
$install impossible" 0 impossible

rm "$folder/sudo"
if ! PATH=/usr/bin:/bin command -v sudo >/dev/null; then
  expect 'without root and sudo it says what to install' 10 '' 1000 new-library
  grep -q 'apt-get install new-library' "$folder/err" || failures=$((failures + 1))
fi

echo "$failures failures"
exit $((failures > 0))
