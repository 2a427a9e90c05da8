#!/bin/bash
# Installs the build, moves what was installed, and uses it there: install_test.sh BUILD-FOLDER
#
# The tool imports an example that was installed with it, with the module that lies beside it. Manual pages and
# completions are the tool's. A host of somebody
# else's finds the package, builds against headers and library, and loads the module.
set -euo pipefail
here=$(cd -- "$(dirname -- "$0")" && pwd -P)
folder=$(mktemp -d)
trap 'rm -rf "$folder"' EXIT

fail() {
  printf '%s\n' "$*" >&2
  exit 1
}

cmake --install "$1" --prefix "$folder/first" >"$folder/log" 2>&1 || fail "$(tail -5 "$folder/log")"
mkdir "$folder/moved here"
mv "$folder/first" "$folder/moved here/mayascene"
moved="$folder/moved here/mayascene"

cd /
outline=$("$moved/bin/mayascene" import --quiet --json - "$moved/share/mayascene/examples/dolly_zoom.ma")
grep -q '"vertigo_camShape"' <<<"$outline" || fail "the moved tool imports nothing"
for file in share/mayascene/LICENSE share/mayascene/docs/host-interface.md include/mayascene/hostapi/CompSuite.h; do
  [ -s "$moved/$file" ] || fail "$file is missing"
done
share=$moved/share
for file in man/man1/mayascene.1 man/man1/mayascene-import.1 bash-completion/completions/mayascene \
  zsh/site-functions/_mayascene fish/vendor_completions.d/mayascene.fish; do
  [ -s "$share/$file" ] || fail "share/$file is missing"
done
"$here/../tools/pages_test.sh" "$moved/bin/mayascene" "$share" >"$folder/log" 2>&1 || fail "$(cat "$folder/log")"
if find "$moved/include" -name '*Internal.h' | grep .; then fail "internal headers are installed"; fi
# What a program looks for at run time lies beside it, wherever that is.
for binary in bin/mayascene lib/MayaImport.so lib/libhostutil.so; do
  if ldd "$moved/$binary" | grep -E "not found|$1"; then fail "$binary leads out of the folder"; fi
done

cmake -S "$here/host" -B "$folder/host" -DCMAKE_PREFIX_PATH="$moved" >"$folder/log" 2>&1 || fail "$(tail -20 "$folder/log")"
cmake --build "$folder/host" >"$folder/log" 2>&1 || fail "$(tail -20 "$folder/log")"
"$folder/host/other_host" || fail "the other host ended with $?"
