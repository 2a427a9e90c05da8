#!/bin/sh
# Renews the golden traces from what the tool does now. Look at the difference before you keep it: the traces
# are also compared with an independent model (check_traces.py), which this script does not touch.
#
# usage: tests/examples/update_golden.sh [TOOL]     (default: build/release/bin/mayascene)
set -eu

cd "$(dirname "$0")/../.."
tool=${1:-build/release/bin/mayascene}
work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT

for scene in examples/*.ma; do
  name=$(basename "$scene" .ma)
  units=
  if grep -q '^//.*--linear-units 1' "$scene"; then units='--linear-units 1'; fi
  # shellcheck disable=SC2086
  "$tool" import --quiet --preferences "$work/preferences" --trace "$work/trace" $units "$scene" ||
    echo "$scene is not imported to its end"
  mv "$work/trace" "tests/examples/golden/$name.trace"
  echo "tests/examples/golden/$name.trace"
done
