#!/bin/sh
# Renews the golden traces from what the tool does now. Look at the difference before you keep it: golden_trace_test
# also holds the traces to what the second reader predicts, which this script does not touch.
#
# usage: tests/examples/update_golden.sh [TOOL]     (default: build/release/bin/mayascene)
set -eu

cd "$(dirname "$0")/../.."
tool=${1:-build/release/bin/mayascene}
preferences=$(mktemp -u)
trap 'rm -f "$preferences"' EXIT

for trace in tests/examples/golden/*.trace; do
  "$tool" import --quiet --preferences "$preferences" --trace "$trace" "examples/$(basename "$trace" .trace).ma"
  echo "$trace"
done
