#!/bin/sh
# command_page_test.sh TOOL PAGE: whether the page is what scripts/command-page makes of the tool's help.
set -eu
made=$(mktemp)
trap 'rm -f "$made"' EXIT
"$(dirname "$0")/../../scripts/command-page" "$1" >"$made"
diff -u "$2" "$made" || {
  echo "The page is out of date; write it anew: scripts/command-page build/release/bin/mayascene >docs/mayascene.md"
  exit 1
}
